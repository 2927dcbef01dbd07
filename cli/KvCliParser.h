// SPDX-License-Identifier: MIT
#pragma once

#include "KvCliArguments.h"

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
public:
    /** \a arguments start with the program's name. */
    static KvCliParseResult parse(const QStringList &arguments);
};
