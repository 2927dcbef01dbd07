// SPDX-License-Identifier: MIT
#include "charts/counterpie/KvStatisticsCounterPieNodeFactory.h"

#include "charts/counterpie/KvStatisticsCounterPieNodeCfg.h"
#include "charts/counterpie/KvStatisticsCounterPieWidget.h"

#include <QCoreApplication>

KvStatisticsCounterPieNodeFactory::KvStatisticsCounterPieNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Counters"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Counters"),
                              QStringLiteral("Icons/ToolIconPie.svg"))
{}

KvBaseDisplayWidget *KvStatisticsCounterPieNodeFactory::createDisplayWidget(QWidget *parent,
                                                                            KvBaseEditorNodeCfg *cfg)
{
    auto *pieCfg = qobject_cast<KvStatisticsCounterPieNodeCfg *>(cfg);
    return pieCfg ? new KvStatisticsCounterPieWidget(parent, pieCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvStatisticsCounterPieNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvStatisticsCounterPieNodeCfg(context);
}
