// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QEvent>
#include <QImage>
#include <QMutex>
#include <QStringList>
#include <QWaitCondition>

class QObject;

/**
 * Hands frames from a worker to an object of another thread: it holds one frame, the newest.
 *
 * However many frames come, at most one event is on its way to the receiver, behind all others that wait
 * there. So a receiver that is busy misses frames instead of falling behind, and its user's input comes
 * first. Worker and receiver share the mailbox; closing it makes the worker's deliveries go nowhere and tells
 * it to end. All methods may be called from any thread.
 */
class ZT_MEASURING_EXPORT ZtFrameMailbox
{
    Q_DISABLE_COPY(ZtFrameMailbox)
public:
    /** Type of the event that the receiver gets when there is something to take. */
    static QEvent::Type eventType();
    /** Type of the event that the receiver gets for each notify(). */
    static QEvent::Type noticeType();

    explicit ZtFrameMailbox(QObject *receiver);
    ~ZtFrameMailbox();

    /** For the worker: the newest frame. Takes the place of one that was not taken. */
    void put(const QImage &frame);
    /** For the worker: something to tell the user. Nothing of it gets lost. */
    void report(const QString &text);
    /** For the worker: something beside the frames has changed, which worker and receiver know of. */
    void notify();
    /** For the worker: there will be no more frames, and why. */
    void fail(const QString &text);

    /** For the receiver: nothing more comes. Has to be called before the receiver dies. */
    void close();
    bool isClosed() const;
    /** Waits until the mailbox is closed, but not longer than this; returns whether it is. */
    bool waitForClose(int milliseconds) const;

    QImage takeFrame();        ///< null when there is none
    QStringList takeReports(); ///< oldest first
    QString takeFailure();     ///< empty when the worker goes on

    quint64 received() const; ///< frames that were put in
    quint64 dropped() const;  ///< frames that were replaced before they were taken

private:
    void announce();

    mutable QMutex m_mutex;
    mutable QWaitCondition m_closed;
    QObject *m_receiver; ///< null when closed
    QImage m_frame;
    QStringList m_reports;
    QString m_failure;
    quint64 m_received = 0;
    quint64 m_dropped = 0;
    bool m_isAnnounced = false; ///< an event is on its way
};
