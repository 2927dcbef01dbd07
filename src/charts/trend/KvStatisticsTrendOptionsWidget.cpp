// SPDX-License-Identifier: MIT
#include "charts/trend/KvStatisticsTrendOptionsWidget.h"

#include <QCoreApplication>

KvStatisticsTrendOptionsWidget::KvStatisticsTrendOptionsWidget(const KvStatisticsTrendNodeCfg *cfg,
                                                               QWidget *parent, bool withPlacement)
    : KvStatisticsChartOptionsWidget(QCoreApplication::translate("KvBaseEditorNodeFactory", "Trend"), parent)
{
    if (withPlacement)
        addPlacementRows();
    addThemeRow();
    addGroupByRow();
    setFromConfig(cfg);
}

void KvStatisticsTrendOptionsWidget::slotWidthEdited(int aWidth)
{
    emit signalWidthChanged(aWidth);
}

void KvStatisticsTrendOptionsWidget::slotAlignLeftClicked()
{
    emit signalAlignmentChanged(chooseLeft());
}

void KvStatisticsTrendOptionsWidget::slotAlignCenterClicked()
{
    emit signalAlignmentChanged(chooseCenter());
}

void KvStatisticsTrendOptionsWidget::slotAlignRightClicked()
{
    emit signalAlignmentChanged(chooseRight());
}

void KvStatisticsTrendOptionsWidget::slotThemeToggled()
{
    const int theme = chosenTheme();
    if (theme >= 0)
        emit signalThemeChanged(static_cast<kvCharts::KvChartThemes::ThemeType>(theme));
}

void KvStatisticsTrendOptionsWidget::slotGroupByToggled()
{
    const int grouping = chosenGrouping();
    if (grouping >= 0)
        emit signalGroupByChanged(static_cast<KvStatisticsTrendNodeCfg::GroupBy>(grouping));
}
