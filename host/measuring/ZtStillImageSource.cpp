// SPDX-License-Identifier: MIT
#include "measuring/ZtStillImageSource.h"

#include "measuring/ZtFault.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QImageReader>

#include <algorithm>
#include <cmath>

namespace {

constexpr double inchesPerMetre = 1000.0 / 25.4;

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
    // Opened, not asked: permissions on paper say little about network folders and changed users.
    return QFile(file.filePath()).open(QIODevice::ReadOnly) ||
           fail(ZtStillImageSource::tr("The picture cannot be read"), fault);
}

bool isUsableSize(const QSize &size, qint64 pixelLimit, ZtFault *fault)
{
    if (static_cast<qint64>(size.width()) * size.height() <= pixelLimit)
        return true;
    return fail(ZtStillImageSource::tr("The picture has %1 x %2 pixels, which is too many")
                    .arg(size.width())
                    .arg(size.height()),
                fault);
}

bool decode(const QString &path, qint64 pixelLimit, QImage *image, ZtFault *fault)
{
    QImageReader reader(path);
    // A wrong file suffix must not keep a good picture from being read.
    reader.setDecideFormatFromContent(true);
    reader.setAutoTransform(true);
    // The size is known before the pixels are: a huge picture is refused before it takes memory.
    if (reader.size().isValid() && !isUsableSize(reader.size(), pixelLimit, fault))
        return false;
    if (!reader.read(image))
        return fail(ZtStillImageSource::tr("The picture cannot be decoded (%1)").arg(reader.errorString()),
                    fault);
    return isUsableSize(image->size(), pixelLimit, fault);
}

// Resolutions of screens, which programs write without meaning them, also those of screens scaled by 1.25
// to 2.
bool isMeaninglessResolution(int dotsPerMetre)
{
    if (dotsPerMetre <= 0 || dotsPerMetre == QImage(1, 1, QImage::Format_RGB32).dotsPerMeterX())
        return true;
    const double dpi = dotsPerMetre / inchesPerMetre;
    // Resolutions are whole dots per metre, so 72 dpi comes as 2834 or 2835.
    const auto isScreen = [dpi](double screen) { return std::abs(dpi - screen) < 0.1; };
    const auto screens = {72.0, 96.0, 120.0, 144.0, 192.0};
    return std::any_of(screens.begin(), screens.end(), isScreen);
}

} // namespace

std::unique_ptr<ZtStillImageSource> ZtStillImageSource::load(const QString &path, ZtFault *fault,
                                                             qint64 pixelLimit)
{
    *fault = ZtFault();
    fault->file = path;
    QImage image;
    if (!isUsableFile(QFileInfo(path), fault) || !decode(path, pixelLimit, &image, fault))
        return nullptr;
    return std::unique_ptr<ZtStillImageSource>(
        new ZtStillImageSource(QFileInfo(path).absoluteFilePath(), image));
}

ZtStillImageSource::ZtStillImageSource(const QString &path, const QImage &image)
    : m_path(QDir::cleanPath(path))
    , m_image(image)
{}

QString ZtStillImageSource::displayName() const
{
    return QFileInfo(m_path).fileName();
}

ZtCalibration ZtStillImageSource::offeredCalibration() const
{
    const int x = m_image.dotsPerMeterX();
    const int y = m_image.dotsPerMeterY();
    if (isMeaninglessResolution(x) || std::abs(x - y) > 0.01 * x)
        return ZtCalibration();
    return ZtCalibration(1e6 / x);
}
