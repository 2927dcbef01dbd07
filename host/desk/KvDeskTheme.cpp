// SPDX-License-Identifier: MIT
#include "KvDeskTheme.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <QApplication>

namespace {

const char groupName[] = "Desk";
const char themeKey[] = "Theme";

} // namespace

QString KvDeskTheme::stored()
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    const QString theme = ZtAppSettings::value(QLatin1String(themeKey)).toString();
    ZtAppSettings::endGroup();
    const QStringList themes = acss::QtAdvancedStylesheet::getInstance()->themes();
    return themes.contains(theme) ? theme : themes.first();
}

void KvDeskTheme::store(const QString &theme)
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    ZtAppSettings::setValue(QLatin1String(themeKey), theme);
    ZtAppSettings::endGroup();
}

void KvDeskTheme::apply(const QString &theme)
{
    auto *const style = acss::QtAdvancedStylesheet::getInstance();
    style->setCurrentTheme(theme);
    style->applyTo(qApp);
}

void KvDeskTheme::toggle()
{
    auto *const style = acss::QtAdvancedStylesheet::getInstance();
    const QStringList themes = style->themes();
    const QString next = themes.at((themes.indexOf(style->currentTheme()) + 1) % themes.size());
    store(next);
    apply(next);
}
