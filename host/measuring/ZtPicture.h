// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtOfferedPixelSize.h"

#include <QImage>

/** What a picture file holds. */
struct ZtPicture
{
    QImage image; ///< upright, at most 8 bits per channel
    ZtOfferedPixelSize pixelSize;
    /** Bits that the file's grey values take, of which the picture shows the upper eight; 8 for all others.
     */
    int greyBits = 8;
};
