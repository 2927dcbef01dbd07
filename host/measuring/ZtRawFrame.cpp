// SPDX-License-Identifier: MIT
#include "measuring/ZtRawFrame.h"

#include "measuring/ZtFramePool.h"

#include <QtEndian>

namespace {

quint32 valueAt(const uchar *line, int x)
{
    return line[x];
}

quint32 deepValueAt(const uchar *line, int x)
{
    return qFromLittleEndian<quint16>(line + 2 * x);
}

template <quint32 (*Value)(const uchar *, int)>
void showMono(const ZtRawFrame &frame, QImage *image)
{
    const int shift = frame.format.bits - 8;
    for (int y = 0; y < frame.height; ++y) {
        const uchar *const from = frame.data + y * frame.bytesPerLine;
        auto *const to = reinterpret_cast<QRgb *>(image->scanLine(y));
        for (int x = 0; x < frame.width; ++x)
            to[x] = 0xFF000000U | 0x00010101U * qMin(Value(from, x) >> shift, 255U);
    }
}

void showColours(const ZtRawFrame &frame, QImage *image)
{
    const int red = frame.format.kind == ZtRawFormat::Rgb ? 0 : 2;
    for (int y = 0; y < frame.height; ++y) {
        const uchar *from = frame.data + y * frame.bytesPerLine;
        auto *const to = reinterpret_cast<QRgb *>(image->scanLine(y));
        for (int x = 0; x < frame.width; ++x, from += 3)
            to[x] = qRgb(from[red], from[1], from[2 - red]);
    }
}

/// Three rows around a pixel and the columns beside it, mirrored at the borders, which keeps the pattern.
template <quint32 (*Value)(const uchar *, int)>
struct Surrounding
{
    const uchar *above;
    const uchar *line;
    const uchar *below;
    int left;
    int x;
    int right;

    quint32 centre() const { return Value(line, x); }
    quint32 level() const { return (Value(line, left) + Value(line, right)) / 2; }
    quint32 upright() const { return (Value(above, x) + Value(below, x)) / 2; }
    quint32 cross() const
    {
        return (Value(line, left) + Value(line, right) + Value(above, x) + Value(below, x)) / 4;
    }
    quint32 diagonal() const
    {
        return (Value(above, left) + Value(above, right) + Value(below, left) + Value(below, right)) / 4;
    }
};

int mirrored(int position, int count)
{
    if (position < 0)
        return qMin(1, count - 1);
    return position < count ? position : qMax(0, count - 2);
}

template <quint32 (*Value)(const uchar *, int)>
class BayerDecoder
{
public:
    BayerDecoder(const ZtRawFrame &frame, QImage *image)
        : m_frame(frame)
        , m_image(image)
        , m_shift(frame.format.bits - 8)
        , m_redX(frame.format.kind == ZtRawFormat::BayerGr || frame.format.kind == ZtRawFormat::BayerBg)
        , m_redY(frame.format.kind == ZtRawFormat::BayerGb || frame.format.kind == ZtRawFormat::BayerBg)
    {}

    void decode() const
    {
        for (int y = 0; y < m_frame.height; ++y)
            decodeLine(y);
    }

private:
    const uchar *lineAt(int y) const
    {
        return m_frame.data + mirrored(y, m_frame.height) * m_frame.bytesPerLine;
    }

    void decodeLine(int y) const
    {
        Surrounding<Value> around{lineAt(y - 1), lineAt(y), lineAt(y + 1), 0, 0, 0};
        auto *const to = reinterpret_cast<QRgb *>(m_image->scanLine(y));
        const bool isRedLine = ((y & 1) != 0) == m_redY;
        for (int x = 0; x < m_frame.width; ++x) {
            around.left = x > 0 ? x - 1 : mirrored(-1, m_frame.width);
            around.x = x;
            around.right = x + 1 < m_frame.width ? x + 1 : mirrored(x + 1, m_frame.width);
            const bool isRedColumn = ((x & 1) != 0) == m_redX;
            to[x] = isRedLine ? colour(around, isRedColumn) : swapped(colour(around, !isRedColumn));
        }
    }

    // The pixel in a line with red values: at one of them, or at the green beside it.
    QRgb colour(const Surrounding<Value> &around, bool isAtRed) const
    {
        if (isAtRed)
            return rgb(around.centre(), around.cross(), around.diagonal());
        return rgb(around.level(), around.centre(), around.upright());
    }

    // Lines with blue values are the same with the colours exchanged.
    static QRgb swapped(QRgb colour) { return qRgb(qBlue(colour), qGreen(colour), qRed(colour)); }

    QRgb rgb(quint32 red, quint32 green, quint32 blue) const
    {
        return 0xFF000000U | shown(red) << 16 | shown(green) << 8 | shown(blue);
    }

    quint32 shown(quint32 value) const { return qMin(value >> m_shift, 255U); }

    const ZtRawFrame &m_frame;
    QImage *m_image;
    int m_shift;
    bool m_redX; ///< whether red values are in the odd columns
    bool m_redY; ///< whether red values are in the odd rows
};

} // namespace

bool ZtRawFrame::isComplete() const
{
    if (!data || width <= 0 || height <= 0)
        return false;
    const qint64 used = static_cast<qint64>(width) * format.bytesPerPixel();
    // Divided, as the product may be beyond all numbers.
    return bytesPerLine >= used && size >= used && (size - used) / bytesPerLine >= height - 1;
}

QImage ZtRawFrame::toImage(ZtFramePool *pool) const
{
    if (!isComplete())
        return QImage();
    const QSize pixels(width, height);
    QImage image = pool ? pool->take(pixels, QImage::Format_RGB32) : QImage(pixels, QImage::Format_RGB32);
    if (image.isNull())
        return image;
    show(&image);
    if (pool)
        pool->keep(image);
    return image;
}

void ZtRawFrame::show(QImage *image) const
{
    const bool isDeep = format.bits > 8;
    if (format.kind == ZtRawFormat::Rgb || format.kind == ZtRawFormat::Bgr)
        showColours(*this, image);
    else if (!format.isBayer())
        isDeep ? showMono<deepValueAt>(*this, image) : showMono<valueAt>(*this, image);
    else if (isDeep)
        BayerDecoder<deepValueAt>(*this, image).decode();
    else
        BayerDecoder<valueAt>(*this, image).decode();
}
