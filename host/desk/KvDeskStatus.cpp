// SPDX-License-Identifier: MIT
#include "KvDeskStatus.h"

#include "common/ZtAppStatus.h"
#include "gui/QtAdvancedStylesheet.h"

namespace {

QColor themeColor(const char *token)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
}

} // namespace

void KvDeskStatus::log(int category, const QString &message, const QString &source)
{
    ZtAppStatus(category).setAndLogStatus(category, 0, message, source);
}

QString KvDeskStatus::categoryName(int category)
{
    switch (category) {
    case ZtAppStatus::Warning:
        return tr("Warning");
    case ZtAppStatus::Error:
        return tr("Error");
    default:
        return tr("Information");
    }
}

QString KvDeskStatus::iconPath(int category)
{
    switch (category) {
    case ZtAppStatus::Warning:
        return QStringLiteral("Icons/status-warning");
    case ZtAppStatus::Error:
        return QStringLiteral("Icons/status-error");
    default:
        return QStringLiteral("Icons/status-info");
    }
}

QColor KvDeskStatus::color(int category)
{
    switch (category) {
    case ZtAppStatus::Warning:
        return themeColor("warning");
    case ZtAppStatus::Error:
        return themeColor("error");
    default:
        return themeColor("muted");
    }
}
