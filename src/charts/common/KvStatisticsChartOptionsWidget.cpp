// SPDX-License-Identifier: MIT
#include "charts/common/KvStatisticsChartOptionsWidget.h"

#include "charts/common/KvStatisticsGroupedChartNodeCfg.h"

#include <QSignalBlocker>

KvStatisticsChartOptionsWidget::KvStatisticsChartOptionsWidget(const QString &heading, QWidget *parent)
    : KvThemedOptionsWidget(heading, parent)
{}

void KvStatisticsChartOptionsWidget::setFromConfig(const KvBaseEditorNodeCfg *cfg)
{
    const auto *chartCfg = qobject_cast<const KvStatisticsChartNodeCfg *>(cfg);
    if (!chartCfg)
        return;
    const QSignalBlocker blocker(this);
    showPlacement(chartCfg->widthPercent(), chartCfg->alignment());
    showTheme(chartCfg->themeIndex());
    if (const auto *groupedCfg = qobject_cast<const KvStatisticsGroupedChartNodeCfg *>(chartCfg))
        showGrouping(groupedCfg->groupBy());
}

Qt::Alignment KvStatisticsChartOptionsWidget::choose(Qt::Alignment alignment)
{
    showAlignment(alignment);
    return alignment;
}

Qt::Alignment KvStatisticsChartOptionsWidget::chooseLeft()
{
    return choose(Qt::AlignLeft);
}

Qt::Alignment KvStatisticsChartOptionsWidget::chooseCenter()
{
    // Only the centre carries the vertical flag: part of the stored format.
    return choose(Qt::AlignHCenter | Qt::AlignVCenter);
}

Qt::Alignment KvStatisticsChartOptionsWidget::chooseRight()
{
    return choose(Qt::AlignRight);
}
