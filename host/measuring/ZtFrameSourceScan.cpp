// SPDX-License-Identifier: MIT
#include "measuring/ZtFrameSourceScan.h"

#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtWorkerThread.h"

ZtFrameSourceScan::ZtFrameSourceScan(QObject *parent)
    : QObject(parent)
{}

ZtFrameSourceScan::~ZtFrameSourceScan()
{
    if (m_thread)
        m_thread->disconnect(this);
    ZtWorkerThread::retire(std::move(m_thread));
}

void ZtFrameSourceScan::start()
{
    if (m_thread)
        return;
    m_found = std::make_shared<QVector<ZtFrameSourceInfo>>();
    m_thread = ZtWorkerThread::create(
        [found = m_found]() { *found = ZtFrameSourceCatalogue::listNetworkCameras(); });
    connect(m_thread.get(), SIGNAL(finished()), this, SLOT(slotFinished()));
    m_thread->start();
}

void ZtFrameSourceScan::slotFinished()
{
    m_thread.reset();
    m_sources = ZtFrameSourceCatalogue::listSystemCameras() + *m_found;
    emit signalFinished();
}
