// SPDX-License-Identifier: MIT
#include "blocks/cameraimage/KvCameraImageNodeFactory.h"

#include "blocks/cameraimage/KvCameraImageNodeCfg.h"
#include "blocks/cameraimage/KvCameraImageWidget.h"

#include <QCoreApplication>

KvCameraImageNodeFactory::KvCameraImageNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Camera Image View"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Camera Image View"),
                              QStringLiteral("Icons/ToolIconCameraImageView.svg"))
{}

KvBaseDisplayWidget *KvCameraImageNodeFactory::createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg)
{
    auto *cameraCfg = qobject_cast<KvCameraImageNodeCfg *>(cfg);
    return cameraCfg ? new KvCameraImageWidget(parent, cameraCfg) : nullptr;
}

KvBaseEditorNodeCfg *KvCameraImageNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvCameraImageNodeCfg(context);
}
