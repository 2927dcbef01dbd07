// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvStatisticsThemedNodeCfg.h"

/** A block type whose configuration is a bare theme, and which is never shown. */
class FakeBlockFactory : public KvBaseEditorNodeFactory
{
public:
    explicit FakeBlockFactory(const QString &name, const QString &title = QString(),
                              const QString &iconPath = QString(), bool *deleted = nullptr)
        : KvBaseEditorNodeFactory(name, title, iconPath)
        , m_deleted(deleted)
    {}
    ~FakeBlockFactory() override
    {
        if (m_deleted)
            *m_deleted = true;
    }

    KvBaseDisplayWidget *createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg) override
    {
        Q_UNUSED(parent)
        Q_UNUSED(cfg)
        return nullptr;
    }
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override
    {
        return new KvStatisticsThemedNodeCfg(context);
    }

private:
    bool *m_deleted;
};
