// SPDX-License-Identifier: MIT
#include "blocks/common/KvPictureGeometry.h"

#include <QTransform>

#include <algorithm>

namespace {

// Beyond this nothing can be seen of a picture that begins on the page.
constexpr qint64 kLargestWidth = 32767;

int shareOf(int width, int percent)
{
    // In whole numbers: 29 % of 200 is 58, but 57 when the product of two fractions is cut off.
    const qint64 share = static_cast<qint64>(width) * percent / 100;
    return static_cast<int>(std::clamp(share, qint64(0), kLargestWidth));
}

} // namespace

namespace KvPictureGeometry {

QSize turned(const QSize &picture, int degrees)
{
    const QRectF turned = QTransform().rotate(degrees % 360).mapRect(QRectF(QPointF(0, 0), picture));
    return turned.size().toSize();
}

QSize fitted(const QSize &picture, const QSize &room, int widthPercent)
{
    const QSize target(shareOf(room.width(), widthPercent), room.height());
    if (picture.isEmpty() || target.isEmpty())
        return QSize(0, 0);
    // Very long and narrow pictures stay visible as a line.
    return picture.scaled(target, Qt::KeepAspectRatio).expandedTo(QSize(1, 1));
}

QSize blockSize(const QSize &picture, const QSize &room, int widthPercent)
{
    return QSize(room.width(), std::max(fitted(picture, room, widthPercent).height(), MinimumHeight));
}

QRect placed(const QSize &picture, const QSize &room, int widthPercent, Qt::Alignment alignment)
{
    const QSize size = fitted(picture, room, widthPercent);
    const int free = room.width() - size.width();
    int x = 0;
    if (alignment.testFlag(Qt::AlignHCenter))
        x = free / 2;
    else if (alignment.testFlag(Qt::AlignRight))
        x = free;
    return QRect(QPoint(x, 0), size);
}

} // namespace KvPictureGeometry
