// SPDX-License-Identifier: MIT
#pragma once

#include <QDateTime>
#include <QString>

/** A picture file in the folder that the gallery shows. */
struct KvDeskGalleryEntry
{
    QString name;      ///< without the folder
    QDateTime changed; ///< when it was written last
    qint64 bytes = 0;

    /** Whether it is the same file with the same contents, as far as the folder tells. */
    bool operator==(const KvDeskGalleryEntry &other) const
    {
        return name == other.name && changed == other.changed && bytes == other.bytes;
    }
    bool operator!=(const KvDeskGalleryEntry &other) const { return !(*this == other); }
};
