// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvThemedOptionsWidget.h"
#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"
#include "charts/KvChartThemes.h"

#include <QPointer>

/**
 * Options panel of the statistics table: width, alignment, theme, grouping, statistics. Every change is
 * written to the configuration and then announced.
 */
class KvStatisticsStatsTableOptionsWidget : public KvThemedOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvStatisticsStatsTableOptionsWidget(KvStatisticsStatsTableNodeCfg *cfg, QWidget *parent,
                                        bool withPlacement);

    void setFromConfig(const KvBaseEditorNodeCfg *cfg) override;

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(Qt::Alignment aAlignment);
    void signalThemeChanged(kvCharts::KvChartThemes::ThemeType aTheme);
    void signalGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy aGroupBy);
    void signalColumnsChanged(QSet<QString> aColumns);

public slots:
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();
    void slotThemeToggled();
    void slotGroupByToggled();
    void slotColumnStateChanged(const QString &aName, int aState);

private slots:
    void slotWidthEdited(int aWidth);

private:
    void selectAlignment(Qt::Alignment alignment);

    QPointer<KvStatisticsStatsTableNodeCfg> m_cfg; ///< the block may die before its panel
};
