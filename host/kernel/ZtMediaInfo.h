// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QString>
#include <QStringList>

/** Which media files the application knows, by file suffix. */
class ZT_KERNEL_EXPORT ZtMediaInfo
{
public:
    /** What a file holds. */
    enum MediaType { UnknownMedia = -1, Image = 0, Video = 1 };

    /**
     * The format's key ("png", "jpeg", "avi", ...) for a file suffix in any letter case, or an empty text.
     */
    static QString findMediaFileFormat(const QString &suffix);
    /** The MediaType of a format found by findMediaFileFormat(); UnknownMedia for any other text. */
    static int findMediaType(const QString &format);
    /** All suffixes of a media type, lower case, without the dot. */
    static QStringList suffixes(MediaType type);
};
