// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <cmath>

/** How large a pixel of the image is. Uncalibrated, lengths stay in pixels. */
class ZT_MEASURING_EXPORT ZtCalibration
{
public:
    ZtCalibration() = default;

    /** Calibrated with a pixel size in micrometres; uncalibrated when isValidPixelSize() says no. */
    explicit ZtCalibration(double micrometresPerPixel)
        : m_pixelSize(isValidPixelSize(micrometresPerPixel) ? micrometresPerPixel : 0.0)
    {}

    /** A pixel size is finite and greater than 0. */
    static bool isValidPixelSize(double micrometres)
    {
        return std::isfinite(micrometres) && micrometres > 0.0;
    }

    bool isCalibrated() const { return m_pixelSize > 0.0; }

    /** Micrometres per pixel; 0 when uncalibrated. */
    double micrometresPerPixel() const { return m_pixelSize; }

    /** Micrometres per pixel; 1 (a length in pixels stays itself) when uncalibrated. */
    double factor() const { return isCalibrated() ? m_pixelSize : 1.0; }

    bool operator==(const ZtCalibration &other) const { return m_pixelSize == other.m_pixelSize; }
    bool operator!=(const ZtCalibration &other) const { return !(*this == other); }

private:
    double m_pixelSize = 0.0;
};
