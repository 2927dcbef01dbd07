// SPDX-License-Identifier: MIT
#pragma once

#include "ChartDrawing.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineChart.h"

class ChartData;

/** The line chart of this program. */
class OwnChart : public ChartDrawing
{
public:
    explicit OwnChart(const ChartData &data);

    /** Takes the points, category by category, as the trend block does. */
    void fill();
    void rebuild() override;
    void draw(QPaintDevice *device, double side) override;

private:
    const ChartData &m_data;
    kvCharts::KvChartThemes m_themes;
    kvCharts::KvLineChart m_chart;
};
