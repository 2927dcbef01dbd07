// SPDX-License-Identifier: MIT
#include "KvDeskHalvedImage.h"

namespace {

// Formats of which four channels, or one, lie in a pixel byte by byte; all others are drawn as one of these.
QImage::Format workingFormat(const QImage &image)
{
    if (image.format() == QImage::Format_Grayscale8)
        return QImage::Format_Grayscale8;
    return image.hasAlphaChannel() ? QImage::Format_ARGB32_Premultiplied : QImage::Format_RGB32;
}

// Averages of all four bytes of a pixel at once, rounded down and up: one after the other is right on
// average.
quint32 lowerAverage(quint32 a, quint32 b)
{
    return (a & b) + (((a ^ b) & 0xfefefefeU) >> 1);
}

quint32 upperAverage(quint32 a, quint32 b)
{
    return (a | b) - (((a ^ b) & 0xfefefefeU) >> 1);
}

quint8 lowerAverage(quint8 a, quint8 b)
{
    return static_cast<quint8>((a + b) / 2);
}

quint8 upperAverage(quint8 a, quint8 b)
{
    return static_cast<quint8>((a + b + 1) / 2);
}

template <typename Pixel>
void halveRow(const Pixel *upper, const Pixel *lower, int width, Pixel *result)
{
    for (int x = 0; x < width / 2; ++x)
        result[x] = upperAverage(lowerAverage(upper[2 * x], lower[2 * x]),
                                 lowerAverage(upper[2 * x + 1], lower[2 * x + 1]));
    if (width % 2)
        result[width / 2] = lowerAverage(upper[width - 1], lower[width - 1]);
}

template <typename Pixel>
void halve(const QImage &image, QImage *result)
{
    for (int y = 0; y < result->height(); ++y) {
        const uchar *const upper = image.constScanLine(2 * y);
        const uchar *const lower = 2 * y + 1 < image.height() ? image.constScanLine(2 * y + 1) : upper;
        halveRow(reinterpret_cast<const Pixel *>(upper), reinterpret_cast<const Pixel *>(lower),
                 image.width(), reinterpret_cast<Pixel *>(result->scanLine(y)));
    }
}

void halveInto(const QImage &image, QImage *result)
{
    const QSize size((image.width() + 1) / 2, (image.height() + 1) / 2);
    if (result->size() != size || result->format() != image.format())
        *result = QImage(size, image.format());
    if (result->isNull())
        return;
    if (image.format() == QImage::Format_Grayscale8)
        halve<quint8>(image, result);
    else
        halve<quint32>(image, result);
}

} // namespace

const QImage &KvDeskHalvedImage::of(const QImage &image, int times)
{
    const QImage::Format format = workingFormat(image);
    const QImage *source = &image;
    QImage converted;
    if (image.format() != format) {
        converted = image.convertToFormat(format);
        source = &converted;
    }
    m_steps.resize(times);
    for (QImage &step : m_steps) {
        halveInto(*source, &step);
        source = &step;
    }
    return m_steps.last();
}

void KvDeskHalvedImage::clear()
{
    m_steps.clear();
}
