// SPDX-License-Identifier: MIT
#include "charts/KvLineSeriesItem.h"

#include "charts/KvMarkerSheet.h"

#include <QPaintEngine>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace kvCharts {

namespace {

constexpr double kMarkerSize = 5.0;
constexpr double kMarkerReach = 2.0; // to the left of a point and above it

QVector<QLineF> segments(const QVector<QPointF> &run)
{
    QVector<QLineF> lines;
    lines.reserve(run.size() - 1);
    for (int i = 1; i < run.size(); ++i)
        lines.append(QLineF(run.at(i - 1), run.at(i)));
    return lines;
}

// What an ellipse item covers around a point, pen included.
QRectF markerBounds(const QPen &pen)
{
    QGraphicsEllipseItem marker(KvLineSeriesItem::markerRect(QPointF()));
    marker.setPen(pen);
    return marker.boundingRect();
}

// Of all markers; the lines between them reach less far.
QRectF seriesBounds(const QVector<QPointF> &points, const QPen &pen)
{
    if (points.isEmpty())
        return QRectF();
    const auto x = std::minmax_element(points.begin(), points.end(),
                                       [](const QPointF &a, const QPointF &b) { return a.x() < b.x(); });
    const auto y = std::minmax_element(points.begin(), points.end(),
                                       [](const QPointF &a, const QPointF &b) { return a.y() < b.y(); });
    const QRectF marker = markerBounds(pen);
    return QRectF(QPointF(x.first->x(), y.first->y()) + marker.topLeft(),
                  QPointF(x.second->x(), y.second->y()) + marker.bottomRight());
}

} // namespace

KvLineSeriesItem::KvLineSeriesItem(const QVector<QPointF> &points, const QVector<QVector<QPointF>> &runs,
                                   const QPen &pen, const QBrush &brush)
    : m_points(points)
    , m_runs(runs)
    , m_pen(pen)
    , m_brush(brush)
    , m_boundingRect(seriesBounds(points, pen))
{}

QRectF KvLineSeriesItem::markerRect(const QPointF &point)
{
    return QRectF(point.x() - kMarkerReach, point.y() - kMarkerReach, kMarkerSize, kMarkerSize);
}

void KvLineSeriesItem::paint(QPainter *painter, const QStyleOptionGraphicsItem * /*option*/,
                             QWidget * /*widget*/)
{
    painter->setPen(m_pen);
    painter->setBrush(m_brush);
    if (painter->paintEngine()->type() == QPaintEngine::Raster)
        paintPixels(painter);
    else
        paintVectors(painter);
}

// Single lines, as a polyline would smooth its corners.
void KvLineSeriesItem::paintPixels(QPainter *painter) const
{
    for (const QVector<QPointF> &run : m_runs)
        painter->drawLines(segments(run));
    if (KvMarkerSheet::isWorthwhile(*painter, markerRect(QPointF()), m_points.size())) {
        KvMarkerSheet(*painter, markerRect(QPointF())).draw(painter, m_points);
        return;
    }
    for (const QPointF &point : m_points)
        painter->drawEllipse(markerRect(point));
}

// A polyline and round dots take a fifth of the space of lines and ellipses in a PDF. A dot is as large as
// the ellipse with its outline, which is as wide as the pen in device pixels.
void KvLineSeriesItem::paintVectors(QPainter *painter) const
{
    for (const QVector<QPointF> &run : m_runs)
        painter->drawPolyline(run.constData(), run.size());
    const double scale = std::sqrt(std::abs(painter->deviceTransform().determinant()));
    if (m_points.isEmpty() || scale <= 0.0)
        return;
    const double center = kMarkerSize / 2 - kMarkerReach;
    painter->setPen(QPen(m_brush, kMarkerSize + m_pen.widthF() / scale, Qt::SolidLine, Qt::RoundCap));
    painter->translate(center, center);
    painter->drawPoints(m_points.constData(), m_points.size());
}

} // namespace kvCharts
