// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"

/** Makes blocks that show a picture from a file ("Image View"). */
class KvImageNodeFactory : public KvBaseEditorNodeFactory
{
public:
    KvImageNodeFactory();

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override;
};
