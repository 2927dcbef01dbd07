// SPDX-License-Identifier: MIT
#include "KvDeskThumbnailReader.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtPicture.h"
#include "measuring/ZtPictureReader.h"

#include <QImageReader>

namespace {

bool fits(const QSize &size, const QSize &largest)
{
    return size.width() <= largest.width() && size.height() <= largest.height();
}

// A line is at least one pixel high.
QSize fitted(const QSize &size, const QSize &largest)
{
    return fits(size, largest) ? size : size.scaled(largest, Qt::KeepAspectRatio).expandedTo(QSize(1, 1));
}

/// JPEG is decoded at a fraction of its size in a fraction of the time. False when the file is none.
bool readJpeg(const QString &path, const QSize &largest, KvDeskThumbnail *thumbnail)
{
    QImageReader reader(path);
    reader.setDecideFormatFromContent(true);
    reader.setAutoTransform(true);
    if (reader.format() != "jpeg" || reader.size().isEmpty())
        return false;
    // Turned by a quarter afterwards, so the size to decode is the one before.
    const bool isTurned = reader.transformation() & QImageIOHandler::TransformationRotate90;
    const QSize size = isTurned ? reader.size().transposed() : reader.size();
    const QSize scaled = fitted(size, largest);
    reader.setScaledSize(isTurned ? scaled.transposed() : scaled);
    thumbnail->image = reader.read();
    thumbnail->size = size;
    return !thumbnail->image.isNull();
}

} // namespace

KvDeskThumbnail KvDeskThumbnailReader::read(const QString &path, const QSize &largest)
{
    KvDeskThumbnail thumbnail;
    if (readJpeg(path, largest, &thumbnail))
        return thumbnail;
    ZtPicture picture;
    ZtFault fault;
    if (!ZtPictureReader::read(path, ZtPictureReader::maximumPixels, &picture, &fault)) {
        thumbnail.fault = fault.message;
        return thumbnail;
    }
    thumbnail.size = picture.image.size();
    thumbnail.image = fits(thumbnail.size, largest)
                          ? picture.image
                          : picture.image.scaled(fitted(thumbnail.size, largest), Qt::IgnoreAspectRatio,
                                                 Qt::SmoothTransformation);
    return thumbnail;
}
