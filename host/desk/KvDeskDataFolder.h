// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QString>

/** Folders with files that come with the program. */
class KvDeskDataFolder
{
public:
    /**
     * Where one is, seen from the folder of the program; empty where there is none.
     * \param installed its path below "share" in an installation
     * \param inSources its path in the sources beside a build
     * \param entry a file or folder in it, by which it is recognised
     */
    static QString find(const QString &installed, const QString &inSources, const QString &entry,
                        const QString &programFolder = QCoreApplication::applicationDirPath());
};
