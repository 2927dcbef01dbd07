// SPDX-License-Identifier: MIT
#include "templates/KvPageSectionsCfg.h"

#include <QJsonObject>

namespace {
const char kEnabledKey[] = "enabled";
}

KvPageSectionsCfg::KvPageSectionsCfg(KvTemplateContext *context, QObject *parent)
    : KvTextDocumentNodeCfg(context, parent)
{}

bool KvPageSectionsCfg::toJson(QJsonObject &config) const
{
    const bool isWritten = KvTextDocumentNodeCfg::toJson(config);
    config[QLatin1String(kEnabledKey)] = m_enabled;
    return isWritten;
}

bool KvPageSectionsCfg::fromJson(const QJsonObject &config)
{
    m_enabled = config.value(QLatin1String(kEnabledKey)).toBool(false);
    if (!KvTextDocumentNodeCfg::fromJson(config))
        m_enabled = false;
    return true;
}

bool KvPageSectionsCfg::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return false;
    m_enabled = enabled;
    return true;
}
