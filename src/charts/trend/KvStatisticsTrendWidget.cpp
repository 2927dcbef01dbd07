// SPDX-License-Identifier: MIT
#include "charts/trend/KvStatisticsTrendWidget.h"

#include "charts/KvLineChart.h"
#include "charts/KvLineSerie.h"
#include "charts/common/KvChartValueGroup.h"
#include "charts/trend/KvStatisticsTrendOptionsWidget.h"
#include "data/KvStatisticsUnitConverter.h"

#include <QCoreApplication>

namespace {

// One unit for all values of a group.
int unitOf(const KvChartValueGroup &group)
{
    const QPair<QVariant, QVariant> range = KvStatisticsEngine::range(group.records);
    return KvStatisticsUnitConverter::commonUnit(KvStatisticsEngine::numericValue(range.first),
                                                 KvStatisticsEngine::numericValue(range.second),
                                                 group.measureKind());
}

} // namespace

KvStatisticsTrendWidget::KvStatisticsTrendWidget(QWidget *parent, KvStatisticsTrendNodeCfg *cfg)
    : KvStatisticsChartWidget(parent, cfg)
    , m_cfg(cfg)
    , m_chart(new kvCharts::KvLineChart(cfg->themes()))
{
    start(m_chart);
}

QString KvStatisticsTrendWidget::displayName() const
{
    return QCoreApplication::translate("KvBaseEditorNodeFactory", "Trend");
}

QWidget *KvStatisticsTrendWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvStatisticsTrendOptionsWidget(m_cfg, parent, withPlacement);
    connectOptions(options);
    connect(options, SIGNAL(signalGroupByChanged(KvStatisticsTrendNodeCfg::GroupBy)), this,
                            SLOT(slotGroupByChanged(KvStatisticsTrendNodeCfg::GroupBy)));
    return options;
}

void KvStatisticsTrendWidget::updateValues()
{
    refreshChart();
}

void KvStatisticsTrendWidget::fillChart()
{
    m_chart->clearSeries();
    for (const KvChartValueGroup &group : KvChartValueGroup::collect(engine(), m_cfg->groupBy()))
        addSerie(group);
}

void KvStatisticsTrendWidget::addSerie(const KvChartValueGroup &group)
{
    const bool isByObject = m_cfg->groupBy() == KvStatisticsTrendNodeCfg::ByObject;
    const int kind = group.measureKind();
    const int unit = unitOf(group);
    kvCharts::KvLineSerie *serie = m_chart->addSerie(group.title(unit));
    for (const KvMeasuredValue &record : group.records) {
        const QString category = isByObject ? QString::number(record.objectId) : record.objectName;
        const double value = KvStatisticsEngine::numericValue(record.value);
        m_chart->addCategory(category);
        serie->addPoint(category, KvStatisticsUnitConverter::convert(value, kind, unit));
    }
    serie->setShowTrend(true);
}

void KvStatisticsTrendWidget::slotWidthChanged(int aWidth)
{
    changeWidth(aWidth);
}

void KvStatisticsTrendWidget::slotAlignmentChanged(const Qt::Alignment &aAlignment)
{
    changeAlignment(aAlignment);
}

void KvStatisticsTrendWidget::slotGroupByChanged(const KvStatisticsTrendNodeCfg::GroupBy &aGroupBy)
{
    if (aGroupBy == m_cfg->groupBy())
        return;
    m_cfg->setGroupBy(aGroupBy);
    announceConfigChanged();
    updateValues();
}

void KvStatisticsTrendWidget::slotThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme)
{
    changeTheme(aTheme);
}
