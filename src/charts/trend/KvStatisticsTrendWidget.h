// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsChartWidget.h"
#include "charts/trend/KvStatisticsTrendNodeCfg.h"

struct KvChartValueGroup;

namespace kvCharts {
class KvLineChart;
}

/** The values of every group in measurement order, as a line of points with its regression line. */
class KvStatisticsTrendWidget : public KvStatisticsChartWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the widget. */
    KvStatisticsTrendWidget(QWidget *parent, KvStatisticsTrendNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotWidthChanged(int aWidth); ///< in percent
    void slotAlignmentChanged(const Qt::Alignment &aAlignment);
    void slotGroupByChanged(const KvStatisticsTrendNodeCfg::GroupBy &aGroupBy);
    void slotThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme);
    void updateValues(); ///< shows the current data

protected:
    void fillChart() override;

private:
    void addSerie(const KvChartValueGroup &group);

    KvStatisticsTrendNodeCfg *m_cfg;
    kvCharts::KvLineChart *m_chart;
};
