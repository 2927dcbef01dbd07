// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsGroupedChartNodeCfg.h"

/** What the user set for a trend chart: theme, placement, grouping. */
class KvStatisticsTrendNodeCfg : public KvStatisticsGroupedChartNodeCfg
{
    Q_OBJECT
public:
    explicit KvStatisticsTrendNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);
};
