// SPDX-License-Identifier: MIT
#include "KvDeskSnapping.h"

#include <QtMath>

#include <cmath>

namespace {

// Exact where the direction is level, upright or diagonal: sines of such angles are not quite.
QPointF unitVector(double degrees)
{
    const double radians = qDegreesToRadians(degrees);
    const auto cleaned = [](double number) { return std::abs(number) < 1e-12 ? 0.0 : number; };
    return QPointF(cleaned(std::cos(radians)), cleaned(std::sin(radians)));
}

double signOf(double number)
{
    return number < 0.0 ? -1.0 : 1.0;
}

} // namespace

QPointF KvDeskSnapping::alongDirection(const QPointF &origin, const QPointF &point, double stepDegrees)
{
    const QPointF way = point - origin;
    if (way.isNull())
        return point;
    const double degrees = qRadiansToDegrees(std::atan2(way.y(), way.x()));
    const QPointF direction = unitVector(std::round(degrees / stepDegrees) * stepDegrees);
    return origin + direction * QPointF::dotProduct(way, direction);
}

QPointF KvDeskSnapping::toSquare(const QPointF &origin, const QPointF &point)
{
    const QPointF way = point - origin;
    const double side = qMax(std::abs(way.x()), std::abs(way.y()));
    return origin + QPointF(signOf(way.x()) * side, signOf(way.y()) * side);
}

const QPointF *KvDeskSnapping::nearest(const QPointF &point, const QVector<QPointF> &candidates,
                                       double distance)
{
    const QPointF *found = nullptr;
    double best = distance;
    for (const QPointF &candidate : candidates) {
        const double away = std::hypot(candidate.x() - point.x(), candidate.y() - point.y());
        if (away <= best) {
            best = away;
            found = &candidate;
        }
    }
    return found;
}
