// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QImage>

class QPaintDevice;
class QPen;
class QColor;

/** One way to draw the data of the comparison. */
class ChartDrawing
{
public:
    ChartDrawing() = default;
    virtual ~ChartDrawing() = default;
    Q_DISABLE_COPY(ChartDrawing)

    /** Does what it takes to show data that may all have changed. */
    virtual void rebuild() = 0;
    /** Draws the picture, antialiased, \a side device units wide and high. */
    virtual void draw(QPaintDevice *device, double side) = 0;

    /** 900 x 900 pixels. */
    QImage picture();
    /** A page of A4 at 1200 dpi, of which the picture takes 8000 x 8000. */
    QByteArray pdf();

    /** One device pixel wide at any scale. */
    static QPen thinPen(const QColor &color);
    /** A thin pen with the dashes of a regression line. */
    static QPen dashedPen(const QColor &color);
};
