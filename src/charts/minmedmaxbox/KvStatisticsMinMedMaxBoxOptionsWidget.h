// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChartThemes.h"
#include "charts/common/KvStatisticsChartOptionsWidget.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeCfg.h"

/** Options panel of the box chart: width, alignment, theme, grouping. */
class KvStatisticsMinMedMaxBoxOptionsWidget : public KvStatisticsChartOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvStatisticsMinMedMaxBoxOptionsWidget(const KvStatisticsMinMedMaxBoxNodeCfg *cfg, QWidget *parent,
                                          bool withPlacement);

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(const Qt::Alignment &aAlignment);
    void signalGroupByChanged(const KvStatisticsMinMedMaxBoxNodeCfg::GroupBy &aGroupBy);
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
