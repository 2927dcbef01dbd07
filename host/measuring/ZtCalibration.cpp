// SPDX-License-Identifier: MIT
#include "measuring/ZtCalibration.h"

#include <QTransform>

#include <cmath>

namespace {

constexpr double roundingOfFiles = 0.001;

bool isNear(double a, double b)
{
    return std::abs(a - b) <= roundingOfFiles * std::abs(a);
}

} // namespace

ZtCalibration::ZtCalibration(double micrometresPerPixel)
    : ZtCalibration(micrometresPerPixel, micrometresPerPixel)
{}

ZtCalibration::ZtCalibration(double micrometresPerPixelX, double micrometresPerPixelY)
{
    if (!isValidPixelSize(micrometresPerPixelX) || !isValidPixelSize(micrometresPerPixelY))
        return;
    m_pixelSizeX = micrometresPerPixelX;
    m_pixelSizeY = micrometresPerPixelY;
}

bool ZtCalibration::isValidPixelSize(double micrometres)
{
    return std::isfinite(micrometres) && micrometres > 0.0;
}

QPolygonF ZtCalibration::toPlane(const QPolygonF &points) const
{
    return isSquare() ? points : QTransform::fromScale(1.0, aspect()).map(points);
}

bool ZtCalibration::hasSamePixelSize(const ZtCalibration &other) const
{
    return m_pixelSizeX == other.m_pixelSizeX && m_pixelSizeY == other.m_pixelSizeY;
}

bool ZtCalibration::hasNearlySamePixelSize(const ZtCalibration &other) const
{
    return isNear(m_pixelSizeX, other.m_pixelSizeX) && isNear(m_pixelSizeY, other.m_pixelSizeY);
}

bool ZtCalibration::operator==(const ZtCalibration &other) const
{
    return hasSamePixelSize(other) && m_name == other.m_name && m_objective == other.m_objective &&
           m_date == other.m_date && m_author == other.m_author && m_note == other.m_note &&
           m_origin == other.m_origin;
}
