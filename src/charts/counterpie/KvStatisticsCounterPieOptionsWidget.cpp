// SPDX-License-Identifier: MIT
#include "charts/counterpie/KvStatisticsCounterPieOptionsWidget.h"

#include "charts/counterpie/KvStatisticsCounterPieNodeCfg.h"

#include <QCoreApplication>

KvStatisticsCounterPieOptionsWidget::KvStatisticsCounterPieOptionsWidget(
    const KvStatisticsCounterPieNodeCfg *cfg, QWidget *parent, bool withPlacement)
    : KvStatisticsChartOptionsWidget(QCoreApplication::translate("KvBaseEditorNodeFactory", "Counters"),
                                     parent)
{
    if (withPlacement)
        addPlacementRows();
    addThemeRow();
    setFromConfig(cfg);
}

void KvStatisticsCounterPieOptionsWidget::slotWidthEdited(int aWidth)
{
    emit signalWidthChanged(aWidth);
}

void KvStatisticsCounterPieOptionsWidget::slotAlignLeftClicked()
{
    emit signalAlignmentChanged(chooseLeft());
}

void KvStatisticsCounterPieOptionsWidget::slotAlignCenterClicked()
{
    emit signalAlignmentChanged(chooseCenter());
}

void KvStatisticsCounterPieOptionsWidget::slotAlignRightClicked()
{
    emit signalAlignmentChanged(chooseRight());
}

void KvStatisticsCounterPieOptionsWidget::slotThemeToggled()
{
    const int theme = chosenTheme();
    if (theme >= 0)
        emit signalThemeChanged(static_cast<kvCharts::KvChartThemes::ThemeType>(theme));
}
