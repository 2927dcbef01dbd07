// SPDX-License-Identifier: MIT
#pragma once

#include "ChartDrawing.h"
#include "charts/KvChartThemes.h"

#include <QGraphicsScene>

class ChartData;

/** The same picture by a scene with an item for each point, line and text. */
class ItemChart : public ChartDrawing
{
public:
    explicit ItemChart(const ChartData &data);

    void rebuild() override;
    void draw(QPaintDevice *device, double side) override;

private:
    void addText(const QString &text, const QPointF &middle);
    void addAxes();
    void addSeries(int series);
    void addLegend();

    const ChartData &m_data;
    kvCharts::KvChartThemes m_themes;
    QGraphicsScene m_scene;
};
