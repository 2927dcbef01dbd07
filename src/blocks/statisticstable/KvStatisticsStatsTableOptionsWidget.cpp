// SPDX-License-Identifier: MIT
#include "blocks/statisticstable/KvStatisticsStatsTableOptionsWidget.h"

#include <QSignalBlocker>

KvStatisticsStatsTableOptionsWidget::KvStatisticsStatsTableOptionsWidget(KvStatisticsStatsTableNodeCfg *cfg,
                                                                         QWidget *parent, bool withPlacement)
    : KvThemedOptionsWidget(tr("Statistics table"), parent)
    , m_cfg(cfg)
{
    qRegisterMetaType<KvStatisticsStatsTableNodeCfg::GroupBy>("KvStatisticsStatsTableNodeCfg::GroupBy");
    if (withPlacement)
        addPlacementRows();
    addThemeRow();
    addGroupByRow();
    addColumnsRow(KvStatisticsStatsTableNodeCfg::columnNames(), &KvStatisticsStatsTableNodeCfg::columnLabel);
    setFromConfig(cfg);
}

void KvStatisticsStatsTableOptionsWidget::setFromConfig(const KvBaseEditorNodeCfg *cfg)
{
    const auto *tableCfg = qobject_cast<const KvStatisticsStatsTableNodeCfg *>(cfg);
    if (!tableCfg)
        return;
    const QSignalBlocker blocker(this);
    showPlacement(tableCfg->widthPercent(), tableCfg->alignment());
    showTheme(tableCfg->themeIndex());
    showGrouping(tableCfg->groupBy());
    showColumns(tableCfg->columns());
}

void KvStatisticsStatsTableOptionsWidget::selectAlignment(Qt::Alignment alignment)
{
    showAlignment(alignment);
    if (!m_cfg)
        return;
    m_cfg->setAlignment(alignment);
    emit signalAlignmentChanged(alignment);
}

void KvStatisticsStatsTableOptionsWidget::slotWidthEdited(int aWidth)
{
    if (!m_cfg)
        return;
    m_cfg->setWidthPercent(aWidth);
    emit signalWidthChanged(aWidth);
}

void KvStatisticsStatsTableOptionsWidget::slotAlignLeftClicked()
{
    selectAlignment(Qt::AlignLeft);
}

void KvStatisticsStatsTableOptionsWidget::slotAlignCenterClicked()
{
    // With the vertical flag, as all blocks write it; only a table that nobody aligned has none.
    selectAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
}

void KvStatisticsStatsTableOptionsWidget::slotAlignRightClicked()
{
    selectAlignment(Qt::AlignRight);
}

void KvStatisticsStatsTableOptionsWidget::slotThemeToggled()
{
    const int theme = chosenTheme();
    if (!m_cfg || theme < 0)
        return;
    m_cfg->setTheme(theme);
    emit signalThemeChanged(static_cast<kvCharts::KvChartThemes::ThemeType>(theme));
}

void KvStatisticsStatsTableOptionsWidget::slotGroupByToggled()
{
    const int grouping = chosenGrouping();
    if (!m_cfg || grouping < 0)
        return;
    const auto groupBy = static_cast<KvStatisticsStatsTableNodeCfg::GroupBy>(grouping);
    m_cfg->setGroupBy(groupBy);
    emit signalGroupByChanged(groupBy);
}

void KvStatisticsStatsTableOptionsWidget::slotColumnStateChanged(const QString &aName, int aState)
{
    if (!m_cfg)
        return;
    m_cfg->setColumns(changedColumns(m_cfg->columns(), aName, aState));
    emit signalColumnsChanged(m_cfg->columns());
}
