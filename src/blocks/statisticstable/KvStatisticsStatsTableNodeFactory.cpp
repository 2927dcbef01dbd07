// SPDX-License-Identifier: MIT
#include "blocks/statisticstable/KvStatisticsStatsTableNodeFactory.h"

#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"
#include "blocks/statisticstable/KvStatisticsStatsTableWidget.h"

#include <QCoreApplication>

KvStatisticsStatsTableNodeFactory::KvStatisticsStatsTableNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Statistics Table"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Statistics Table"),
                              QStringLiteral("Icons/ToolIconTable.svg"))
{}

KvBaseDisplayWidget *KvStatisticsStatsTableNodeFactory::createDisplayWidget(QWidget *parent,
                                                                            KvBaseEditorNodeCfg *cfg)
{
    auto *tableCfg = qobject_cast<KvStatisticsStatsTableNodeCfg *>(cfg);
    return tableCfg ? new KvStatisticsStatsTableWidget(parent, tableCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvStatisticsStatsTableNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvStatisticsStatsTableNodeCfg(context);
}
