// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"

#include <QJsonObject>

namespace {
const char kTextKey[] = "text";
}

KvTextDocumentNodeCfg::KvTextDocumentNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvBaseEditorNodeCfg(context, parent)
{}

bool KvTextDocumentNodeCfg::toJson(QJsonObject &config) const
{
    config[QLatin1String(kTextKey)] = m_text;
    return true;
}

bool KvTextDocumentNodeCfg::fromJson(const QJsonObject &config)
{
    const QJsonValue text = config.value(QLatin1String(kTextKey));
    if (!text.isString())
        return false;
    m_text = text.toString();
    return true;
}

bool KvTextDocumentNodeCfg::setText(const QString &text)
{
    if (text == m_text)
        return false;
    m_text = text;
    return true;
}
