// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"

/** Makes box charts. In files they are called "MinMedMaxBox", whatever the title says. */
class KvStatisticsMinMedMaxBoxNodeFactory : public KvBaseEditorNodeFactory
{
public:
    KvStatisticsMinMedMaxBoxNodeFactory();

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override;
};
