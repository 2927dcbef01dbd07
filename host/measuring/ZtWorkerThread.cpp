// SPDX-License-Identifier: MIT
#include "measuring/ZtWorkerThread.h"

#include <QCoreApplication>

ZtWorkerThread::ZtWorkerThread(std::function<void()> work)
    : m_work(std::move(work))
{}

ZtWorkerThread::~ZtWorkerThread()
{
    wait();
}

std::unique_ptr<ZtWorkerThread> ZtWorkerThread::create(std::function<void()> work)
{
    return std::unique_ptr<ZtWorkerThread>(new ZtWorkerThread(std::move(work)));
}

std::unique_ptr<ZtWorkerThread> ZtWorkerThread::begin(std::function<void()> work)
{
    std::unique_ptr<ZtWorkerThread> thread = create(std::move(work));
    thread->start();
    return thread;
}

void ZtWorkerThread::retire(std::unique_ptr<ZtWorkerThread> thread)
{
    // Without an application there is no event loop to delete it: then it is waited for here.
    if (!thread || thread->isFinished() || !QCoreApplication::instance())
        return;
    ZtWorkerThread *const retired = thread.release();
    retired->setParent(QCoreApplication::instance());
    connect(retired, SIGNAL(finished()), retired, SLOT(deleteLater()));
    // It may have ended before the connection was there.
    if (retired->isFinished())
        retired->deleteLater();
}
