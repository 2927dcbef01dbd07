// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChartThemes.h"
#include "charts/common/KvStatisticsChartOptionsWidget.h"

class KvStatisticsCounterPieNodeCfg;

/** Options panel of the counters' pie: width, alignment, theme. */
class KvStatisticsCounterPieOptionsWidget : public KvStatisticsChartOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvStatisticsCounterPieOptionsWidget(const KvStatisticsCounterPieNodeCfg *cfg, QWidget *parent,
                                        bool withPlacement);

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(const Qt::Alignment &aAlignment);
    void signalThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme);

public slots:
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();
    void slotThemeToggled();

private slots:
    void slotWidthEdited(int aWidth);
};
