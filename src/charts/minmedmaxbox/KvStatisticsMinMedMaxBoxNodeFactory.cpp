// SPDX-License-Identifier: MIT
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeFactory.h"

#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeCfg.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxWidget.h"

#include <QCoreApplication>

KvStatisticsMinMedMaxBoxNodeFactory::KvStatisticsMinMedMaxBoxNodeFactory()
    : KvBaseEditorNodeFactory(
          QStringLiteral("MinMedMaxBox"),
          QCoreApplication::translate("KvBaseEditorNodeFactory", "Min / Median / Max Box"),
          QStringLiteral("Icons/ToolIconMinMax.svg"))
{}

KvBaseDisplayWidget *KvStatisticsMinMedMaxBoxNodeFactory::createDisplayWidget(QWidget *parent,
                                                                              KvBaseEditorNodeCfg *cfg)
{
    auto *boxCfg = qobject_cast<KvStatisticsMinMedMaxBoxNodeCfg *>(cfg);
    return boxCfg ? new KvStatisticsMinMedMaxBoxWidget(parent, boxCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvStatisticsMinMedMaxBoxNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvStatisticsMinMedMaxBoxNodeCfg(context);
}
