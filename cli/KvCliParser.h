// SPDX-License-Identifier: MIT
#pragma once

#include "KvCliArguments.h"

#include <QCoreApplication>

/** Outcome of reading a command line. */
struct KvCliParseResult
{
    enum Kind { Run, ShowText, UsageError };

    Kind kind = UsageError;
    QString text; ///< help or version to show, or what is wrong with the usage
    KvCliArguments arguments;
};

/** Reads command lines of statreport; prints nothing. */
class KvCliParser
{
    Q_DECLARE_TR_FUNCTIONS(KvCliParser)

public:
    /** \a arguments start with the program's name. Texts are in the language of the application's
     * translators. */
    static KvCliParseResult parse(const QStringList &arguments);
};
