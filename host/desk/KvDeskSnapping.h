// SPDX-License-Identifier: MIT
#pragma once

#include <QPointF>
#include <QVector>

/** Points that a user means who points nearly at them. */
class KvDeskSnapping
{
public:
    /** The point nearest to \a point on a straight line from \a origin whose direction is a multiple of
     * \a stepDegrees. */
    static QPointF alongDirection(const QPointF &origin, const QPointF &point, double stepDegrees);
    /** The corner of the square at \a origin that reaches as far as \a point in the longer direction. */
    static QPointF toSquare(const QPointF &origin, const QPointF &point);
    /** The nearest of \a candidates that is at most \a distance away, or null. */
    static const QPointF *nearest(const QPointF &point, const QVector<QPointF> &candidates, double distance);
};
