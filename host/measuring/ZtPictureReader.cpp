// SPDX-License-Identifier: MIT
#include "measuring/ZtPictureReader.h"

#include "measuring/ZtDeepGrey.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtLimitedDevice.h"
#include "measuring/ZtPicture.h"
#include "measuring/ZtPixelSizeReader.h"
#include "measuring/ZtStillImageSource.h"
#include "measuring/ZtTiffReader.h"

#include <QFile>
#include <QFileInfo>
#include <QImageReader>

namespace {

/// Within so many bytes a file has to say how large its picture is. Decoders go through gigabytes of rubbish
/// for it.
constexpr qint64 headerLimit = 64 * 1024 * 1024;
/// Four colours of sixteen bits; no format takes more.
constexpr qint64 bytesPerPixel = 8;

bool fail(const QString &message, ZtFault *fault)
{
    fault->message = message;
    return false;
}

bool isUsableFile(const QFileInfo &file, ZtFault *fault)
{
    if (!file.exists())
        return fail(ZtStillImageSource::tr("The picture does not exist"), fault);
    if (file.isDir())
        return fail(ZtStillImageSource::tr("This is a folder, not a picture"), fault);
    // Devices and pipes would be read for ever.
    return file.isFile() || fail(ZtStillImageSource::tr("The picture cannot be read"), fault);
}

// A picture that says nothing has the resolution of the screen.
bool isStated(int dotsPerMetre)
{
    return dotsPerMetre > 0 && dotsPerMetre != QImage(1, 1, QImage::Format_RGB32).dotsPerMeterX();
}

ZtOfferedPixelSize pixelSizeOf(const QImage &image, const QByteArray &format)
{
    if (!isStated(image.dotsPerMeterX()) || !isStated(image.dotsPerMeterY()))
        return ZtOfferedPixelSize();
    return ZtPixelSizeReader::fromResolution(image.dotsPerMeterX(), image.dotsPerMeterY(),
                                             QString::fromLatin1(format).toUpper());
}

bool readWithQt(QFile *file, qint64 pixelLimit, ZtPicture *picture, ZtFault *fault, ZtProgress *progress)
{
    ZtLimitedDevice device(file, headerLimit, progress);
    QImageReader reader(&device);
    // A wrong file suffix must not keep a good picture from being read.
    reader.setDecideFormatFromContent(true);
    reader.setAutoTransform(true);
    // The size is known before the pixels are: a huge picture is refused before it takes memory.
    const QSize size = reader.size();
    if (size.isValid() && !ZtPictureReader::isUsableSize(size.width(), size.height(), pixelLimit, fault))
        return false;
    device.setLimit(headerLimit + size.width() * bytesPerPixel * qMax(0, size.height()));
    const QByteArray format = reader.format();
    if (!reader.read(&picture->image))
        return fail(ZtStillImageSource::tr("The picture cannot be decoded (%1)").arg(reader.errorString()),
                    fault);
    // The only decoder that leaves out what is missing without a word; others read more than they need.
    if (format == "bmp" && device.isExceeded())
        return fail(ZtStillImageSource::tr("The picture cannot be decoded (%1)")
                        .arg(ZtStillImageSource::tr("the file is too short for its picture")),
                    fault);
    picture->pixelSize = pixelSizeOf(picture->image, format);
    if (picture->image.format() == QImage::Format_Grayscale16) {
        picture->greyBits = ZtDeepGrey::significantBits(picture->image);
        picture->image = ZtDeepGrey::toEightBits(picture->image, picture->greyBits);
    }
    return ZtPictureReader::isUsableSize(picture->image.width(), picture->image.height(), pixelLimit, fault);
}

} // namespace

bool ZtPictureReader::read(const QString &path, qint64 pixelLimit, ZtPicture *picture, ZtFault *fault,
                           ZtProgress *progress)
{
    *fault = ZtFault();
    fault->file = path;
    if (!isUsableFile(QFileInfo(path), fault))
        return false;
    QFile file(path);
    // Opened, not asked: permissions on paper say little about network folders and changed users.
    if (!file.open(QIODevice::ReadOnly))
        return fail(ZtStillImageSource::tr("The picture cannot be read"), fault);
    if (file.size() == 0)
        return fail(ZtStillImageSource::tr("The picture cannot be decoded (%1)")
                        .arg(ZtStillImageSource::tr("the file is empty")),
                    fault);
    if (!ZtTiffReader::isTiff(file.peek(ZtTiffReader::headerSize)))
        return readWithQt(&file, pixelLimit, picture, fault, progress);
    ZtLimitedDevice device(&file, file.size(), progress);
    return ZtTiffReader::read(&device, pixelLimit, picture, fault);
}

bool ZtPictureReader::isUsableSize(qint64 width, qint64 height, qint64 pixelLimit, ZtFault *fault)
{
    if (width * height <= pixelLimit)
        return true;
    return fail(
        ZtStillImageSource::tr("The picture has %1 x %2 pixels, which is too many").arg(width).arg(height),
        fault);
}
