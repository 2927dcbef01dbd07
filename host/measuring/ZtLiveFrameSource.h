// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameSource.h"

#include <QTimer>

#include <memory>

class ZtFrameMailbox;

/**
 * Base of the sources whose frames come from elsewhere, one after another: state, mailbox and watchdog.
 *
 * A derived class puts its frames into the mailbox of the current run. Every start begins a new run, so that
 * nothing of an earlier one can come late.
 */
class ZT_MEASURING_EXPORT ZtLiveFrameSource : public ZtFrameSource
{
    Q_OBJECT
public:
    /** A source of which no frame came for so many milliseconds counts as lost. */
    static constexpr int defaultWatchdogInterval = 2000;
    /** Devices take longer for their first frame: so many times the interval. */
    static constexpr int firstFrameFactor = 5;

    ~ZtLiveFrameSource() override;

    QImage frame() const override { return m_frame; }
    bool isLive() const override { return true; }
    State state() const override { return m_state; }
    void start() final;
    void stop() final;
    quint64 droppedFrames() const override;

    /** Milliseconds without a frame after which the source is lost; 0 waits for ever. Counts from the next
     *  start. */
    void setWatchdogInterval(int milliseconds) { m_watchdogInterval = milliseconds; }
    int watchdogInterval() const { return m_watchdogInterval; }

    bool event(QEvent *event) override;

protected:
    /** \param watchdogInterval see setWatchdogInterval() */
    explicit ZtLiveFrameSource(int watchdogInterval = defaultWatchdogInterval);

    /** Starts to fill \a mailbox. May call lose() when that is impossible. */
    virtual void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) = 0;
    /** Stops filling the mailbox of the run, which is closed already, without waiting for anything that may
     * take long. Called from the destructor of the derived class by itself. */
    virtual void endCapture() = 0;

    /** Ends the run because the source is gone; \a text says so to the user. */
    void lose(const QString &text);
    /** Closes the mailbox of the run; for destructors of derived classes. */
    void closeMailbox();

private slots:
    void slotWatch();

private:
    void setState(State state);
    void takeDelivery();
    void startWatchdog();

    std::shared_ptr<ZtFrameMailbox> m_mailbox; ///< of the current run; null before the first
    QImage m_frame;
    QTimer m_watchdog;
    quint64 m_droppedBefore = 0; ///< in earlier runs
    quint64 m_watched = 0;       ///< frames received when the watchdog looked last
    State m_state = Stopped;
    int m_watchdogInterval;
    int m_idleTicks = 0; ///< how often in a row the watchdog saw no new frame
};
