// SPDX-License-Identifier: MIT
#include "measuring/ZtStillImageSource.h"

#include "measuring/ZtFault.h"

#include <QDir>
#include <QFileInfo>

std::unique_ptr<ZtStillImageSource> ZtStillImageSource::load(const QString &path, ZtFault *fault,
                                                             qint64 pixelLimit, ZtProgress *progress)
{
    ZtPicture picture;
    if (!ZtPictureReader::read(path, pixelLimit, &picture, fault, progress))
        return nullptr;
    return std::unique_ptr<ZtStillImageSource>(
        new ZtStillImageSource(QFileInfo(path).absoluteFilePath(), picture));
}

ZtStillImageSource::ZtStillImageSource(const QString &path, const ZtPicture &picture)
    : m_path(QDir::cleanPath(path))
    , m_picture(picture)
{}

QString ZtStillImageSource::displayName() const
{
    return QFileInfo(m_path).fileName();
}

ZtCalibration ZtStillImageSource::offeredCalibration() const
{
    const ZtOfferedPixelSize size = offeredPixelSize();
    ZtCalibration calibration(size.x, size.y);
    if (!calibration.isCalibrated())
        return calibration;
    calibration.setOrigin(ZtCalibration::Origin::Metadata);
    calibration.setName(displayName());
    return calibration;
}
