// SPDX-License-Identifier: MIT
#include "BareChart.h"

#include "ChartData.h"

#include <QPaintEngine>
#include <QPainter>

namespace {

constexpr double kPlot = ChartData::PlotSide;
constexpr double kTick = ChartData::TickLength;

} // namespace

BareChart::BareChart(const ChartData &data)
    : m_data(data)
{}

void BareChart::draw(QPaintDevice *device, double side)
{
    QPainter painter(device);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setClipRect(QRectF(0, 0, side, side));
    painter.scale(side / ChartData::PictureSide, side / ChartData::PictureSide);
    painter.fillRect(QRectF(0, 0, ChartData::PictureSide, ChartData::PictureSide), m_themes.colors().at(0));
    painter.translate(ChartData::PlotLeft, ChartData::PlotTop);
    drawAxes(&painter);
    drawLegend(&painter);
    const bool isVector = painter.paintEngine()->type() != QPaintEngine::Raster;
    for (int s = 0; s < ChartData::SeriesCount; ++s)
        drawSeries(&painter, s, isVector);
}

QVector<QPointF> BareChart::scenePoints(int series) const
{
    QVector<QPointF> points;
    points.reserve(m_data.points(series).size());
    for (const QPointF &point : m_data.points(series))
        points.append(m_data.toScene(point));
    return points;
}

// Round dots take far less space in a PDF than ellipses, but longer on pixels.
void BareChart::drawSeries(QPainter *painter, int series, bool isVector) const
{
    const QColor color = ChartData::seriesColor(series);
    const QVector<QPointF> points = scenePoints(series);
    painter->setPen(thinPen(color));
    painter->setBrush(color);
    painter->drawPolyline(points.constData(), points.size());
    if (isVector) {
        painter->setPen(QPen(color, ChartData::MarkerSize, Qt::SolidLine, Qt::RoundCap));
        painter->drawPoints(points.constData(), points.size());
    } else {
        for (const QPointF &point : points)
            painter->drawEllipse(
                QRectF(point.x() - 2, point.y() - 2, ChartData::MarkerSize, ChartData::MarkerSize));
    }
    painter->setPen(dashedPen(color));
    const QLineF line = m_data.regressionLine(series);
    painter->drawLine(m_data.toScene(line.p1()), m_data.toScene(line.p2()));
}

void BareChart::drawAxes(QPainter *painter) const
{
    const double band = kPlot / m_data.categories().size();
    QVector<QLineF> lines{QLineF(0, kPlot, kPlot, kPlot), QLineF(0, kPlot, 0, 0)};
    for (int i = 0; i <= m_data.categories().size(); ++i)
        lines.append(QLineF(i * band, kPlot, i * band, kPlot + kTick));
    for (const double value : m_data.valueTicks()) {
        const double y = m_data.toScene(QPointF(0, value)).y();
        lines.append(QLineF(-kTick, y, 0, y));
    }
    painter->setPen(thinPen(m_themes.color(kvCharts::KvChartThemes::AxisLine)));
    painter->drawLines(lines);
    painter->setFont(ChartData::font(15));
    painter->setPen(m_themes.color(kvCharts::KvChartThemes::TickLabelText));
    drawCategoryLabels(painter, band);
    drawValueLabels(painter);
}

void BareChart::drawCategoryLabels(QPainter *painter, double band) const
{
    const QFontMetricsF metrics(painter->font(), painter->device());
    for (int i = 0; i < m_data.categories().size(); ++i) {
        const QString &text = m_data.categories().at(i);
        painter->drawText(QPointF((i + 0.5) * band - metrics.horizontalAdvance(text) / 2, kPlot + 26), text);
    }
}

void BareChart::drawValueLabels(QPainter *painter) const
{
    const QFontMetricsF metrics(painter->font(), painter->device());
    for (const double value : m_data.valueTicks()) {
        const QString text = QString::number(value);
        const QPointF end(-11, m_data.toScene(QPointF(0, value)).y() + 6);
        painter->drawText(end - QPointF(metrics.horizontalAdvance(text), 0), text);
    }
}

void BareChart::drawLegend(QPainter *painter) const
{
    painter->setFont(ChartData::font(16));
    const QFontMetricsF metrics(painter->font(), painter->device());
    double x = 340;
    for (int s = 0; s < ChartData::SeriesCount; ++s) {
        painter->setPen(thinPen(ChartData::seriesColor(s)));
        painter->setBrush(ChartData::seriesColor(s));
        painter->drawRect(QRectF(x, -40, 7, 7));
        painter->setPen(m_themes.color(kvCharts::KvChartThemes::LegendText));
        painter->drawText(QPointF(x + 20, -30), ChartData::seriesName(s));
        x += metrics.horizontalAdvance(ChartData::seriesName(s)) + 56;
    }
}
