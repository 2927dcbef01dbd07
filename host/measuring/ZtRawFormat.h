// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QtGlobal>

#include <optional>

/** How an industrial camera lays out its pixels. */
struct ZT_MEASURING_EXPORT ZtRawFormat
{
    enum Kind {
        Mono,
        Rgb,     ///< red first, eight bits per colour
        Bgr,     ///< blue first, eight bits per colour
        BayerRg, ///< one colour per pixel; named after the first two of the first row
        BayerGr,
        BayerGb,
        BayerBg
    };

    Kind kind = Mono;
    int bits = 8; ///< per value: 8, or 10 to 16 in two bytes, the lower byte first

    bool isBayer() const { return kind >= BayerRg; }
    int bytesPerPixel() const;

    /** By the number of the pixel format in the naming convention of GenICam; nothing for formats that are
     * not shown. */
    static std::optional<ZtRawFormat> fromGenicam(quint32 pixelFormat);

    bool operator==(const ZtRawFormat &other) const { return kind == other.kind && bits == other.bits; }
};
