// SPDX-License-Identifier: MIT
#pragma once

#include <QDateTime>
#include <QString>

/** What a file was like at one moment, to notice later that another program wrote it. */
struct KvDeskFileStamp
{
    qint64 size = -1; ///< -1: there was no file
    QDateTime modified;

    static KvDeskFileStamp of(const QString &path);

    bool exists() const { return size >= 0; }
    bool operator==(const KvDeskFileStamp &other) const
    {
        return size == other.size && modified == other.modified;
    }
    bool operator!=(const KvDeskFileStamp &other) const { return !(*this == other); }
};
