// SPDX-License-Identifier: MIT
#pragma once

#include "image/ZtImageGlobal.h"

#include <QImage>
#include <QRect>

/** A picture of the host: a camera frame or an image file. Holds its pixels by value (implicitly shared). */
class ZT_IMAGE_EXPORT ZtImage
{
public:
    ZtImage() = default;
    explicit ZtImage(const QImage &image); ///< shares the pixels of \a image

    bool isNull() const { return m_image.isNull(); } ///< whether there is no picture
    QSize size() const { return m_image.size(); }    ///< in pixels

    /** The part \a rect of the picture, clipped to it; an empty rectangle means the whole picture. */
    QImage getQImage(const QRect &rect = QRect()) const;

    void setQImage(const QImage &image); ///< replaces the picture

private:
    QImage m_image;
};
