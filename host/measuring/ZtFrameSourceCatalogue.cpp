// SPDX-License-Identifier: MIT
#include "measuring/ZtFrameSourceCatalogue.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtImageFolderSource.h"
#include "measuring/ZtStillImageSource.h"

#ifdef ZT_HAS_MULTIMEDIA
#include "measuring/ZtUvcCameraSource.h"
#include "measuring/ZtVideoFileSource.h"
#endif
#ifdef ZT_HAS_ARAVIS
#include "measuring/ZtAravisSource.h"
#endif

#include <QCoreApplication>
#include <QFileInfo>

namespace {

std::unique_ptr<ZtFrameSource> openVideo(const QString &path, ZtFault *fault)
{
#ifdef ZT_HAS_MULTIMEDIA
    return ZtVideoFileSource::load(path, fault);
#else
    fault->file = path;
    fault->message = QCoreApplication::translate("ZtFrameSourceCatalogue", "This program cannot play videos");
    return nullptr;
#endif
}

std::unique_ptr<ZtFrameSource> openCamera(const ZtFrameSourceInfo &info, ZtFault *fault)
{
#ifdef ZT_HAS_MULTIMEDIA
    if (info.kind == ZtFrameSourceInfo::UvcCamera)
        return std::make_unique<ZtUvcCameraSource>(info);
#endif
#ifdef ZT_HAS_ARAVIS
    if (info.kind == ZtFrameSourceInfo::GenicamCamera)
        return std::make_unique<ZtAravisSource>(info);
#endif
    fault->file = info.title;
    fault->message =
        QCoreApplication::translate("ZtFrameSourceCatalogue", "This program knows no cameras of this kind");
    return nullptr;
}

} // namespace

bool ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::Kind kind)
{
    switch (kind) {
    case ZtFrameSourceInfo::VideoFile:
    case ZtFrameSourceInfo::UvcCamera:
#ifdef ZT_HAS_MULTIMEDIA
        return true;
#else
        return false;
#endif
    case ZtFrameSourceInfo::GenicamCamera:
#ifdef ZT_HAS_ARAVIS
        return true;
#else
        return false;
#endif
    default:
        return true;
    }
}

QVector<ZtFrameSourceInfo> ZtFrameSourceCatalogue::list()
{
    return listSystemCameras() + listNetworkCameras();
}

QVector<ZtFrameSourceInfo> ZtFrameSourceCatalogue::listSystemCameras()
{
#ifdef ZT_HAS_MULTIMEDIA
    return ZtUvcCameraSource::devices();
#else
    return {};
#endif
}

QVector<ZtFrameSourceInfo> ZtFrameSourceCatalogue::listNetworkCameras()
{
#ifdef ZT_HAS_ARAVIS
    return ZtAravisSource::devices();
#else
    return {};
#endif
}

bool ZtFrameSourceCatalogue::enableFakeCamera()
{
#ifdef ZT_HAS_ARAVIS
    ZtAravisSource::enableFakeCamera();
    return true;
#else
    return false;
#endif
}

std::unique_ptr<ZtFrameSource> ZtFrameSourceCatalogue::open(const ZtFrameSourceInfo &info, ZtFault *fault)
{
    *fault = ZtFault();
    switch (info.kind) {
    case ZtFrameSourceInfo::StillImage:
        return ZtStillImageSource::load(info.id, fault);
    case ZtFrameSourceInfo::ImageFolder:
        return ZtImageFolderSource::load(info.id, fault);
    case ZtFrameSourceInfo::VideoFile:
        return openVideo(info.id, fault);
    default:
        return openCamera(info, fault);
    }
}

std::unique_ptr<ZtFrameSource> ZtFrameSourceCatalogue::openPath(const QString &path, ZtFault *fault)
{
    return open(infoOfPath(path), fault);
}

ZtFrameSourceInfo ZtFrameSourceCatalogue::infoOfPath(const QString &path)
{
    const QFileInfo file(path);
    ZtFrameSourceInfo::Kind kind = ZtFrameSourceInfo::StillImage;
    if (file.isDir())
        kind = ZtFrameSourceInfo::ImageFolder;
    else if (videoSuffixes().contains(file.suffix().toLower()))
        kind = ZtFrameSourceInfo::VideoFile;
    return {kind, path, file.fileName()};
}

QStringList ZtFrameSourceCatalogue::videoSuffixes()
{
    if (!isAvailable(ZtFrameSourceInfo::VideoFile))
        return {};
    return {QStringLiteral("avi"), QStringLiteral("mp4"),  QStringLiteral("m4v"), QStringLiteral("mov"),
            QStringLiteral("mkv"), QStringLiteral("webm"), QStringLiteral("mpg"), QStringLiteral("mpeg"),
            QStringLiteral("ogv"), QStringLiteral("wmv")};
}
