// SPDX-License-Identifier: MIT
#include "measuring/ZtGeometry.h"

#include <QtMath>

#include <cmath>

namespace {

double cross(const QPointF &a, const QPointF &b)
{
    return a.x() * b.y() - a.y() * b.x();
}

double directionInDegrees(const QPointF &vector)
{
    return qRadiansToDegrees(std::atan2(vector.y(), vector.x()));
}

// Below this sine of the angle between the chords, rounding decides on which side the middle point lies.
constexpr double smallestSine = 1e-9;

// Twice the angle between the way to the middle point and the way on from it.
double sweepInDegrees(const QPointF &toMiddle, const QPointF &onwards)
{
    const double turn = std::atan2(cross(toMiddle, onwards), QPointF::dotProduct(toMiddle, onwards));
    return qRadiansToDegrees(2.0 * turn);
}

} // namespace

double ZtGeometry::distance(const QPointF &a, const QPointF &b)
{
    return std::hypot(b.x() - a.x(), b.y() - a.y());
}

double ZtGeometry::pathLength(const QPolygonF &points)
{
    double length = 0.0;
    for (int i = 1; i < points.size(); ++i)
        length += distance(points.at(i - 1), points.at(i));
    return length;
}

double ZtGeometry::perimeter(const QPolygonF &points)
{
    return points.isEmpty() ? 0.0 : pathLength(points) + distance(points.last(), points.first());
}

double ZtGeometry::area(const QPolygonF &points)
{
    // Relative to the first point: far from the origin the products would lose the digits that differ.
    double twice = 0.0;
    for (int i = 1; i + 1 < points.size(); ++i)
        twice += cross(points.at(i) - points.first(), points.at(i + 1) - points.first());
    return std::abs(twice) / 2.0;
}

double ZtGeometry::distanceToLine(const QPointF &point, const QPointF &a, const QPointF &b)
{
    const double base = distance(a, b);
    return base > 0.0 ? std::abs(cross(b - a, point - a)) / base : distance(a, point);
}

ZtArc ZtGeometry::arcThrough(const QPointF &start, const QPointF &middle, const QPointF &end)
{
    const QPointF b = middle - start;
    const QPointF c = end - start;
    const double twiceCross = 2.0 * cross(b, c);
    const double sides = distance(start, middle) * distance(start, end);
    ZtArc arc;
    if (std::abs(twiceCross) <= 2.0 * smallestSine * sides)
        return arc;
    const double bb = QPointF::dotProduct(b, b);
    const double cc = QPointF::dotProduct(c, c);
    const QPointF toCentre((c.y() * bb - b.y() * cc) / twiceCross, (b.x() * cc - c.x() * bb) / twiceCross);
    arc.centre = start + toCentre;
    arc.radius = std::hypot(toCentre.x(), toCentre.y());
    arc.startAngle = directionInDegrees(-toCentre);
    arc.sweep = sweepInDegrees(b, end - middle);
    return arc;
}

double ZtGeometry::arcLength(const QPointF &start, const QPointF &middle, const QPointF &end)
{
    const ZtArc arc = arcThrough(start, middle, end);
    if (arc.radius == 0.0)
        return distance(start, middle) + distance(middle, end);
    return arc.radius * qDegreesToRadians(std::abs(arc.sweep));
}
