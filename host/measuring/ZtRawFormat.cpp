// SPDX-License-Identifier: MIT
#include "measuring/ZtRawFormat.h"

namespace {

struct GenicamFormat
{
    quint32 number;
    ZtRawFormat format;
};

const GenicamFormat genicamFormats[] = {
    {0x01080001, {ZtRawFormat::Mono, 8}},     {0x01100003, {ZtRawFormat::Mono, 10}},
    {0x01100005, {ZtRawFormat::Mono, 12}},    {0x01100025, {ZtRawFormat::Mono, 14}},
    {0x01100007, {ZtRawFormat::Mono, 16}},    {0x02180014, {ZtRawFormat::Rgb, 8}},
    {0x02180015, {ZtRawFormat::Bgr, 8}},      {0x01080008, {ZtRawFormat::BayerGr, 8}},
    {0x01080009, {ZtRawFormat::BayerRg, 8}},  {0x0108000A, {ZtRawFormat::BayerGb, 8}},
    {0x0108000B, {ZtRawFormat::BayerBg, 8}},  {0x0110000C, {ZtRawFormat::BayerGr, 10}},
    {0x0110000D, {ZtRawFormat::BayerRg, 10}}, {0x0110000E, {ZtRawFormat::BayerGb, 10}},
    {0x0110000F, {ZtRawFormat::BayerBg, 10}}, {0x01100010, {ZtRawFormat::BayerGr, 12}},
    {0x01100011, {ZtRawFormat::BayerRg, 12}}, {0x01100012, {ZtRawFormat::BayerGb, 12}},
    {0x01100013, {ZtRawFormat::BayerBg, 12}}, {0x0110002E, {ZtRawFormat::BayerGr, 16}},
    {0x0110002F, {ZtRawFormat::BayerRg, 16}}, {0x01100030, {ZtRawFormat::BayerGb, 16}},
    {0x01100031, {ZtRawFormat::BayerBg, 16}},
};

} // namespace

int ZtRawFormat::bytesPerPixel() const
{
    if (kind == Rgb || kind == Bgr)
        return 3;
    return bits > 8 ? 2 : 1;
}

std::optional<ZtRawFormat> ZtRawFormat::fromGenicam(quint32 pixelFormat)
{
    for (const GenicamFormat &entry : genicamFormats) {
        if (entry.number == pixelFormat)
            return entry.format;
    }
    return std::nullopt;
}
