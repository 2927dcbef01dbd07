// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"

/** Makes measurements tables. In files they are called "Measurement table", whatever the title says. */
class KvStatisticsMeasurementsTableNodeFactory : public KvBaseEditorNodeFactory
{
public:
    KvStatisticsMeasurementsTableNodeFactory();

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override;
};
