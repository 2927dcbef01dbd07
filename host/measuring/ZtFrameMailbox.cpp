// SPDX-License-Identifier: MIT
#include "measuring/ZtFrameMailbox.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QMutexLocker>

QEvent::Type ZtFrameMailbox::eventType()
{
    static const int type = QEvent::registerEventType();
    return static_cast<QEvent::Type>(type);
}

QEvent::Type ZtFrameMailbox::noticeType()
{
    static const int type = QEvent::registerEventType();
    return static_cast<QEvent::Type>(type);
}

ZtFrameMailbox::ZtFrameMailbox(QObject *receiver)
    : m_receiver(receiver)
{}

ZtFrameMailbox::~ZtFrameMailbox() = default;

void ZtFrameMailbox::put(const QImage &frame)
{
    // A replaced picture gives its memory back outside of the lock.
    QImage replaced = frame;
    const QMutexLocker lock(&m_mutex);
    if (!m_receiver)
        return;
    ++m_received;
    m_frame.swap(replaced);
    if (!replaced.isNull())
        ++m_dropped;
    announce();
}

void ZtFrameMailbox::report(const QString &text)
{
    const QMutexLocker lock(&m_mutex);
    m_reports.append(text);
    announce();
}

void ZtFrameMailbox::notify()
{
    const QMutexLocker lock(&m_mutex);
    if (m_receiver)
        QCoreApplication::postEvent(m_receiver, new QEvent(noticeType()));
}

void ZtFrameMailbox::fail(const QString &text)
{
    const QMutexLocker lock(&m_mutex);
    m_failure = text;
    announce();
}

void ZtFrameMailbox::announce()
{
    if (!m_receiver || m_isAnnounced)
        return;
    m_isAnnounced = true;
    QCoreApplication::postEvent(m_receiver, new QEvent(eventType()), Qt::LowEventPriority);
}

void ZtFrameMailbox::close()
{
    QImage dropped;
    const QMutexLocker lock(&m_mutex);
    m_receiver = nullptr;
    m_frame.swap(dropped);
    m_closed.wakeAll();
}

bool ZtFrameMailbox::isClosed() const
{
    const QMutexLocker lock(&m_mutex);
    return !m_receiver;
}

bool ZtFrameMailbox::waitForClose(int milliseconds) const
{
    const QDeadlineTimer deadline(milliseconds);
    const QMutexLocker lock(&m_mutex);
    while (m_receiver && m_closed.wait(&m_mutex, deadline)) {
    }
    return !m_receiver;
}

QImage ZtFrameMailbox::takeFrame()
{
    QImage frame;
    const QMutexLocker lock(&m_mutex);
    m_isAnnounced = false;
    m_frame.swap(frame);
    return frame;
}

QStringList ZtFrameMailbox::takeReports()
{
    QStringList reports;
    const QMutexLocker lock(&m_mutex);
    m_isAnnounced = false;
    m_reports.swap(reports);
    return reports;
}

QString ZtFrameMailbox::takeFailure()
{
    QString failure;
    const QMutexLocker lock(&m_mutex);
    m_isAnnounced = false;
    m_failure.swap(failure);
    return failure;
}

quint64 ZtFrameMailbox::received() const
{
    const QMutexLocker lock(&m_mutex);
    return m_received;
}

quint64 ZtFrameMailbox::dropped() const
{
    const QMutexLocker lock(&m_mutex);
    return m_dropped;
}
