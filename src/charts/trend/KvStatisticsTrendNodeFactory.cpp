// SPDX-License-Identifier: MIT
#include "charts/trend/KvStatisticsTrendNodeFactory.h"

#include "charts/trend/KvStatisticsTrendNodeCfg.h"
#include "charts/trend/KvStatisticsTrendWidget.h"

#include <QCoreApplication>

KvStatisticsTrendNodeFactory::KvStatisticsTrendNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Trend"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Trend"),
                              QStringLiteral("Icons/ToolIconTrend.svg"))
{}

KvBaseDisplayWidget *KvStatisticsTrendNodeFactory::createDisplayWidget(QWidget *parent,
                                                                       KvBaseEditorNodeCfg *cfg)
{
    auto *trendCfg = qobject_cast<KvStatisticsTrendNodeCfg *>(cfg);
    return trendCfg ? new KvStatisticsTrendWidget(parent, trendCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvStatisticsTrendNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvStatisticsTrendNodeCfg(context);
}
