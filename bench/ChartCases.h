// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvAxisRange.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineChart.h"

#include <QByteArray>
#include <QImage>
#include <QPointF>
#include <QStringList>
#include <QVector>

class QPainter;

/** A line chart of three series with trend lines, and the same drawing by bare painter calls as its floor. */
class TrendChartCase
{
public:
    /** \a pointCount in all three series together; \a categoryCount labels below them. */
    TrendChartCase(int pointCount, int categoryCount);

    void fill();
    void rebuild();
    QImage paintChart();
    QImage paintFloor();
    QByteArray printChart();
    QByteArray printFloor();

private:
    struct FloorSeries
    {
        QColor color;
        QVector<QPointF> points;
        QLineF trend;
    };

    QVector<FloorSeries> mapPoints(const kvCharts::KvAxisRange &range) const;
    kvCharts::KvAxisRange floorRange() const;
    void drawFloor(QPainter *painter, bool roundPoints) const;
    void drawFloorAxes(QPainter *painter, const kvCharts::KvAxisRange &range) const;
    void drawFloorLegend(QPainter *painter) const;
    QTransform viewTransform(const QRectF &target) const;

    kvCharts::KvChartThemes m_themes;
    kvCharts::KvLineChart m_chart;
    QStringList m_categories;
    QVector<QVector<double>> m_values;
};
