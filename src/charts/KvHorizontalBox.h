// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseChartPart.h"
#include "charts/KvBoxGeometry.h"

#include <QBrush>
#include <QFont>
#include <QPen>

namespace kvCharts {

/** A box with whiskers to both sides, its median and the labels of its five values below it. */
class KvHorizontalBox : public KvBaseChartPart
{
    Q_OBJECT
public:
    struct Point
    {
        double x = 0.0; ///< scene x
        QString label;  ///< an empty one is not drawn
    };
    /** Minimum, lower box value, median, upper box value, maximum. */
    using Points = std::array<Point, 5>;

    KvHorizontalBox();

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override;

    void setPoints(const Points &points);
    const Points &points() const { return m_points; }
    void setExtent(const KvBoxGeometry::Extent &extent);
    const KvBoxGeometry::Extent &extent() const { return m_extent; }
    /** Drawing replaces it by the theme's colour. */
    void setPenColor(const QColor &color);
    const QPen &pen() const { return m_pen; }
    void setBrushColor(const QColor &color);
    const QBrush &brush() const { return m_brush; }

private:
    void drawLabels(QGraphicsScene *scene, const QColor &color) const;

    Points m_points;
    KvBoxGeometry::Extent m_extent{0.0, 0.0};
    QPen m_pen;
    QBrush m_brush;
    QFont m_labelFont;
};

} // namespace kvCharts
