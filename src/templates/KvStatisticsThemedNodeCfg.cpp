// SPDX-License-Identifier: MIT
#include "templates/KvStatisticsThemedNodeCfg.h"

#include <QJsonObject>

namespace {
const char kThemeKey[] = "theme";
}

KvStatisticsThemedNodeCfg::KvStatisticsThemedNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvBaseEditorNodeCfg(context, parent)
{}

bool KvStatisticsThemedNodeCfg::toJson(QJsonObject &config) const
{
    config[QLatin1String(kThemeKey)] = m_themes.themeName();
    return true;
}

bool KvStatisticsThemedNodeCfg::fromJson(const QJsonObject &config)
{
    const QJsonValue theme = config.value(QLatin1String(kThemeKey));
    if (theme.isString())
        m_themes.setTheme(theme.toString());
    return true;
}

bool KvStatisticsThemedNodeCfg::setTheme(int index)
{
    return m_themes.setTheme(static_cast<kvCharts::KvChartThemes::ThemeType>(index));
}
