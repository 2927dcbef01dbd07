// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeFactory.h"

#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableWidget.h"

#include <QCoreApplication>

KvStatisticsMeasurementsTableNodeFactory::KvStatisticsMeasurementsTableNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Measurement table"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Measurements Table"),
                              QStringLiteral("Icons/ToolIconTable.svg"))
{}

KvBaseDisplayWidget *KvStatisticsMeasurementsTableNodeFactory::createDisplayWidget(QWidget *parent,
                                                                                   KvBaseEditorNodeCfg *cfg)
{
    auto *tableCfg = qobject_cast<KvStatisticsMeasurementsTableNodeCfg *>(cfg);
    return tableCfg ? new KvStatisticsMeasurementsTableWidget(parent, tableCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvStatisticsMeasurementsTableNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvStatisticsMeasurementsTableNodeCfg(context);
}
