// SPDX-License-Identifier: MIT
#include "charts/KvHorizontalBox.h"

#include "charts/KvChartFont.h"
#include "charts/KvChartPen.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"

#include <QGraphicsScene>

#include <algorithm>

namespace kvCharts {

namespace {

KvBoxGeometry::Positions positions(const KvHorizontalBox::Points &points)
{
    KvBoxGeometry::Positions result{};
    std::transform(points.begin(), points.end(), result.begin(),
                   [](const KvHorizontalBox::Point &point) { return point.x; });
    return result;
}

} // namespace

KvHorizontalBox::KvHorizontalBox()
    : m_pen(KvChartPen::make(Qt::white))
    , m_brush(Qt::gray, Qt::SolidPattern)
    , m_labelFont(KvChartFont::make(11.0))
{}

void KvHorizontalBox::draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes)
{
    m_pen.setColor(themes->color(KvChartThemes::AxisLine));
    const KvBoxGeometry::Positions x = positions(m_points);
    scene->addRect(KvBoxGeometry::boxRect(x, m_extent), m_pen, m_brush);
    scene->addItem(new KvLineRunItem(KvBoxGeometry::lines(x, m_extent), m_pen));
    drawLabels(scene, themes->color(KvChartThemes::PartLabelText));
}

void KvHorizontalBox::setPoints(const Points &points)
{
    m_points = points;
    emit changed();
}

void KvHorizontalBox::setExtent(const KvBoxGeometry::Extent &extent)
{
    m_extent = extent;
    emit changed();
}

void KvHorizontalBox::setPenColor(const QColor &color)
{
    m_pen.setColor(color);
    emit changed();
}

void KvHorizontalBox::setBrushColor(const QColor &color)
{
    m_brush.setColor(color);
    emit changed();
}

void KvHorizontalBox::drawLabels(QGraphicsScene *scene, const QColor &color) const
{
    QVector<KvPlacedText> labels;
    QVector<QRectF> rects;
    QVector<QPointF> anchors;
    KvTextMeasure measure(m_labelFont);
    for (const Point &point : m_points) {
        if (point.label.isEmpty())
            continue;
        const KvTextExtent extent = measure.measure(point.label);
        labels.append({point.label, QPointF(), extent});
        rects.append(
            QRectF(KvBoxGeometry::labelPosition(point.x, m_extent, extent.size.width()), extent.size));
        anchors.append(KvBoxGeometry::labelAnchor(point.x, m_extent));
    }
    const bool moved = KvBoxGeometry::spreadLabels(rects);
    QVector<QLineF> leaders;
    for (int i = 0; i < labels.size(); ++i) {
        labels[i].topLeft = rects.at(i).topLeft();
        leaders.append(KvBoxGeometry::leaderLine(rects.at(i), anchors.at(i)));
    }
    KvTextRunItem::addTo(scene, labels, m_labelFont, color);
    if (moved)
        scene->addItem(new KvLineRunItem(leaders, m_pen));
}

} // namespace kvCharts
