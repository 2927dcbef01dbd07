// SPDX-License-Identifier: MIT
#include "measuring/ZtDeepGrey.h"

#include <QImage>

#include <algorithm>

namespace {

const quint16 *deepLine(const QImage &deep, int y)
{
    return reinterpret_cast<const quint16 *>(deep.constScanLine(y));
}

} // namespace

int ZtDeepGrey::significantBits(const QImage &deep)
{
    unsigned used = 0;
    for (int y = 0; y < deep.height(); ++y) {
        const quint16 *const line = deepLine(deep, y);
        for (int x = 0; x < deep.width(); ++x)
            used |= line[x];
    }
    int bits = 8;
    while (used >> bits)
        ++bits;
    return bits;
}

QImage ZtDeepGrey::toEightBits(const QImage &deep, int bits)
{
    QImage shown(deep.size(), QImage::Format_Grayscale8);
    if (shown.isNull())
        return shown;
    shown.setDotsPerMeterX(deep.dotsPerMeterX());
    shown.setDotsPerMeterY(deep.dotsPerMeterY());
    const unsigned white = (1U << bits) - 1U;
    for (int y = 0; y < deep.height(); ++y) {
        const quint16 *const from = deepLine(deep, y);
        uchar *const to = shown.scanLine(y);
        for (int x = 0; x < deep.width(); ++x)
            to[x] = static_cast<uchar>((std::min<unsigned>(from[x], white) * 255U + white / 2U) / white);
    }
    return shown;
}
