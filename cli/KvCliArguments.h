// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

/** What a command line asked for. */
struct KvCliArguments
{
    enum Command { NoCommand, Render, Stats, Check, Blocks };
    enum Format { Text, Csv, Json };

    Command command = NoCommand;
    QString templatePath; ///< "-" is standard input
    QString sessionPath;  ///< "-" is standard input
    QString tablePath;    ///< "-" is standard input
    QString imagePath;
    QString outputPath; ///< "-" is standard output
    QStringList units;  ///< "mm" or "Area=mm2"
    QString typeColumn;
    QString nameColumn;
    QString decimalMark; ///< "", "point" or "comma"
    uint digits = 0;     ///< significant digits of shown values; 0 is automatic
    bool groupByObject = true;
    Format format = Text;
    bool jsonErrors = false;
    bool quiet = false;

    /** Whether the result is for programs, which know names in English only. */
    bool isForPrograms() const { return format != Text; }
};
