// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsGroupedChartNodeCfg.h"

/** What the user set for a box chart: theme, placement, grouping. */
class KvStatisticsMinMedMaxBoxNodeCfg : public KvStatisticsGroupedChartNodeCfg
{
    Q_OBJECT
public:
    explicit KvStatisticsMinMedMaxBoxNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);
};
