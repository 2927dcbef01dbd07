// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

/** Tells what a file is to the program. */
class KvDeskFileKind
{
public:
    enum Kind { Session, Image, Table };

    /** By the file's suffix; one that says nothing, or not enough, is told by the file's first bytes. */
    static Kind of(const QString &path);

    /** Whether of() is more than a guess: for a file that is there, and no folder. */
    static bool isKnown(const QString &path);

    /** Patterns for file dialogs, such as "*.png". */
    static QStringList imagePatterns();
    static QStringList tablePatterns();
};
