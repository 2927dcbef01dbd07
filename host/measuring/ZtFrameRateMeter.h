// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QVector>

/** Counts frames over the last second. Times are milliseconds of any clock that never goes back. */
class ZT_MEASURING_EXPORT ZtFrameRateMeter
{
public:
    /** A frame came at \a time. */
    void addFrame(qint64 time);

    /** Frames per second at \a time, by the distances between the frames of the last second; 0 for fewer than
     *  two of them. */
    double rate(qint64 time) const;

private:
    QVector<qint64> m_times; ///< of the last second before the newest, ascending
};
