// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QtGlobal>

#include <atomic>

/**
 * How far a piece of long work is, and whether it is still wanted: shared between the thread that works and
 * the one whose user waits for it.
 *
 * Work that may be done without anybody waiting takes a pointer that may be null; the static functions take
 * that, too.
 */
class ZT_MEASURING_EXPORT ZtProgress
{
public:
    /** Items after which look() really looks. */
    static constexpr qint64 stride = 4096;

    /** What follows is the part of the whole between two shares of it, 0 to 1. For the thread that works. */
    void setPart(double from, double to);
    /** The share of the present part that is done, 0 to 1. For the thread that works. */
    void setDone(double share);
    /** The share of the whole that is done, 0 to 1. */
    double fraction() const { return m_fraction; }

    bool isCancelled() const { return m_state == Cancelled; }
    /** Asks the work to end without a result. False when it is past the point of no return. */
    bool cancel();
    /** The point of no return, such as before a file takes the place of another. False after cancel(). */
    bool commit();

    static bool isCancelled(const ZtProgress *progress) { return progress && progress->isCancelled(); }
    static void setPart(ZtProgress *progress, double from, double to);
    /** Tells that \a done of \a count items are done, every so many items. False after cancel(). */
    static bool look(ZtProgress *progress, qint64 done, qint64 count);

private:
    enum State { Running, Cancelled, Committed };

    bool change(State to);

    std::atomic<State> m_state{Running};
    std::atomic<double> m_fraction{0.0};
    double m_from = 0.0;
    double m_to = 1.0;
};
