// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/table/KvStatisticsBaseTableWidget.h"
#include "charts/KvChartThemes.h"

#include <QSet>

/** The table of all measured values, one row per value. */
class KvStatisticsMeasurementsTableWidget : public KvStatisticsBaseTableWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the table. */
    KvStatisticsMeasurementsTableWidget(QWidget *displayParent, KvStatisticsMeasurementsTableNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotUpdateTableContents();
    void slotWidthChanged(int aWidth);
    void slotAlignmentChanged(Qt::Alignment aAlignment);
    void slotThemeChanged(kvCharts::KvChartThemes::ThemeType aTheme);
    void slotColumnsChanged(QSet<QString> aColumns);
    void slotContentHeightChanged();
    void slotOrderBySelected(QString aColumnName, bool aAscending);

protected:
    int widthPercent() const override;
    Qt::Alignment alignment() const override;

private:
    void fillHeader(const QVector<int> &columns);
    void fillBody(const QVector<int> &columns);

    /** Whether the configuration differs from what was announced last; it counts as announced then. */
    bool takeOptionsChange();

    KvStatisticsMeasurementsTableNodeCfg *m_cfg;
    KvStatisticsMeasurementsTableNodeCfg::Options m_announcedOptions;
};
