// SPDX-License-Identifier: MIT
#pragma once

#include "image/ZtImage.h"

#include <QMetaType>
#include <QRect>
#include <QSharedPointer>

/**
 * One finished frame of the kernel image.
 *
 * A point p of the measurement scene (image pixels at scale 1) lies at p * scale - rect.topLeft() in the
 * frame's image.
 */
struct FrameData
{
    QSharedPointer<ZtImage> image; ///< the picture; null for a frame without one
    double scale = 1.0;            ///< frame pixels per scene unit
    QRect rect;                    ///< where the frame lies in the scaled scene
};

Q_DECLARE_METATYPE(FrameData)
