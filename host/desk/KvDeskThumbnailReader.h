// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskThumbnail.h"

/** Makes thumbnails. May be used from any thread. */
class KvDeskThumbnailReader
{
public:
    /** Thumbnails fit into this, with the proportions of the picture; small pictures are not enlarged. */
    static constexpr QSize largest = QSize(256, 192);

    static KvDeskThumbnail read(const QString &path);
};
