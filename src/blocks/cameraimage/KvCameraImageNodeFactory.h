// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"

/** Makes blocks that show the camera's picture ("Camera Image View"). */
class KvCameraImageNodeFactory : public KvBaseEditorNodeFactory
{
public:
    KvCameraImageNodeFactory();

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override;
};
