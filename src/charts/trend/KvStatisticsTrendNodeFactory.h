// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"

/** Makes trend charts. */
class KvStatisticsTrendNodeFactory : public KvBaseEditorNodeFactory
{
public:
    KvStatisticsTrendNodeFactory();

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override;
};
