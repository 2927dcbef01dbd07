// SPDX-License-Identifier: MIT
#include "charts/KvChartThemes.h"

#include <QMetaEnum>

namespace kvCharts {

namespace {

struct ThemeColors
{
    const char *dark;
    const char *light;
};

// By KvChartThemes::ColorRole.
constexpr ThemeColors kColors[KvChartThemes::ColorRoleCount] = {
    {"#262626", "#FFFFFF"}, {"#FFFFFF", "#313131"}, {"#FFFFFF", "#313131"}, {"#FFFFFF", "#313131"},
    {"#872222", "#d55959"}, {"#226a25", "#60bd65"}, {"#DCDCDC", "#373737"}, {"#373737", "#DCDCDC"},
    {"#4D4D4D", "#DDDDDD"}, {"#4D4D4D", "#DDDDDD"}, {"#F0F0F1", "#141414"},
};

QMetaEnum themeEnum()
{
    return QMetaEnum::fromType<KvChartThemes::ThemeType>();
}

// QMetaEnum::keyToValue() would also accept qualified names such as "KvChartThemes::Light".
int themeValue(const QString &name)
{
    const QMetaEnum keys = themeEnum();
    for (int i = 0; i < keys.keyCount(); ++i) {
        if (name == QLatin1String(keys.key(i)))
            return keys.value(i);
    }
    return -1;
}

} // namespace

KvChartThemes::KvChartThemes(QObject *parent)
    : QObject(parent)
{
    qRegisterMetaType<KvChartThemes::ThemeType>("kvCharts::KvChartThemes::ThemeType");
    qRegisterMetaType<KvChartThemes::ThemeType>("ThemeType");
    m_darkColors.reserve(ColorRoleCount);
    m_lightColors.reserve(ColorRoleCount);
    for (const ThemeColors &colors : kColors) {
        m_darkColors.append(QColor(QLatin1String(colors.dark)));
        m_lightColors.append(QColor(QLatin1String(colors.light)));
    }
}

const QVector<QColor> &KvChartThemes::colors() const
{
    return m_theme == Light ? m_lightColors : m_darkColors;
}

bool KvChartThemes::setTheme(kvCharts::KvChartThemes::ThemeType theme)
{
    if (theme == m_theme)
        return false;
    m_theme = theme;
    emit signalThemeChanged();
    return true;
}

void KvChartThemes::setTheme(const QString &name)
{
    setTheme(static_cast<ThemeType>(themeValue(name)));
}

QString KvChartThemes::themeName() const
{
    return QString::fromLatin1(themeEnum().valueToKey(m_theme));
}

} // namespace kvCharts
