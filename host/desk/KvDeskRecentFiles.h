// SPDX-License-Identifier: MIT
#pragma once

#include <QStringList>

/** The sessions that were used last, newest first, kept in the settings. */
class KvDeskRecentFiles
{
public:
    static constexpr int maximumCount = 8;

    /** Absolute paths, whether the files still exist or not. */
    static QStringList paths();
    /** Puts a file first. */
    static void add(const QString &path);
    static void remove(const QString &path);
    static void clear();
};
