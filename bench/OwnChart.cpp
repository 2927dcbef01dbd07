// SPDX-License-Identifier: MIT
#include "OwnChart.h"

#include "ChartData.h"
#include "charts/KvBaseAxis.h"
#include "charts/KvLineSerie.h"

#include <QPainter>

OwnChart::OwnChart(const ChartData &data)
    : m_data(data)
    , m_chart(&m_themes)
{
    fill();
}

void OwnChart::fill()
{
    m_chart.beginUpdate();
    m_chart.clearSeries();
    for (int s = 0; s < ChartData::SeriesCount; ++s) {
        kvCharts::KvLineSerie *serie = m_chart.addSerie(ChartData::seriesName(s));
        serie->setShowTrend(true);
        for (const QPointF &point : m_data.points(s)) {
            const QString &category = m_data.categories().at(static_cast<int>(point.x()));
            m_chart.addCategory(category);
            serie->addPoint(category, point.y());
        }
    }
    m_chart.endUpdate();
}

void OwnChart::rebuild()
{
    m_chart.refresh();
}

void OwnChart::draw(QPaintDevice *device, double side)
{
    QPainter painter(device);
    painter.setRenderHint(QPainter::Antialiasing);
    m_chart.render(
        &painter, QRectF(0, 0, side, side),
        QRectF(-ChartData::PlotLeft, -ChartData::PlotTop, ChartData::PictureSide, ChartData::PictureSide));
}
