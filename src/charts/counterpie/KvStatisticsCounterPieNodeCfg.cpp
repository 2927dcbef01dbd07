// SPDX-License-Identifier: MIT
#include "charts/counterpie/KvStatisticsCounterPieNodeCfg.h"

KvStatisticsCounterPieNodeCfg::KvStatisticsCounterPieNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvStatisticsChartNodeCfg(context, parent)
{}
