// SPDX-License-Identifier: MIT
#include "charts/common/KvChartValueGroup.h"

#include "charts/common/KvCounterRecords.h"
#include "data/KvStatisticsUnitConverter.h"

#include <algorithm>

namespace {

KvValueGroup withoutCounters(const KvValueGroup &records)
{
    if (std::none_of(records.begin(), records.end(), KvCounterRecords::isCounter))
        return records; // shared, not copied
    KvValueGroup kept;
    std::remove_copy_if(records.begin(), records.end(), std::back_inserter(kept),
                        KvCounterRecords::isCounter);
    return kept;
}

void append(QVector<KvChartValueGroup> &groups, const QString &name, const KvValueGroup &records)
{
    // A group is a counter's when its first record is, as unit and measure kind come from that one, too.
    if (!records.isEmpty() && !KvCounterRecords::isCounter(records.first()))
        groups.append({name, withoutCounters(records)});
}

QVector<KvChartValueGroup> byMeasurement(const KvStatisticsEngine &engine)
{
    QVector<KvChartValueGroup> groups;
    for (const QString &valueName : engine.valueNames())
        append(groups, valueName, engine.values(valueName));
    return groups;
}

QVector<KvChartValueGroup> byObject(const KvStatisticsEngine &engine)
{
    QVector<KvChartValueGroup> groups;
    for (const QString &typeName : engine.objectTypeNames()) {
        for (const QString &valueName : engine.valueNames(typeName))
            append(groups, typeName + QLatin1Char('/') + valueName, engine.values(typeName, valueName));
    }
    return groups;
}

} // namespace

QVector<KvChartValueGroup> KvChartValueGroup::collect(const KvStatisticsEngine &engine,
                                                      KvStatisticsGroupedChartNodeCfg::GroupBy groupBy)
{
    switch (groupBy) {
    case KvStatisticsGroupedChartNodeCfg::ByMeasurement:
        return byMeasurement(engine);
    case KvStatisticsGroupedChartNodeCfg::ByObject:
        return byObject(engine);
    }
    return {}; // a number that only a file can give
}

QString KvChartValueGroup::title(int unit) const
{
    return name + QLatin1Char('(') + KvStatisticsUnitConverter::unitText(unit) + QLatin1Char(')');
}
