// SPDX-License-Identifier: MIT
#pragma once

#include <QPixmap>

class QPainter;

/**
 * A picture made ready to be drawn: turned, and for the screen no larger than it is shown.
 *
 * Scaling a camera's picture takes far longer than drawing it, so the screen's rendition is kept until
 * picture, rotation or size change. On paper every pixel is wanted: there the picture is only turned.
 */
class KvPictureRendition
{
public:
    /** \a picture turned by \a degrees, to be drawn by \a painter into a rectangle of \a size. */
    QPixmap make(const QPixmap &picture, int degrees, const QSize &size, const QPainter &painter);

private:
    QPixmap m_pixmap;
    qint64 m_pictureKey = 0;
    int m_degrees = 0;
    QSize m_deviceSize;
};
