// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsChartWidget.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeCfg.h"

namespace kvCharts {
class KvHorizontalBoxChart;
}

/**
 * One box per group of measured values, from the lower to the upper quartile, with whiskers to the least and
 * the greatest value. Values of one measure kind share one unit, so that their boxes can be compared.
 */
class KvStatisticsMinMedMaxBoxWidget : public KvStatisticsChartWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the widget. */
    KvStatisticsMinMedMaxBoxWidget(QWidget *parent, KvStatisticsMinMedMaxBoxNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotWidthChanged(int aWidth); ///< in percent
    void slotAlignmentChanged(const Qt::Alignment &aAlignment);
    void slotGroupByChanged(const KvStatisticsMinMedMaxBoxNodeCfg::GroupBy &aGroupBy);
    void slotThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme);
    void updateValues(); ///< shows the current data

protected:
    void fillChart() override;

private:
    KvStatisticsMinMedMaxBoxNodeCfg *m_cfg;
    kvCharts::KvHorizontalBoxChart *m_chart;
};
