// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QPointF>
#include <QPolygonF>

/** A circular arc. Angles in degrees, counted clockwise as seen on the image (y grows downwards). */
struct ZtArc
{
    QPointF centre;
    double radius = 0.0;     ///< 0 for points on one straight line
    double startAngle = 0.0; ///< direction from the centre to the arc's first point
    double sweep = 0.0;      ///< signed, -360 to 360; 0 for points on one straight line
};

/** Measures of shapes, in the unit of their coordinates. */
class ZT_MEASURING_EXPORT ZtGeometry
{
public:
    static double distance(const QPointF &a, const QPointF &b);

    /** Sum of the distances between neighbouring points. */
    static double pathLength(const QPolygonF &points);

    /** As pathLength(), and back from the last point to the first. */
    static double perimeter(const QPolygonF &points);

    /**
     * Area by the shoelace formula, 1/2 |sum of (x_i * y_(i+1) - x_(i+1) * y_i)|: the same for both
     * directions of travel. Where the outline crosses itself, parts that turn opposite ways cancel out.
     */
    static double area(const QPolygonF &points);

    /** Distance of \a point from the infinite line through \a a and \a b; from \a a when the two are the
     * same. */
    static double distanceToLine(const QPointF &point, const QPointF &a, const QPointF &b);

    /**
     * The arc that starts at \a start, runs through \a middle and ends at \a end. Points that only rounding
     * keeps off one straight line count as on it.
     */
    static ZtArc arcThrough(const QPointF &start, const QPointF &middle, const QPointF &end);

    /** Radius * |sweep|; for points on one straight line the length of the way through them. */
    static double arcLength(const QPointF &start, const QPointF &middle, const QPointF &end);
};
