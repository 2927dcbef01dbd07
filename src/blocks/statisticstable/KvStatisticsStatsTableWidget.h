// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"
#include "blocks/table/KvStatisticsBaseTableWidget.h"
#include "charts/KvChartThemes.h"
#include "data/KvStatisticsEngine.h"

/** The table of statistics: one row per group of measured values, with the statistics that the user chose. */
class KvStatisticsStatsTableWidget : public KvStatisticsBaseTableWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the table. */
    KvStatisticsStatsTableWidget(QWidget *displayParent, KvStatisticsStatsTableNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotUpdateTableContents();
    void slotWidthChanged(int aWidth);
    void slotAlignmentChanged(Qt::Alignment aAlignment);
    void slotGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy aGroupBy);
    void slotThemeChanged(kvCharts::KvChartThemes::ThemeType aTheme);
    void slotColumnsChanged(QSet<QString> aColumns);
    void slotContentHeightChanged();

protected:
    int widthPercent() const override;
    Qt::Alignment alignment() const override;

private:
    bool isByObject() const;
    void fillHeader(const QVector<int> &columns);
    void fillBodyByMeasurement(const QVector<int> &columns);
    void fillBodyByObject(const QVector<int> &columns);
    /** Appends a body row: the names of the group, then its statistics. */
    void addRow(const QStringList &names, const KvValueGroup &group, const QVector<int> &columns);

    /** Whether the configuration differs from what was announced last; it counts as announced then. */
    bool takeOptionsChange();

    KvStatisticsStatsTableNodeCfg *m_cfg;
    KvStatisticsStatsTableNodeCfg::Options m_announcedOptions;
};
