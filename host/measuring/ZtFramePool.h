// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QImage>
#include <QVector>

/**
 * Memory for the frames of one worker. A picture that nobody looks at any more is filled again, as asking the
 * system for the memory of a frame, and giving it back, takes longer than filling it.
 *
 * Pictures that somebody still holds are left alone, so what was handed on never changes. Used by one thread;
 * the pictures may be in any.
 */
class ZT_MEASURING_EXPORT ZtFramePool
{
public:
    /** Frames on their way, on the screen, and frozen or in a report; more than these are not kept. */
    static constexpr int capacity = 4;

    /** A picture whose pixels may be anything; null without memory. Held by nobody else but the pool. */
    QImage take(const QSize &size, QImage::Format format);
    /** The picture that take() gave is filled: from now on it may be handed on, and comes back by itself. */
    void keep(const QImage &filled);

private:
    QVector<QImage> m_images;
};
