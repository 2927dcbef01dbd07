// SPDX-License-Identifier: MIT
#include "charts/KvLineParts.h"

#include "charts/KvAxisGeometry.h"
#include "charts/KvChartPen.h"
#include "charts/KvLineSerie.h"
#include "charts/KvLineSeriesItem.h"
#include "data/KvStatisticsEngine.h"

#include <QGraphicsScene>

#include <algorithm>
#include <cmath>

namespace kvCharts {

namespace {

QPen dashedPen(const QVector<qreal> &dashes)
{
    QPen pen = KvChartPen::make(Qt::white);
    pen.setDashPattern(dashes);
    return pen;
}

bool isNotFinite(const QPointF &point)
{
    return !std::isfinite(point.x()) || !std::isfinite(point.y());
}

QVector<QPointF> finitePoints(const QVector<QPointF> &points)
{
    if (std::none_of(points.begin(), points.end(), isNotFinite))
        return points;
    QVector<QPointF> result;
    std::remove_copy_if(points.begin(), points.end(), std::back_inserter(result), isNotFinite);
    return result;
}

bool standAtOneX(const QVector<QPointF> &points)
{
    const double x = points.first().x();
    return std::all_of(points.begin(), points.end(), [x](const QPointF &point) { return point.x() == x; });
}

} // namespace

KvLineParts::KvLineParts(const KvLineSerie *serie, const KvCategoryList &categories,
                         const KvLineGeometry::Scale &scale)
    : m_serie(serie)
    , m_categories(categories)
    , m_scale(scale)
    , m_pointPen(KvChartPen::make(Qt::white))
    , m_pointBrush(Qt::SolidPattern)
    , m_limitPen(dashedPen({1.0, 6.0}))
    , m_trendPen(dashedPen({6.0, 8.0}))
{}

void KvLineParts::draw(QGraphicsScene *scene, const kvCharts::KvChartThemes * /*themes*/)
{
    takeColor();
    const QVector<QPointF> points = scenePoints();
    const QVector<QPointF> finite = finitePoints(points);
    if (!finite.isEmpty())
        scene->addItem(
            new KvLineSeriesItem(finite, KvLineGeometry::joinedRuns(points), m_pointPen, m_pointBrush));
    if (m_serie->showLimits())
        drawLimits(scene);
    if (m_serie->showTrend() && finite.size() >= 2)
        drawTrend(scene, finite);
}

void KvLineParts::takeColor()
{
    const QColor color = m_serie->color();
    m_pointPen.setColor(color);
    m_pointBrush.setColor(color);
    m_limitPen.setColor(color);
    m_trendPen.setColor(color);
}

QVector<QPointF> KvLineParts::scenePoints() const
{
    QVector<QPointF> points;
    points.reserve(m_serie->points().size());
    for (const KvLineSerie::Point &point : m_serie->points())
        points.append(m_scale.toScene(m_categories.indexOf(point.category), point.value));
    return points;
}

void KvLineParts::drawLimits(QGraphicsScene *scene) const
{
    for (const double limit : {m_serie->upperLimit(), m_serie->lowerLimit()}) {
        const double y = m_scale.yToScene(limit);
        if (std::isfinite(y))
            scene->addLine(0.0, y, KvAxisGeometry::PlotSize, y, m_limitPen);
    }
}

// Points that all stand at one x have no such line. The regression may find one all the same, of any slope:
// the mean of equal numbers need not be that number.
void KvLineParts::drawTrend(QGraphicsScene *scene, const QVector<QPointF> &points) const
{
    if (standAtOneX(points))
        return;
    const QPair<double, double> line = KvStatisticsEngine::regression(points);
    if (const std::optional<QLineF> trend = KvLineGeometry::trendLine(line.first, line.second))
        scene->addLine(*trend, m_trendPen);
}

} // namespace kvCharts
