// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskThumbnail.h"

/** Makes thumbnails. May be used from any thread. */
class KvDeskThumbnailReader
{
public:
    /** Large enough for the gallery on a screen at up to 200 %. */
    static constexpr QSize usual = QSize(256, 192);

    /** Thumbnails fit into \a largest, with the proportions of the picture; small pictures are not enlarged.
     */
    static KvDeskThumbnail read(const QString &path, const QSize &largest = usual);
};
