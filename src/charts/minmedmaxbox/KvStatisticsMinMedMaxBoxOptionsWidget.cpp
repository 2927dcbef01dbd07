// SPDX-License-Identifier: MIT
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxOptionsWidget.h"

#include <QCoreApplication>

KvStatisticsMinMedMaxBoxOptionsWidget::KvStatisticsMinMedMaxBoxOptionsWidget(
    const KvStatisticsMinMedMaxBoxNodeCfg *cfg, QWidget *parent, bool withPlacement)
    : KvStatisticsChartOptionsWidget(
          QCoreApplication::translate("KvBaseEditorNodeFactory", "Min / Median / Max Box"), parent)
{
    if (withPlacement)
        addPlacementRows();
    addThemeRow();
    addGroupByRow();
    setFromConfig(cfg);
}

void KvStatisticsMinMedMaxBoxOptionsWidget::slotWidthEdited(int aWidth)
{
    emit signalWidthChanged(aWidth);
}

void KvStatisticsMinMedMaxBoxOptionsWidget::slotAlignLeftClicked()
{
    emit signalAlignmentChanged(chooseLeft());
}

void KvStatisticsMinMedMaxBoxOptionsWidget::slotAlignCenterClicked()
{
    emit signalAlignmentChanged(chooseCenter());
}

void KvStatisticsMinMedMaxBoxOptionsWidget::slotAlignRightClicked()
{
    emit signalAlignmentChanged(chooseRight());
}

void KvStatisticsMinMedMaxBoxOptionsWidget::slotThemeToggled()
{
    const int theme = chosenTheme();
    if (theme >= 0)
        emit signalThemeChanged(static_cast<kvCharts::KvChartThemes::ThemeType>(theme));
}

void KvStatisticsMinMedMaxBoxOptionsWidget::slotGroupByToggled()
{
    const int grouping = chosenGrouping();
    if (grouping >= 0)
        emit signalGroupByChanged(static_cast<KvStatisticsMinMedMaxBoxNodeCfg::GroupBy>(grouping));
}
