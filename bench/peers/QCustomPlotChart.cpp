// SPDX-License-Identifier: MIT
#include "ChartPeers.h"

#include "ChartData.h"
#include "ChartDrawing.h"
#include "charts/KvChartThemes.h"

#include <qcustomplot.h>

namespace {

using ChartPeers::Look;
using kvCharts::KvChartThemes;

class QCustomPlotChart : public ChartDrawing
{
public:
    QCustomPlotChart(const ChartData &data, Look look);

    void rebuild() override;
    void draw(QPaintDevice *device, double side) override;

private:
    void setUpAxes();
    void setUpAxis(QCPAxis *axis, const QSharedPointer<QCPAxisTicker> &ticker);
    void setUpLegend();
    void addSeries(int series);
    template <class Plottable>
    void setUpSeries(Plottable *plottable, int series);

    const ChartData &m_data;
    const Look m_look;
    KvChartThemes m_themes;
    QCustomPlot m_plot;
    QVector<QCPAbstractPlottable *> m_series;
    QVector<QCPItemLine *> m_trends;
};

QCustomPlotChart::QCustomPlotChart(const ChartData &data, Look look)
    : m_data(data)
    , m_look(look)
{
    if (m_look == Look::Alike)
        m_plot.setAntialiasedElements(QCP::aeAll);
    m_plot.setBackground(m_themes.color(KvChartThemes::ChartBackground));
    setUpAxes();
    setUpLegend();
    for (int s = 0; s < ChartData::SeriesCount; ++s)
        addSeries(s);
    rebuild();
}

void QCustomPlotChart::setUpAxes()
{
    constexpr int rest = ChartData::PictureSide - ChartData::PlotSide;
    m_plot.axisRect()->setAutoMargins(QCP::msNone);
    m_plot.axisRect()->setMargins(QMargins(ChartData::PlotLeft, ChartData::PlotTop,
                                           rest - ChartData::PlotLeft, rest - ChartData::PlotTop));
    m_plot.plotLayout()->setRowSpacing(0);
    const QSharedPointer<QCPAxisTickerText> categories(new QCPAxisTickerText);
    for (int i = 0; i < m_data.categories().size(); ++i)
        categories->addTick(i, m_data.categories().at(i));
    categories->setSubTickCount(1);
    const QSharedPointer<QCPAxisTickerText> values(new QCPAxisTickerText);
    for (const double value : m_data.valueTicks())
        values->addTick(value, QString::number(value));
    setUpAxis(m_plot.xAxis, categories);
    setUpAxis(m_plot.yAxis, values);
    m_plot.xAxis->setTickLength(0, 0);
    m_plot.xAxis->setSubTickLength(0, ChartData::TickLength);
    m_plot.xAxis->setRange(-0.5, m_data.categories().size() - 0.5);
    m_plot.yAxis->setRange(m_data.range().minimum, m_data.range().maximum);
}

void QCustomPlotChart::setUpAxis(QCPAxis *axis, const QSharedPointer<QCPAxisTicker> &ticker)
{
    const QPen pen = thinPen(m_themes.color(KvChartThemes::AxisLine));
    axis->setTicker(ticker);
    axis->setBasePen(pen);
    axis->setTickPen(pen);
    axis->setSubTickPen(pen);
    axis->setTickLength(0, ChartData::TickLength);
    axis->setTickLabelFont(ChartData::font(15));
    axis->setTickLabelColor(m_themes.color(KvChartThemes::TickLabelText));
    axis->grid()->setVisible(false);
}

void QCustomPlotChart::setUpLegend()
{
    m_plot.legend->setVisible(true);
    m_plot.legend->setFont(ChartData::font(16));
    m_plot.legend->setTextColor(m_themes.color(KvChartThemes::LegendText));
    m_plot.legend->setBrush(Qt::NoBrush);
    m_plot.legend->setBorderPen(Qt::NoPen);
    m_plot.legend->setFillOrder(QCPLegend::foColumnsFirst);
    QCPLayoutInset *inset = m_plot.axisRect()->insetLayout();
    inset->setInsetPlacement(0, QCPLayoutInset::ipFree);
    inset->setInsetRect(0, QRectF(0.3, -0.06, 0.4, 0.05));
}

void QCustomPlotChart::addSeries(int series)
{
    if (m_data.isAscending())
        setUpSeries(new QCPGraph(m_plot.xAxis, m_plot.yAxis), series);
    else
        setUpSeries(new QCPCurve(m_plot.xAxis, m_plot.yAxis), series);
    auto *trend = new QCPItemLine(&m_plot);
    trend->setPen(dashedPen(ChartData::seriesColor(series)));
    trend->setClipToAxisRect(false);
    m_trends.append(trend);
}

template <class Plottable>
void QCustomPlotChart::setUpSeries(Plottable *plottable, int series)
{
    const QPen pen = thinPen(ChartData::seriesColor(series));
    plottable->setName(ChartData::seriesName(series));
    plottable->setPen(pen);
    plottable->setScatterStyle(QCPScatterStyle(QCPScatterStyle::ssCircle, pen, ChartData::seriesColor(series),
                                               ChartData::MarkerSize));
    if (auto *graph = qobject_cast<QCPGraph *>(plottable))
        graph->setAdaptiveSampling(m_look == Look::Default);
    m_series.append(plottable);
}

void QCustomPlotChart::rebuild()
{
    for (int s = 0; s < ChartData::SeriesCount; ++s) {
        QVector<double> keys;
        QVector<double> values;
        keys.reserve(m_data.points(s).size());
        values.reserve(m_data.points(s).size());
        for (const QPointF &point : m_data.points(s)) {
            keys.append(point.x());
            values.append(point.y());
        }
        if (auto *graph = qobject_cast<QCPGraph *>(m_series.at(s)))
            graph->setData(keys, values, true);
        else
            static_cast<QCPCurve *>(m_series.at(s))->setData(keys, values);
        const QLineF line = m_data.regressionLine(s);
        m_trends.at(s)->start->setCoords(line.p1());
        m_trends.at(s)->end->setCoords(line.p2());
    }
}

void QCustomPlotChart::draw(QPaintDevice *device, double side)
{
    QCPPainter painter(device);
    if (device->devType() != QInternal::Image) {
        painter.setMode(QCPPainter::pmVectorized);
        painter.setMode(QCPPainter::pmNoCaching);
    }
    painter.scale(side / ChartData::PictureSide, side / ChartData::PictureSide);
    m_plot.toPainter(&painter, ChartData::PictureSide, ChartData::PictureSide);
}

} // namespace

std::unique_ptr<ChartDrawing> ChartPeers::makeQCustomPlotChart(const ChartData &data, Look look)
{
    return std::make_unique<QCustomPlotChart>(data, look);
}
