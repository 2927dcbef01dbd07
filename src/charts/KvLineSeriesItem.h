// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsItem>
#include <QPen>
#include <QVector>

namespace kvCharts {

/**
 * All points of a series and the lines between them as one item: looks like an ellipse item per point and a
 * line item per line, and covers the same rectangle.
 */
class KvLineSeriesItem : public QGraphicsItem
{
public:
    /** The points are finite; \a runs are those of them that are joined. */
    KvLineSeriesItem(const QVector<QPointF> &points, const QVector<QVector<QPointF>> &runs, const QPen &pen,
                     const QBrush &brush);

    /** Rectangle of a point's marker. */
    static QRectF markerRect(const QPointF &point);

    const QVector<QPointF> &points() const { return m_points; }
    const QVector<QVector<QPointF>> &runs() const { return m_runs; }
    const QPen &pen() const { return m_pen; }

    QRectF boundingRect() const override { return m_boundingRect; }
    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;

private:
    void paintPixels(QPainter *painter) const;
    void paintVectors(QPainter *painter) const;

    QVector<QPointF> m_points;
    QVector<QVector<QPointF>> m_runs;
    QPen m_pen;
    QBrush m_brush;
    QRectF m_boundingRect;
};

} // namespace kvCharts
