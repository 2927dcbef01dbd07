// SPDX-License-Identifier: MIT
#include "ChartDrawing.h"

#include <QBuffer>
#include <QPdfWriter>
#include <QPen>

QImage ChartDrawing::picture()
{
    constexpr int side = 900;
    QImage image(side, side, QImage::Format_ARGB32_Premultiplied);
    draw(&image, side);
    return image;
}

QByteArray ChartDrawing::pdf()
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    {
        QPdfWriter writer(&buffer);
        draw(&writer, 8000);
    }
    return buffer.data();
}

QPen ChartDrawing::thinPen(const QColor &color)
{
    QPen pen(color, 1.0);
    pen.setCosmetic(true);
    return pen;
}

QPen ChartDrawing::dashedPen(const QColor &color)
{
    QPen pen = thinPen(color);
    pen.setDashPattern({6, 8});
    return pen;
}
