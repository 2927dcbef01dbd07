// SPDX-License-Identifier: MIT
#pragma once

#include "ChartDrawing.h"
#include "charts/KvChartThemes.h"

#include <QVector>

class ChartData;
class QPainter;
class QPointF;

/** The same picture by bare painter calls: the floor of whatever draws its markers one by one. */
class BareChart : public ChartDrawing
{
public:
    explicit BareChart(const ChartData &data);

    /** Nothing: all is done while drawing. */
    void rebuild() override {}
    void draw(QPaintDevice *device, double side) override;

private:
    QVector<QPointF> scenePoints(int series) const;
    void drawSeries(QPainter *painter, int series, bool isVector) const;
    void drawAxes(QPainter *painter) const;
    void drawCategoryLabels(QPainter *painter, double band) const;
    void drawValueLabels(QPainter *painter) const;
    void drawLegend(QPainter *painter) const;

    const ChartData &m_data;
    kvCharts::KvChartThemes m_themes;
};
