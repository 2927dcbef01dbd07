// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QtGlobal>

class QString;
class ZtProgress;
struct ZtFault;
struct ZtPicture;

/**
 * Reads picture files: TIFF by itself, as its deep pictures and its pixel sizes need more than a decoder of
 * screen pictures knows, all other formats through Qt. May be used from any thread.
 */
class ZT_MEASURING_EXPORT ZtPictureReader
{
public:
    /** Larger pictures are refused: their pixels would take more than 1.6 GB. */
    static constexpr qint64 maximumPixels = 400LL * 1000 * 1000;

    /** False with a fault when the file cannot be used, and after the progress was cancelled; nothing large
     * has been allocated for a file that cannot be used. */
    static bool read(const QString &path, qint64 pixelLimit, ZtPicture *picture, ZtFault *fault,
                     ZtProgress *progress = nullptr);

    /** Whether a picture of that size may be read; false with the message of the fault set. */
    static bool isUsableSize(qint64 width, qint64 height, qint64 pixelLimit, ZtFault *fault);
};
