// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QString>

class QPainter;
class QRectF;
class ZtCalibration;

/** A bar of a round length that shows the scale of an image, with its length above it. */
struct ZT_MEASURING_EXPORT ZtScaleBar
{
    double length = 0.0; ///< device pixels; 0 for no bar
    QString text;

    /** The largest of 1, 2 and 5 times a power of ten that is not above a number; 0 for numbers that are not
     * finite or not above 0. */
    static double roundLength(double atMost);

    /**
     * The bar that suits a page: about a fifth of its width, in micrometres or another unit of length, in
     * pixels when uncalibrated. No bar where the page has no room for it.
     * \param scale     device pixels per pixel of the image
     * \param pageWidth of what is seen of the image, in device pixels
     */
    static ZtScaleBar choose(const ZtCalibration &calibration, double scale, double pageWidth);

    /** Draws at the lower right of \a page, in device coordinates whatever the painter's transform. */
    void draw(QPainter *painter, const QRectF &page) const;
};
