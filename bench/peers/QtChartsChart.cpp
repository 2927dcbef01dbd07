// SPDX-License-Identifier: MIT
#include "ChartPeers.h"

#include "ChartData.h"
#include "ChartDrawing.h"
#include "charts/KvChartThemes.h"

#include <QCoreApplication>
#include <QGraphicsScene>
#include <QPainter>

#include <QtCharts/QBarCategoryAxis>
#include <QtCharts/QChart>
#include <QtCharts/QLegend>
#include <QtCharts/QLegendMarker>
#include <QtCharts/QLineSeries>
#include <QtCharts/QScatterSeries>
#include <QtCharts/QValueAxis>

namespace {

using ChartPeers::Look;
using kvCharts::KvChartThemes;

class QtChartsChart : public ChartDrawing
{
public:
    QtChartsChart(const ChartData &data, Look look);

    void rebuild() override;
    void draw(QPaintDevice *device, double side) override;

private:
    void setUpAxes();
    void setUpAxis(QtCharts::QAbstractAxis *axis, Qt::Alignment alignment);
    void setUpLegend();
    void addSeries(int series);
    void addMarkers(int series);
    void attach(QtCharts::QAbstractSeries *series);

    const ChartData &m_data;
    const Look m_look;
    KvChartThemes m_themes;
    QGraphicsScene m_scene;
    QtCharts::QChart *m_chart;
    QVector<QtCharts::QLineSeries *> m_lines;
    QVector<QtCharts::QScatterSeries *> m_markers;
    QVector<QtCharts::QLineSeries *> m_trends;
};

QtChartsChart::QtChartsChart(const ChartData &data, Look look)
    : m_data(data)
    , m_look(look)
    , m_chart(new QtCharts::QChart)
{
    m_scene.setBackgroundBrush(m_themes.color(KvChartThemes::ChartBackground));
    m_scene.addItem(m_chart);
    m_chart->setGeometry(0, 0, ChartData::PictureSide, ChartData::PictureSide);
    m_chart->setBackgroundBrush(m_themes.color(KvChartThemes::ChartBackground));
    m_chart->setBackgroundRoundness(0);
    m_chart->setPlotArea(
        QRectF(ChartData::PlotLeft, ChartData::PlotTop, ChartData::PlotSide, ChartData::PlotSide));
    setUpAxes();
    for (int s = 0; s < ChartData::SeriesCount; ++s)
        addSeries(s);
    setUpLegend();
    rebuild();
}

void QtChartsChart::setUpAxes()
{
    auto *categories = new QtCharts::QBarCategoryAxis;
    categories->append(m_data.categories());
    auto *values = new QtCharts::QValueAxis;
    values->setRange(m_data.range().minimum, m_data.range().maximum);
    values->setTickCount(m_data.range().tickCount);
    values->setLabelFormat(QStringLiteral("%g"));
    setUpAxis(categories, Qt::AlignBottom);
    setUpAxis(values, Qt::AlignLeft);
}

void QtChartsChart::setUpAxis(QtCharts::QAbstractAxis *axis, Qt::Alignment alignment)
{
    axis->setLinePen(thinPen(m_themes.color(KvChartThemes::AxisLine)));
    axis->setLabelsFont(ChartData::font(15));
    axis->setLabelsColor(m_themes.color(KvChartThemes::TickLabelText));
    axis->setGridLineVisible(false);
    m_chart->addAxis(axis, alignment);
}

void QtChartsChart::setUpLegend()
{
    QtCharts::QLegend *legend = m_chart->legend();
    legend->setFont(ChartData::font(16));
    legend->setLabelColor(m_themes.color(KvChartThemes::LegendText));
    legend->detachFromChart();
    legend->setGeometry(ChartData::PlotLeft, 40, ChartData::PlotSide, 40);
    for (const auto &others :
         {m_markers.size() > 0 ? m_lines : QVector<QtCharts::QLineSeries *>(), m_trends}) {
        for (QtCharts::QLineSeries *series : others)
            legend->markers(series).first()->setVisible(false);
    }
}

void QtChartsChart::addSeries(int series)
{
    const QColor color = ChartData::seriesColor(series);
    auto *line = new QtCharts::QLineSeries;
    attach(line);
    line->setName(ChartData::seriesName(series));
    line->setPen(thinPen(color));
    m_lines.append(line);
    if (m_look == Look::Alike)
        addMarkers(series);
    else
        line->setPointsVisible(true);
    auto *trend = new QtCharts::QLineSeries;
    attach(trend);
    trend->setPen(dashedPen(color));
    m_trends.append(trend);
}

void QtChartsChart::addMarkers(int series)
{
    const QColor color = ChartData::seriesColor(series);
    auto *markers = new QtCharts::QScatterSeries;
    attach(markers);
    markers->setName(ChartData::seriesName(series));
    markers->setMarkerSize(ChartData::MarkerSize);
    markers->setPen(thinPen(color));
    markers->setBrush(color);
    m_markers.append(markers);
}

void QtChartsChart::attach(QtCharts::QAbstractSeries *series)
{
    m_chart->addSeries(series);
    for (QtCharts::QAbstractAxis *axis : m_chart->axes())
        series->attachAxis(axis);
}

void QtChartsChart::rebuild()
{
    for (int s = 0; s < ChartData::SeriesCount; ++s) {
        m_lines.at(s)->replace(m_data.points(s));
        if (m_look == Look::Alike)
            m_markers.at(s)->replace(m_data.points(s));
        const QLineF line = m_data.regressionLine(s);
        m_trends.at(s)->replace(QVector<QPointF>{line.p1(), line.p2()});
    }
    QCoreApplication::sendPostedEvents();
}

void QtChartsChart::draw(QPaintDevice *device, double side)
{
    QPainter painter(device);
    painter.setRenderHint(QPainter::Antialiasing);
    m_scene.render(&painter, QRectF(0, 0, side, side),
                   QRectF(0, 0, ChartData::PictureSide, ChartData::PictureSide));
}

} // namespace

std::unique_ptr<ChartDrawing> ChartPeers::makeQtChartsChart(const ChartData &data, Look look)
{
    return std::make_unique<QtChartsChart>(data, look);
}
