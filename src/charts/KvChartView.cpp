// SPDX-License-Identifier: MIT
#include "charts/KvChartView.h"

#include "charts/KvChart.h"

namespace kvCharts {

KvChartView::KvChartView(const KvChartThemes *themes, QWidget *parent)
    : QGraphicsView(parent)
{
    setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    showChart(new KvChart(themes));
}

KvChartView::~KvChartView()
{
    delete m_chart;
}

void KvChartView::setChart(kvCharts::KvChart *chart)
{
    if (chart == m_chart)
        return;
    KvChart *previous = m_chart;
    showChart(chart);
    delete previous;
    fitChart(); // it may have been drawn before, and then announces no rectangle
}

KvChart *KvChartView::chart() const
{
    return m_chart;
}

QRectF KvChartView::chartRect() const
{
    return scene() ? scene()->sceneRect() : QRectF();
}

void KvChartView::setFixedWidthKeepRatio(int width)
{
    setFixedWidth(width);
    const QRectF rect = chartRect();
    if (rect.width() > 0.0)
        setFixedHeight(static_cast<int>(rect.height() * width / rect.width()));
}

void KvChartView::slotSceneRectChanged(const QRectF &aRect)
{
    fitInView(aRect, m_aspectRatioMode);
}

void KvChartView::resizeEvent(QResizeEvent *event)
{
    QGraphicsView::resizeEvent(event);
    fitChart();
}

void KvChartView::fitChart()
{
    if (scene())
        fitInView(scene()->sceneRect(), m_aspectRatioMode);
}

void KvChartView::showChart(KvChart *chart)
{
    m_chart = chart;
    setScene(chart);
    if (chart)
        connect(chart, SIGNAL(sceneRectChanged(QRectF)), this, SLOT(slotSceneRectChanged(QRectF)));
}

} // namespace kvCharts
