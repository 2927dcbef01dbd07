// SPDX-License-Identifier: MIT
#include "measuring/ZtLiveFrameSource.h"

#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFrameMailbox.h"

namespace {

constexpr int ticksPerInterval = 8;

} // namespace

ZtLiveFrameSource::ZtLiveFrameSource(int watchdogInterval)
    : m_watchdogInterval(watchdogInterval)
{
    connect(&m_watchdog, SIGNAL(timeout()), this, SLOT(slotWatch()));
}

ZtLiveFrameSource::~ZtLiveFrameSource()
{
    closeMailbox();
}

void ZtLiveFrameSource::start()
{
    if (m_state == Running)
        return;
    closeMailbox();
    endCapture();
    m_mailbox = std::make_shared<ZtFrameMailbox>(this);
    startWatchdog();
    setState(Running);
    // Whoever heard of the state may have stopped the source.
    if (m_state == Running)
        beginCapture(m_mailbox);
}

void ZtLiveFrameSource::stop()
{
    if (m_state == Stopped)
        return;
    closeMailbox();
    endCapture();
    setState(Stopped);
}

void ZtLiveFrameSource::lose(const QString &text)
{
    closeMailbox();
    endCapture();
    setState(Lost);
    emit signalFault(text);
}

void ZtLiveFrameSource::closeMailbox()
{
    m_watchdog.stop();
    if (!m_mailbox)
        return;
    m_mailbox->close();
    m_droppedBefore += m_mailbox->dropped();
    m_mailbox.reset();
}

void ZtLiveFrameSource::setState(State state)
{
    if (state == m_state)
        return;
    m_state = state;
    emit signalStateChanged();
}

quint64 ZtLiveFrameSource::droppedFrames() const
{
    return m_droppedBefore + (m_mailbox ? m_mailbox->dropped() : 0);
}

bool ZtLiveFrameSource::event(QEvent *event)
{
    if (event->type() != ZtFrameMailbox::eventType())
        return ZtFrameSource::event(event);
    takeDelivery();
    return true;
}

void ZtLiveFrameSource::takeDelivery()
{
    // Receivers of the signals may end the run.
    const std::shared_ptr<ZtFrameMailbox> mailbox = m_mailbox;
    if (!mailbox)
        return;
    const QImage frame = mailbox->takeFrame();
    const QStringList reports = mailbox->takeReports();
    const QString failure = mailbox->takeFailure();
    if (!frame.isNull()) {
        m_frame = frame;
        m_idleTicks = 0;
        setState(Running); // a camera that was lost only to the watchdog is back
        emit signalFrameReady();
    }
    for (const QString &report : reports)
        emit signalFault(report);
    if (!failure.isEmpty() && mailbox == m_mailbox)
        lose(failure);
}

void ZtLiveFrameSource::startWatchdog()
{
    m_idleTicks = 0;
    m_watched = 0;
    if (m_watchdogInterval > 0)
        m_watchdog.start(qMax(1, m_watchdogInterval / ticksPerInterval));
}

// Counts ticks, not time: while this thread is busy or the computer sleeps, no tick passes, and a camera is
// not blamed for it.
void ZtLiveFrameSource::slotWatch()
{
    const quint64 received = m_mailbox->received();
    m_idleTicks = received == m_watched ? m_idleTicks + 1 : 0;
    m_watched = received;
    const int patience = ticksPerInterval * (received == 0 ? firstFrameFactor : 1);
    if (m_state != Running || m_idleTicks < patience)
        return;
    setState(Lost);
    emit signalFault(tr("%1 has stopped delivering pictures; the last one stays")
                         .arg(ZtLeftToRight::isolated(displayName())));
}
