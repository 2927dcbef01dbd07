// SPDX-License-Identifier: MIT
#include "KvDeskLanguages.h"

#include "kernel/ZtAppSettings.h"

namespace {

const char languageKey[] = "GEN_Language";

QVector<KvDeskLanguage> makeLanguages()
{
    using L = QLocale;
    return {
        {QStringLiteral("English"), QStringLiteral("English"), L(L::English)},
        {QStringLiteral("German"), QStringLiteral("Deutsch"), L(L::German)},
        {QStringLiteral("Spanish"), QStringLiteral("Español"), L(L::Spanish)},
        {QStringLiteral("French"), QStringLiteral("Français"), L(L::French)},
        {QStringLiteral("Italian"), QStringLiteral("Italiano"), L(L::Italian)},
        {QStringLiteral("Slovakian"), QStringLiteral("Slovenčina"), L(L::Slovak)},
        {QStringLiteral("Russian"), QStringLiteral("Русский"), L(L::Russian)},
        {QStringLiteral("Arabic"), QStringLiteral("العربية"), L(L::Arabic)},
        {QStringLiteral("Japanese"), QStringLiteral("日本語"), L(L::Japanese)},
        {QStringLiteral("Korean"), QStringLiteral("한국어"), L(L::Korean)},
        {QStringLiteral("ChineseSimple"), QStringLiteral("简体中文"), L(L::Chinese, L::China)},
        {QStringLiteral("ChineseTraditional"), QStringLiteral("繁體中文"), L(L::Chinese, L::Taiwan)},
    };
}

} // namespace

QString KvDeskLanguages::automatic()
{
    return QStringLiteral("auto");
}

const QVector<KvDeskLanguage> &KvDeskLanguages::all()
{
    static const QVector<KvDeskLanguage> languages = makeLanguages();
    return languages;
}

QString KvDeskLanguages::storedChoice()
{
    return ZtAppSettings::value(QLatin1String(languageKey), automatic()).toString();
}

void KvDeskLanguages::storeChoice(const QString &name)
{
    ZtAppSettings::setValue(QLatin1String(languageKey), name);
}

QString KvDeskLanguages::effectiveName()
{
    const QString choice = storedChoice();
    return choice == automatic() ? ZtAppSettings::getSystemLanguageName() : choice;
}

QLocale KvDeskLanguages::localeOf(const QString &name)
{
    for (const KvDeskLanguage &language : all()) {
        if (language.name.compare(name, Qt::CaseInsensitive) == 0)
            return language.locale;
    }
    return QLocale::c();
}
