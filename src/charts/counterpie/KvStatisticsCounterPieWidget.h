// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsChartWidget.h"

class KvStatisticsCounterPieNodeCfg;

namespace kvCharts {
class KvPieChart;
}

/** The pie of what was counted: one slice per counting object, with its name and count. */
class KvStatisticsCounterPieWidget : public KvStatisticsChartWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the widget. */
    KvStatisticsCounterPieWidget(QWidget *parent, KvStatisticsCounterPieNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotWidthChanged(int aWidth); ///< in percent
    void slotAlignmentChanged(const Qt::Alignment &aAlignment);
    void slotThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme);
    void updateValues(); ///< shows the current data

protected:
    void fillChart() override;

private:
    KvStatisticsCounterPieNodeCfg *m_cfg;
    kvCharts::KvPieChart *m_chart;
};
