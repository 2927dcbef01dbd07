// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"

/** Makes statistics tables. */
class KvStatisticsStatsTableNodeFactory : public KvBaseEditorNodeFactory
{
public:
    KvStatisticsStatsTableNodeFactory();

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override;
};
