// SPDX-License-Identifier: MIT
#include "charts/trend/KvStatisticsTrendNodeCfg.h"

KvStatisticsTrendNodeCfg::KvStatisticsTrendNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvStatisticsGroupedChartNodeCfg(context, parent)
{
    // The signals of panel and chart spell the type so; the meta-type system goes by the spelling.
    qRegisterMetaType<GroupBy>("KvStatisticsTrendNodeCfg::GroupBy");
}
