// SPDX-License-Identifier: MIT
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeCfg.h"

KvStatisticsMinMedMaxBoxNodeCfg::KvStatisticsMinMedMaxBoxNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvStatisticsGroupedChartNodeCfg(context, parent)
{
    // The signals of panel and chart spell the type so; the meta-type system goes by the spelling.
    qRegisterMetaType<GroupBy>("KvStatisticsMinMedMaxBoxNodeCfg::GroupBy");
}
