// SPDX-License-Identifier: MIT
#include "templates/KvBaseEditorNodeCfg.h"

KvBaseEditorNodeCfg::KvBaseEditorNodeCfg(KvTemplateContext *context, QObject *parent)
    : QObject(parent)
    , m_context(context)
{}
