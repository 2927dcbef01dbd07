// SPDX-License-Identifier: MIT
#include "charts/common/KvStatisticsGroupedChartNodeCfg.h"

#include "blocks/common/KvJsonRead.h"

namespace {
const QString kGroupByKey = QStringLiteral("groupBy");
}

KvStatisticsGroupedChartNodeCfg::KvStatisticsGroupedChartNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvStatisticsChartNodeCfg(context, parent)
{}

bool KvStatisticsGroupedChartNodeCfg::toJson(QJsonObject &config) const
{
    if (!KvStatisticsChartNodeCfg::toJson(config))
        return false;
    config[kGroupByKey] = static_cast<int>(m_groupBy);
    return true;
}

bool KvStatisticsGroupedChartNodeCfg::fromJson(const QJsonObject &config)
{
    if (!config.contains(kGroupByKey)) {
        // Of a refused object only the theme is read, as with the other keys.
        KvStatisticsThemedNodeCfg::fromJson(config);
        return false;
    }
    if (!KvStatisticsChartNodeCfg::fromJson(config))
        return false;
    m_groupBy = static_cast<GroupBy>(KvJsonRead::readInt(config, kGroupByKey, m_groupBy));
    return true;
}
