// SPDX-License-Identifier: MIT
#pragma once

#include <QLocale>
#include <QString>
#include <QVector>

/** A language in which the user can have the program. */
struct KvDeskLanguage
{
    QString name;       ///< English name, as in the settings and in the names of translation files
    QString nativeName; ///< what its speakers call it
    QLocale locale;
};

/** The languages of the user interface, and which of them the settings choose. */
class KvDeskLanguages
{
public:
    /** The setting's value for the language of the system. */
    static QString automatic();
    static const QVector<KvDeskLanguage> &all();

    /** The stored choice: automatic() or the name of a language. */
    static QString storedChoice();
    /** Stored until the program starts again; a running program keeps its language. */
    static void storeChoice(const QString &name);

    /** The name of the language to use: the stored one, or that of the system. */
    static QString effectiveName();
    /** The locale of a language; the C locale for a name that is none. */
    static QLocale localeOf(const QString &name);
};
