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
    explicit ZtImage(const QImage &image);

    bool isNull() const { return m_image.isNull(); }
    QSize size() const { return m_image.size(); }

    /** The part \a rect of the picture, clipped to it; an empty rectangle means the whole picture. */
    QImage getQImage(const QRect &rect = QRect()) const;

    void setQImage(const QImage &image);

private:
    QImage m_image;
};
