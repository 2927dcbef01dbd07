// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvBaseEditorNodeCfg.h"

#include <QString>

/** Rich text of a text block or a page section, as the HTML that the rich-text editor produces. */
class KvTextDocumentNodeCfg : public KvBaseEditorNodeCfg
{
    Q_OBJECT
public:
    explicit KvTextDocumentNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    bool toJson(QJsonObject &config) const override;
    /** Requires "text" as a string; otherwise false, and the text is left as it was. */
    bool fromJson(const QJsonObject &config) override;

    /** Keywords stand in it as placeholders. */
    QString text() const { return m_text; }
    /** Stores the text; returns whether it differs from the old one. */
    bool setText(const QString &text);

private:
    QString m_text;
};
