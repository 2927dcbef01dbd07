// SPDX-License-Identifier: MIT
#include "report/KvBaseDisplayWidgetSignals.h"

#include "templates/KvBaseEditorNodeCfg.h"

KvBaseDisplayWidgetSignals::KvBaseDisplayWidgetSignals()
{
    qRegisterMetaType<const KvBaseEditorNodeCfg *>("const KvBaseEditorNodeCfg*");
}
