// SPDX-License-Identifier: MIT
#pragma once

#include <QStringList>

class QProcessEnvironment;

/** In which language a run of statreport speaks. */
class KvCliLanguage
{
public:
    /** English names of the languages that there are, as translation files use them: "ChineseSimple". */
    static QStringList names();
    /** The name of a language that is given by its name or its code: "german", "de", "de_AT". Empty for none
     *  that there is. */
    static QString named(const QString &word);

    /**
     * What the variables LC_ALL, LC_MESSAGES and LANG ask for, in this order; LANGUAGE may list languages to
     * try first. English for the locale "C" and for languages that there are not.
     */
    static QString ofEnvironment(const QProcessEnvironment &environment);
    /** The language to use for a command line: that of its option --language, or of the environment. */
    static QString chosen(const QStringList &arguments, const QProcessEnvironment &environment);
};
