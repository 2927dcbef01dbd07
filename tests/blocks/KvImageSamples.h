// SPDX-License-Identifier: MIT
#pragma once

#include <QBuffer>
#include <QImage>
#include <QPixmap>
#include <QRandomGenerator>
#include <QWidget>

/** Pictures for tests of blocks that show one. */
namespace KvImageSamples {

inline QPixmap plain(const QSize &size, const QColor &color = Qt::red)
{
    QPixmap pixmap(size);
    pixmap.fill(color);
    return pixmap;
}

/** Every pixel of another colour, which neither scaling nor a lossy encoding keeps. */
inline QPixmap noise(const QSize &size)
{
    QRandomGenerator random(4711);
    QImage image(size, QImage::Format_RGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x)
            image.setPixel(x, y, 0xff000000u | (random.generate() & 0xffffffu));
    }
    return QPixmap::fromImage(image);
}

/** The picture as a file of \a format holds it, in the letters that templates embed it with. */
inline QString base64(const QPixmap &pixmap, const char *format = "PNG")
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    pixmap.save(&buffer, format);
    return QString::fromLatin1(bytes.toBase64());
}

inline QImage pixels(const QPixmap &pixmap)
{
    return pixmap.toImage().convertToFormat(QImage::Format_ARGB32);
}

/** Whether a pixel is clearly of this colour, give or take what smoothing makes of it. */
inline bool isLike(QRgb pixel, const QColor &color)
{
    return qAlpha(pixel) > 128 && qAbs(qRed(pixel) - color.red()) < 64 &&
           qAbs(qGreen(pixel) - color.green()) < 64 && qAbs(qBlue(pixel) - color.blue()) < 64;
}

/** The smallest rectangle around all pixels of a colour. */
inline QRect areaOf(const QImage &image, const QColor &color)
{
    QRect area;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (isLike(image.pixel(x, y), color))
                area |= QRect(x, y, 1, 1);
        }
    }
    return area;
}

/** The widget as it looks at a size, on white. */
inline QImage painted(QWidget *widget, const QSize &size)
{
    widget->resize(size);
    QImage image(size, QImage::Format_ARGB32);
    image.fill(Qt::white);
    widget->render(&image, QPoint(), QRegion(), QWidget::DrawChildren);
    return image;
}

} // namespace KvImageSamples
