// SPDX-License-Identifier: MIT
#include "ChartPeers.h"

#include "ChartData.h"
#include "ChartDrawing.h"
#include "charts/KvChartThemes.h"

#include <QPainter>

#include <qwt_legend.h>
#include <qwt_plot.h>
#include <qwt_plot_canvas.h>
#include <qwt_plot_curve.h>
#include <qwt_plot_layout.h>
#include <qwt_plot_renderer.h>
#include <qwt_scale_draw.h>
#include <qwt_scale_widget.h>
#include <qwt_symbol.h>

namespace {

using ChartPeers::Look;
using kvCharts::KvChartThemes;

class CategoryScaleDraw : public QwtScaleDraw
{
public:
    explicit CategoryScaleDraw(const QStringList &categories)
        : m_categories(categories)
    {}

    QwtText label(double value) const override { return m_categories.value(qRound(value)); }

private:
    QStringList m_categories;
};

class QwtChart : public ChartDrawing
{
public:
    QwtChart(const ChartData &data, Look look);

    void rebuild() override;
    void draw(QPaintDevice *device, double side) override;

private:
    void setUpAxes();
    void setUpAxis(int axis, const QwtScaleDiv &division);
    void setUpLegend();
    void addSeries(int series);
    QwtSymbol *makeMarker(const QColor &color) const;
    void findPlotRect();

    const ChartData &m_data;
    const Look m_look;
    KvChartThemes m_themes;
    QwtPlot m_plot;
    QVector<QwtPlotCurve *> m_series;
    QVector<QwtPlotCurve *> m_trends;
    QRectF m_plotRect;
};

QwtChart::QwtChart(const ChartData &data, Look look)
    : m_data(data)
    , m_look(look)
{
    const QColor background = m_themes.color(KvChartThemes::ChartBackground);
    m_plot.setAutoReplot(false);
    m_plot.setCanvasBackground(background);
    static_cast<QwtPlotCanvas *>(m_plot.canvas())->setFrameStyle(QFrame::NoFrame);
    setUpAxes();
    setUpLegend();
    for (int s = 0; s < ChartData::SeriesCount; ++s)
        addSeries(s);
    rebuild();
    findPlotRect();
}

void QwtChart::setUpAxes()
{
    const int count = m_data.categories().size();
    QList<double> edges;
    QList<double> centers;
    for (int i = 0; i < count; ++i) {
        edges.append(i - 0.5);
        centers.append(i);
    }
    edges.append(count - 0.5);
    m_plot.setAxisScaleDraw(QwtPlot::xBottom, new CategoryScaleDraw(m_data.categories()));
    setUpAxis(QwtPlot::xBottom, QwtScaleDiv(-0.5, count - 0.5, edges, {}, centers));
    m_plot.axisScaleDraw(QwtPlot::xBottom)->setTickLength(QwtScaleDiv::MajorTick, 0);
    setUpAxis(QwtPlot::yLeft, QwtScaleDiv(m_data.range().minimum, m_data.range().maximum, {}, {},
                                          m_data.valueTicks().toList()));
}

void QwtChart::setUpAxis(int axis, const QwtScaleDiv &division)
{
    m_plot.setAxisScaleDiv(axis, division);
    m_plot.setAxisFont(axis, ChartData::font(15));
    QwtScaleDraw *draw = m_plot.axisScaleDraw(axis);
    draw->setTickLength(QwtScaleDiv::MinorTick, ChartData::TickLength);
    draw->setTickLength(QwtScaleDiv::MajorTick, ChartData::TickLength);
    QwtScaleWidget *widget = m_plot.axisWidget(axis);
    widget->setMargin(0);
    QPalette palette = widget->palette();
    palette.setColor(QPalette::WindowText, m_themes.color(KvChartThemes::AxisLine));
    palette.setColor(QPalette::Text, m_themes.color(KvChartThemes::TickLabelText));
    widget->setPalette(palette);
}

void QwtChart::setUpLegend()
{
    auto *legend = new QwtLegend;
    QPalette palette = legend->palette();
    palette.setColor(QPalette::WindowText, m_themes.color(KvChartThemes::LegendText));
    palette.setColor(QPalette::Text, m_themes.color(KvChartThemes::LegendText));
    legend->setPalette(palette);
    legend->setFont(ChartData::font(16));
    m_plot.insertLegend(legend, QwtPlot::TopLegend);
    m_plot.plotLayout()->setAlignCanvasToScales(true);
    m_plot.plotLayout()->setCanvasMargin(0);
}

void QwtChart::addSeries(int series)
{
    const QColor color = ChartData::seriesColor(series);
    auto *curve = new QwtPlotCurve(ChartData::seriesName(series));
    curve->setPen(thinPen(color));
    curve->setSymbol(makeMarker(color));
    auto *trend = new QwtPlotCurve;
    trend->setPen(dashedPen(color));
    trend->setItemAttribute(QwtPlotItem::Legend, false);
    for (QwtPlotCurve *each : {curve, trend}) {
        each->setRenderHint(QwtPlotItem::RenderAntialiased, m_look == Look::Alike);
        each->attach(&m_plot);
    }
    m_series.append(curve);
    m_trends.append(trend);
    if (m_look == Look::Alike)
        curve->setPaintAttribute(QwtPlotCurve::FilterPoints, false);
}

QwtSymbol *QwtChart::makeMarker(const QColor &color) const
{
    auto *marker = new QwtSymbol(QwtSymbol::Ellipse, color, thinPen(color),
                                 QSize(ChartData::MarkerSize, ChartData::MarkerSize));
    if (m_look == Look::Alike)
        marker->setCachePolicy(QwtSymbol::NoCache);
    return marker;
}

// The layout places the plot; around it goes what that needs to put the plot where the others have theirs.
void QwtChart::findPlotRect()
{
    const QRectF picture(0, 0, ChartData::PictureSide, ChartData::PictureSide);
    m_plot.plotLayout()->activate(&m_plot, picture,
                                  QwtPlotLayout::IgnoreScrollbars | QwtPlotLayout::IgnoreFrames);
    const QRectF canvas = m_plot.plotLayout()->canvasRect();
    const QRectF plot(ChartData::PlotLeft, ChartData::PlotTop, ChartData::PlotSide, ChartData::PlotSide);
    m_plotRect = plot.adjusted(picture.left() - canvas.left(), picture.top() - canvas.top(),
                               picture.right() - canvas.right(), picture.bottom() - canvas.bottom());
}

void QwtChart::rebuild()
{
    for (int s = 0; s < ChartData::SeriesCount; ++s) {
        m_series.at(s)->setSamples(m_data.points(s));
        const QLineF line = m_data.regressionLine(s);
        m_trends.at(s)->setSamples({line.p1(), line.p2()});
    }
    m_plot.replot();
}

// The renderer scales by the resolution of the device, and takes the rectangle in its units.
void QwtChart::draw(QPaintDevice *device, double side)
{
    QPainter painter(device);
    const double resolution = double(device->logicalDpiX()) / m_plot.logicalDpiX();
    const double scale = side / ChartData::PictureSide / resolution;
    painter.scale(scale, scale);
    painter.fillRect(QRectF(0, 0, ChartData::PictureSide * resolution, ChartData::PictureSide * resolution),
                     m_themes.color(KvChartThemes::ChartBackground));
    QwtPlotRenderer renderer;
    renderer.setDiscardFlag(QwtPlotRenderer::DiscardBackground);
    renderer.render(&m_plot, &painter,
                    QRectF(m_plotRect.topLeft() * resolution, m_plotRect.size() * resolution));
}

} // namespace

std::unique_ptr<ChartDrawing> ChartPeers::makeQwtChart(const ChartData &data, Look look)
{
    return std::make_unique<QwtChart>(data, look);
}
