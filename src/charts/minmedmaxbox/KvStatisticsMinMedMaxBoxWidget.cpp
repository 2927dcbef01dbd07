// SPDX-License-Identifier: MIT
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxWidget.h"

#include "charts/KvHorizontalBoxChart.h"
#include "charts/KvSeriesPalette.h"
#include "charts/common/KvChartValueGroup.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxOptionsWidget.h"
#include "data/KvStatisticsUnitConverter.h"

#include <QCoreApplication>
#include <QMap>

#include <algorithm>
#include <limits>

namespace {

/** Minimum, lower quartile, median, upper quartile, maximum, in base units. */
struct Summary
{
    double min = 0.0;
    double q1 = 0.0;
    double median = 0.0;
    double q3 = 0.0;
    double max = 0.0;
};

struct Range
{
    double least = std::numeric_limits<double>::infinity();
    double greatest = -least;
};

QVector<Summary> summariesOf(const QVector<KvChartValueGroup> &groups)
{
    QVector<Summary> summaries(groups.size());
    for (int i = 0; i < groups.size(); ++i) {
        Summary &summary = summaries[i];
        KvStatisticsEngine::fiveNumbers(groups.at(i).records, summary.min, summary.q1, summary.median,
                                        summary.q3, summary.max);
    }
    return summaries;
}

// All boxes stand over one axis: groups of one measure kind can only be compared in one unit.
QMap<int, int> unitsByMeasureKind(const QVector<KvChartValueGroup> &groups, const QVector<Summary> &summaries)
{
    QMap<int, Range> ranges;
    for (int i = 0; i < groups.size(); ++i) {
        Range &range = ranges[groups.at(i).measureKind()];
        range.least = std::min(range.least, summaries.at(i).min);
        range.greatest = std::max(range.greatest, summaries.at(i).max);
    }
    QMap<int, int> units;
    for (auto it = ranges.cbegin(); it != ranges.cend(); ++it)
        units[it.key()] = KvStatisticsUnitConverter::commonUnit(it->least, it->greatest, it.key());
    return units;
}

} // namespace

KvStatisticsMinMedMaxBoxWidget::KvStatisticsMinMedMaxBoxWidget(QWidget *parent,
                                                               KvStatisticsMinMedMaxBoxNodeCfg *cfg)
    : KvStatisticsChartWidget(parent, cfg)
    , m_cfg(cfg)
    , m_chart(new kvCharts::KvHorizontalBoxChart(cfg->themes()))
{
    start(m_chart);
}

QString KvStatisticsMinMedMaxBoxWidget::displayName() const
{
    return QCoreApplication::translate("KvBaseEditorNodeFactory", "Min / Median / Max Box");
}

QWidget *KvStatisticsMinMedMaxBoxWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvStatisticsMinMedMaxBoxOptionsWidget(m_cfg, parent, withPlacement);
    connectOptions(options);
    connect(options, SIGNAL(signalGroupByChanged(KvStatisticsMinMedMaxBoxNodeCfg::GroupBy)), this,
                            SLOT(slotGroupByChanged(KvStatisticsMinMedMaxBoxNodeCfg::GroupBy)));
    return options;
}

void KvStatisticsMinMedMaxBoxWidget::updateValues()
{
    refreshChart();
}

void KvStatisticsMinMedMaxBoxWidget::fillChart()
{
    m_chart->clearBoxes();
    const QVector<KvChartValueGroup> groups = KvChartValueGroup::collect(engine(), m_cfg->groupBy());
    const QVector<Summary> summaries = summariesOf(groups);
    const QMap<int, int> units = unitsByMeasureKind(groups, summaries);
    for (int i = 0; i < groups.size(); ++i) {
        const int kind = groups.at(i).measureKind();
        const int unit = units.value(kind);
        const auto shown = [kind, unit](double value) {
            return KvStatisticsUnitConverter::convert(value, kind, unit);
        };
        const Summary &summary = summaries.at(i);
        m_chart->addBox(groups.at(i).title(unit), shown(summary.min), shown(summary.q1),
                        shown(summary.median), shown(summary.q3), shown(summary.max),
                        kvCharts::seriesColor(i));
    }
}

void KvStatisticsMinMedMaxBoxWidget::slotWidthChanged(int aWidth)
{
    changeWidth(aWidth);
}

void KvStatisticsMinMedMaxBoxWidget::slotAlignmentChanged(const Qt::Alignment &aAlignment)
{
    changeAlignment(aAlignment);
}

void KvStatisticsMinMedMaxBoxWidget::slotGroupByChanged(
    const KvStatisticsMinMedMaxBoxNodeCfg::GroupBy &aGroupBy)
{
    if (aGroupBy == m_cfg->groupBy())
        return;
    m_cfg->setGroupBy(aGroupBy);
    announceConfigChanged();
    updateValues();
}

void KvStatisticsMinMedMaxBoxWidget::slotThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme)
{
    changeTheme(aTheme);
}
