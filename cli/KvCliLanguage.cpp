// SPDX-License-Identifier: MIT
#include "KvCliLanguage.h"

#include "kernel/ZtAppSettings.h"

#include <QLocale>
#include <QProcessEnvironment>

namespace {

struct Language
{
    const char *name;
    QLocale::Language language;
};

constexpr Language kLanguages[] = {{"English", QLocale::English},
                                   {"German", QLocale::German},
                                   {"French", QLocale::French},
                                   {"Spanish", QLocale::Spanish},
                                   {"Italian", QLocale::Italian},
                                   {"Russian", QLocale::Russian},
                                   {"Japanese", QLocale::Japanese},
                                   {"Korean", QLocale::Korean},
                                   {"Arabic", QLocale::Arabic},
                                   {"ChineseSimple", QLocale::Chinese},
                                   {"ChineseTraditional", QLocale::Chinese},
                                   {"Slovakian", QLocale::Slovak}};

// "C", "C.UTF-8" or "POSIX": what scripts set to have messages that they know.
bool isPlain(const QString &locale)
{
    const QString name = locale.section(QLatin1Char('.'), 0, 0);
    return name.isEmpty() || name == QLatin1String("C") || name == QLatin1String("POSIX");
}

QString localeOf(const QProcessEnvironment &environment)
{
    for (const char *variable : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
        const QString value = environment.value(QLatin1String(variable));
        if (!value.isEmpty())
            return value;
    }
    return QString();
}

// The last one counts, as for every option; empty when there is none.
QString optionValue(const QStringList &arguments)
{
    const QString option = QStringLiteral("--language");
    QString value;
    for (int i = 1; i < arguments.size() && arguments.at(i) != QLatin1String("--"); ++i) {
        if (arguments.at(i) == option)
            value = arguments.value(++i);
        else if (arguments.at(i).startsWith(option + QLatin1Char('=')))
            value = arguments.at(i).mid(option.size() + 1);
    }
    return value;
}

} // namespace

QStringList KvCliLanguage::names()
{
    QStringList all;
    for (const Language &language : kLanguages)
        all.append(QLatin1String(language.name));
    return all;
}

QString KvCliLanguage::named(const QString &word)
{
    const QLocale locale(word);
    for (const Language &language : kLanguages) {
        if (word.compare(QLatin1String(language.name), Qt::CaseInsensitive) == 0)
            return QLatin1String(language.name);
        if (locale.language() == language.language)
            return ZtAppSettings::getLanguageName(locale);
    }
    return QString();
}

QString KvCliLanguage::ofEnvironment(const QProcessEnvironment &environment)
{
    const QString locale = localeOf(environment);
    QStringList wanted{locale};
    if (!isPlain(locale))
        wanted = environment.value(QStringLiteral("LANGUAGE")).split(QLatin1Char(':')) + wanted;
    for (const QString &word : qAsConst(wanted)) {
        const QString name = named(word);
        if (!name.isEmpty())
            return name;
    }
    return QStringLiteral("English");
}

QString KvCliLanguage::chosen(const QStringList &arguments, const QProcessEnvironment &environment)
{
    const QString name = named(optionValue(arguments));
    return name.isEmpty() ? ofEnvironment(environment) : name;
}
