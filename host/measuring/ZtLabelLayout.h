// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QPolygonF>
#include <QRectF>
#include <QSizeF>
#include <QVector>

/** What is known about an object whose label seeks a place; everything in the device's coordinates. */
struct ZtLabelRequest
{
    QSizeF size;       ///< of the label's box; empty for none
    QRectF object;     ///< bounds of the object
    QPolygonF handles; ///< points of the object that a label must not cover; the first is where it belongs
    QPolygonF outline; ///< a line that is covered only where there is no better place
    bool isAround = false; ///< the label belongs around the object as a whole, not to its first point
};

/**
 * Finds places for the labels of objects: beside the object, on the page, clear of the object's own handles
 * and of all labels before it. Where there is no such place, a label is left out rather than drawn across
 * another. Among such places the one is taken that covers least of what else is there.
 */
class ZT_MEASURING_EXPORT ZtLabelLayout
{
public:
    /** Half the side of the square around each handle that stays free. */
    static constexpr double handleRoom = 5.0;

    /** The boxes of the labels, a null one for a label that is left out. Requests come the most important
     * first. */
    static QVector<QRectF> place(const QVector<ZtLabelRequest> &requests, const QRectF &page);

    /** The nearest place where a box can be seen; its upper left corner where it does not fit. */
    static QRectF movedInto(QRectF box, const QRectF &page);
};
