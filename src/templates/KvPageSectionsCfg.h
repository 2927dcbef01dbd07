// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/textdocument/KvTextDocumentNodeCfg.h"

/** Header, footer or page numbering of a template: rich text that can be switched on and off. */
class KvPageSectionsCfg : public KvTextDocumentNodeCfg
{
    Q_OBJECT
public:
    explicit KvPageSectionsCfg(KvTemplateContext *context, QObject *parent = nullptr);

    bool toJson(QJsonObject &config) const override;
    /**
     * Never fails. The section is enabled only by a JSON true, and only together with a text; without a text
     * the section is off and keeps the text it had.
     */
    bool fromJson(const QJsonObject &config) override;

    bool isEnabled() const { return m_enabled; }
    /** Returns whether the state changed. */
    bool setEnabled(bool enabled);

private:
    bool m_enabled = false;
};
