// SPDX-License-Identifier: MIT
#include "charts/KvBaseAxis.h"

#include "charts/KvAxisGeometry.h"
#include "charts/KvAxisRange.h"
#include "charts/KvChartFont.h"
#include "charts/KvChartNumber.h"
#include "charts/KvChartPen.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"

#include <QGraphicsScene>

namespace kvCharts {

namespace {

void addLines(QGraphicsScene *scene, const QVector<QLineF> &lines, const QPen &pen)
{
    if (!lines.isEmpty())
        scene->addItem(new KvLineRunItem(lines, pen));
}

} // namespace

KvBaseAxis::KvBaseAxis()
    : m_labelFont(KvChartFont::make(11.0))
    , m_measure(m_labelFont)
{}

void KvBaseAxis::setGridVisible(bool /*visible*/) {}

void KvBaseAxis::setRange(double /*minimum*/, double /*maximum*/) {}

void KvBaseAxis::setTickCount(int /*count*/) {}

double KvBaseAxis::minimum() const
{
    return 0.0;
}

double KvBaseAxis::maximum() const
{
    return 0.0;
}

void KvBaseAxis::autoRange(double least, double greatest)
{
    const KvAxisRange range = KvAxisRange::around(least, greatest);
    setRange(range.minimum, range.maximum);
    setTickCount(range.tickCount);
}

void KvBaseAxis::drawAxisLine(QGraphicsScene *scene, const KvChartThemes *themes, Qt::Orientation orientation)
{
    m_axisPen = KvChartPen::make(themes->color(KvChartThemes::AxisLine));
    m_gridPen = KvChartPen::make(themes->color(KvChartThemes::GridLine));
    scene->addLine(KvAxisGeometry::axisLine(orientation), m_axisPen);
}

void KvBaseAxis::drawValues(QGraphicsScene *scene, const KvChartThemes *themes, Qt::Orientation orientation,
                            const KvAxisRange &range, bool gridVisible)
{
    QVector<QLineF> ticks;
    QVector<QLineF> grid;
    QVector<KvPlacedText> labels;
    const auto values = KvAxisGeometry::valueTicks(range.minimum, range.maximum, range.tickCount);
    for (const KvAxisGeometry::Tick &tick : values) {
        ticks.append(KvAxisGeometry::tickMark(orientation, tick.offset));
        const bool isFirst = ticks.size() == 1;
        if (gridVisible && (!isFirst || KvAxisGeometry::hasGridAtOrigin(orientation)))
            grid.append(KvAxisGeometry::gridLine(orientation, tick.offset));
        const QString text = KvChartNumber::text(tick.value);
        const KvTextExtent extent = m_measure.measure(text);
        labels.append({text, KvAxisGeometry::valueLabel(orientation, tick.offset, extent.size), extent});
    }
    drawMarks(scene, ticks, grid);
    KvTextRunItem::addTo(scene, labels, m_labelFont, themes->color(KvChartThemes::TickLabelText));
}

void KvBaseAxis::drawCategories(QGraphicsScene *scene, const KvChartThemes *themes,
                                Qt::Orientation orientation, const QStringList &categories,
                                const QVector<KvTextExtent> &extents, bool gridVisible) const
{
    QVector<QLineF> ticks{KvAxisGeometry::tickMark(orientation, 0.0)};
    QVector<QLineF> grid;
    QVector<KvPlacedText> labels;
    ticks.reserve(categories.size() + 1);
    labels.reserve(categories.size());
    const QVector<double> edges = KvAxisGeometry::bandEdges(orientation, categories.size());
    double bandStart = 0.0;
    for (int i = 0; i < edges.size(); ++i) {
        ticks.append(KvAxisGeometry::tickMark(orientation, edges.at(i)));
        if (gridVisible)
            grid.append(KvAxisGeometry::gridLine(orientation, edges.at(i)));
        const KvTextExtent &extent = extents.at(i);
        labels.append({categories.at(i),
                       KvAxisGeometry::categoryLabel(orientation, bandStart, edges.at(i), extent.size),
                       extent});
        bandStart = edges.at(i);
    }
    drawMarks(scene, ticks, grid);
    KvTextRunItem::addTo(scene, labels, m_labelFont, themes->color(KvChartThemes::TickLabelText));
}

QVector<KvTextExtent> KvBaseAxis::measure(const QStringList &texts)
{
    QVector<KvTextExtent> extents;
    extents.reserve(texts.size());
    for (const QString &text : texts)
        extents.append(m_measure.measure(text));
    return extents;
}

// The grid over the ticks, as it starts where they end.
void KvBaseAxis::drawMarks(QGraphicsScene *scene, const QVector<QLineF> &ticks,
                           const QVector<QLineF> &grid) const
{
    addLines(scene, ticks, m_axisPen);
    addLines(scene, grid, m_gridPen);
}

} // namespace kvCharts
