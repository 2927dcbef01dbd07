// SPDX-License-Identifier: MIT
#include "ItemChart.h"

#include "ChartData.h"

#include <QGraphicsTextItem>
#include <QPainter>

namespace {

constexpr double kPlot = ChartData::PlotSide;
constexpr double kTick = ChartData::TickLength;

} // namespace

ItemChart::ItemChart(const ChartData &data)
    : m_data(data)
{
    m_scene.setBackgroundBrush(m_themes.color(kvCharts::KvChartThemes::ChartBackground));
    rebuild();
}

void ItemChart::rebuild()
{
    m_scene.clear();
    addAxes();
    addLegend();
    for (int s = 0; s < ChartData::SeriesCount; ++s)
        addSeries(s);
}

void ItemChart::draw(QPaintDevice *device, double side)
{
    QPainter painter(device);
    painter.setRenderHint(QPainter::Antialiasing);
    m_scene.render(
        &painter, QRectF(0, 0, side, side),
        QRectF(-ChartData::PlotLeft, -ChartData::PlotTop, ChartData::PictureSide, ChartData::PictureSide));
}

void ItemChart::addText(const QString &text, const QPointF &middle)
{
    QGraphicsTextItem *item = m_scene.addText(text, ChartData::font(15));
    item->setDefaultTextColor(m_themes.color(kvCharts::KvChartThemes::TickLabelText));
    item->setPos(middle - item->boundingRect().center());
}

void ItemChart::addAxes()
{
    const QPen pen = thinPen(m_themes.color(kvCharts::KvChartThemes::AxisLine));
    const double band = kPlot / m_data.categories().size();
    m_scene.addLine(0, kPlot, kPlot, kPlot, pen);
    m_scene.addLine(0, kPlot, 0, 0, pen);
    m_scene.addLine(0, kPlot, 0, kPlot + kTick, pen);
    for (int i = 0; i < m_data.categories().size(); ++i) {
        m_scene.addLine((i + 1) * band, kPlot, (i + 1) * band, kPlot + kTick, pen);
        addText(m_data.categories().at(i), QPointF((i + 0.5) * band, kPlot + 20));
    }
    for (const double value : m_data.valueTicks()) {
        const double y = m_data.toScene(QPointF(0, value)).y();
        m_scene.addLine(-kTick, y, 0, y, pen);
        addText(QString::number(value), QPointF(-22, y));
    }
}

void ItemChart::addSeries(int series)
{
    const QColor color = ChartData::seriesColor(series);
    const QPen pen = thinPen(color);
    QPointF previous;
    for (const QPointF &point : m_data.points(series)) {
        const QPointF place = m_data.toScene(point);
        m_scene.addEllipse(place.x() - 2, place.y() - 2, ChartData::MarkerSize, ChartData::MarkerSize, pen,
                           color);
        if (!previous.isNull())
            m_scene.addLine(QLineF(previous, place), pen);
        previous = place;
    }
    const QLineF line = m_data.regressionLine(series);
    m_scene.addLine(QLineF(m_data.toScene(line.p1()), m_data.toScene(line.p2())), dashedPen(color));
}

void ItemChart::addLegend()
{
    for (int s = 0; s < ChartData::SeriesCount; ++s) {
        const double x = 340 + s * 120;
        m_scene.addRect(x, -40, 7, 7, thinPen(ChartData::seriesColor(s)), ChartData::seriesColor(s));
        addText(ChartData::seriesName(s), QPointF(x + 50, -36));
    }
}
