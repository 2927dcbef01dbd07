// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QPainterPath>
#include <QPolygonF>
#include <QRectF>

class QPainter;
class ZtKernelObjectData;

/** Where an object lies on the image, in scene coordinates: found by the pointer, drawn when it is selected.
 */
class KvDeskObjectShape
{
public:
    /** Of an object without a place on the image, such as one of a table, the shape is empty. */
    KvDeskObjectShape(int type, const ZtKernelObjectData *data);

    bool isEmpty() const { return m_outline.isEmpty() && m_markers.isEmpty(); }
    QRectF boundingRect() const;
    /** Whether \a point lies on the outline or a marker, or nearer than \a tolerance. */
    bool isAt(const QPointF &point, double tolerance) const;

    /** Draws a wide accent line below where the object itself is drawn. */
    void drawHighlight(QPainter *painter) const;

private:
    bool isMarkerAt(const QPointF &point, double tolerance) const;

    QPainterPath m_outline;
    QPolygonF m_markers; ///< points of objects that have no outline
};
