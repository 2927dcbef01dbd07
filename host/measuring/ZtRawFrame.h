// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtRawFormat.h"

#include <QImage>

class ZtFramePool;

/**
 * A frame as it lies in the buffer of a camera.
 *
 * It becomes a picture in what screens draw without converting it, so that this is the only time its pixels
 * are copied. Values of more than eight bits are shown by their upper eight; measuring lengths needs no more.
 */
struct ZT_MEASURING_EXPORT ZtRawFrame
{
    const uchar *data = nullptr; ///< not owned
    qint64 size = 0;             ///< bytes of the buffer
    int width = 0;
    int height = 0;
    qint64 bytesPerLine = 0;
    ZtRawFormat format;

    /** Whether the buffer holds as much as the other values say. */
    bool isComplete() const;

    /** The frame in Format_RGB32; null when it is not complete. Bayer patterns are interpolated linearly. The
     *  memory comes from \a pool where there is one. */
    QImage toImage(ZtFramePool *pool = nullptr) const;

private:
    void show(QImage *image) const;
};
