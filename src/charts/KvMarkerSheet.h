// SPDX-License-Identifier: MIT
#pragma once

#include <QImage>
#include <QPointF>
#include <QRect>
#include <QTransform>
#include <QVector>

class QPainter;

namespace kvCharts {

/**
 * Draws one marker thousands of times on pixels: as pictures of it, made once for each thirty-second of a
 * pixel to the right and downwards. An edge thus lies a sixty-fourth of a pixel off at most, which nobody
 * sees; an ellipse each would take ten times as long.
 */
class KvMarkerSheet
{
public:
    /**
     * Takes pen, brush, hints and scale of \a painter. The marker is an ellipse in \a marker, which is around
     * the point (0, 0).
     */
    KvMarkerSheet(const QPainter &painter, const QRectF &marker);

    /**
     * Whether \a painter draws \a count such markers faster and alike by a sheet: there are more of them than
     * pictures, small and neither turned nor blended in a special way, on a raster device.
     */
    static bool isWorthwhile(const QPainter &painter, const QRectF &marker, int count);

    /** With the painter as it was given to the constructor. */
    void draw(QPainter *painter, const QVector<QPointF> &points) const;

private:
    static QRect cellAround(const QPainter &painter, const QRectF &marker);
    void paintCells(QPainter *painter, const QRectF &marker);

    QTransform m_transform; ///< to device pixels
    QRect m_cell;           ///< what a marker covers around the pixel of its point
    QImage m_sheet;         ///< one cell for each place within a pixel
};

} // namespace kvCharts
