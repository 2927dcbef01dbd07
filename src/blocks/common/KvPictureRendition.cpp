// SPDX-License-Identifier: MIT
#include "blocks/common/KvPictureRendition.h"

#include <QPaintEngine>
#include <QPainter>
#include <QTransform>

namespace {

QPixmap turned(const QPixmap &picture, int degrees)
{
    // Quarter turns only move pixels; nothing is lost.
    return degrees % 360 == 0 ? picture
                              : picture.transformed(QTransform().rotate(degrees), Qt::SmoothTransformation);
}

bool paintsPixels(const QPainter &painter)
{
    // Not by the device: widgets in a scene share the painter of the scene's view or of the report's file.
    return painter.paintEngine()->type() == QPaintEngine::Raster;
}

QPixmap shrunk(const QPixmap &picture, const QSize &size)
{
    if (size.width() >= picture.width() || size.height() >= picture.height())
        return picture;
    return picture.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
}

} // namespace

QPixmap KvPictureRendition::make(const QPixmap &picture, int degrees, const QSize &size,
                                 const QPainter &painter)
{
    if (!paintsPixels(painter))
        return turned(picture, degrees);
    const QSize deviceSize =
        painter.deviceTransform().mapRect(QRectF(QPointF(0, 0), size)).size().toSize().expandedTo({1, 1});
    if (m_pixmap.isNull() || m_pictureKey != picture.cacheKey() || m_degrees != degrees ||
        m_deviceSize != deviceSize) {
        m_pixmap = shrunk(turned(picture, degrees), deviceSize);
        m_pictureKey = picture.cacheKey();
        m_degrees = degrees;
        m_deviceSize = deviceSize;
    }
    return m_pixmap;
}
