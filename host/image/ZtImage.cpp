// SPDX-License-Identifier: MIT
#include "image/ZtImage.h"

ZtImage::ZtImage(const QImage &image)
    : m_image(image)
{}

QImage ZtImage::getQImage(const QRect &rect) const
{
    if (rect.isEmpty())
        return m_image;

    // QImage::copy() would fill what lies outside with transparent pixels.
    const QRect inside = rect.intersected(m_image.rect());
    if (inside.isEmpty())
        return QImage();
    return inside == m_image.rect() ? m_image : m_image.copy(inside);
}

void ZtImage::setQImage(const QImage &image)
{
    m_image = image;
}
