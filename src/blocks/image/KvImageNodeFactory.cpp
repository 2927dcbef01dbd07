// SPDX-License-Identifier: MIT
#include "blocks/image/KvImageNodeFactory.h"

#include "blocks/image/KvImageNodeCfg.h"
#include "blocks/image/KvImageWidget.h"

#include <QCoreApplication>

KvImageNodeFactory::KvImageNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Image View"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Image View"),
                              QStringLiteral("Icons/ToolIconImageView.svg"))
{}

KvBaseDisplayWidget *KvImageNodeFactory::createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg)
{
    auto *imageCfg = qobject_cast<KvImageNodeCfg *>(cfg);
    return imageCfg ? new KvImageWidget(parent, imageCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvImageNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvImageNodeCfg(context);
}
