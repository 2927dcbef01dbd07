// SPDX-License-Identifier: MIT
#pragma once

#include <QPolygonF>

#include <initializer_list>

/** A polygon of points as they are written down in a test. */
inline QPolygonF polygon(std::initializer_list<QPointF> points)
{
    return QPolygonF(QVector<QPointF>(points));
}
