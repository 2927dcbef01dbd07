// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsChartNodeCfg.h"

/** What the user set for a pie of counters: theme and placement. */
class KvStatisticsCounterPieNodeCfg : public KvStatisticsChartNodeCfg
{
    Q_OBJECT
public:
    explicit KvStatisticsCounterPieNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);
};
