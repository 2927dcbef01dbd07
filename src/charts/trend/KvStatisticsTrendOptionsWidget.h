// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChartThemes.h"
#include "charts/common/KvStatisticsChartOptionsWidget.h"
#include "charts/trend/KvStatisticsTrendNodeCfg.h"

/** Options panel of the trend chart: width, alignment, theme, grouping. */
class KvStatisticsTrendOptionsWidget : public KvStatisticsChartOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvStatisticsTrendOptionsWidget(const KvStatisticsTrendNodeCfg *cfg, QWidget *parent, bool withPlacement);

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(const Qt::Alignment &aAlignment);
    void signalGroupByChanged(const KvStatisticsTrendNodeCfg::GroupBy &aGroupBy);
    void signalThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme);

public slots:
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();
    void slotThemeToggled();
    void slotGroupByToggled();

private slots:
    void slotWidthEdited(int aWidth);
};
