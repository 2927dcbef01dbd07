// SPDX-License-Identifier: MIT
#include "blocks/image/KvImageFile.h"

#include "common/ZtAppStatus.h"
#include "kernel/ZtLeftToRight.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>

namespace {

void report(const QString &message, const QString &path, const char *source)
{
    ZtAppStatus().setAndLogStatus(ZtAppStatus::Warning, 0,
                                  message.arg(ZtLeftToRight::isolated(QDir::toNativeSeparators(path))),
                                  QLatin1String(source));
}

} // namespace

namespace KvImageFile {

QPixmap load(const QString &path)
{
    if (path.isEmpty())
        return QPixmap();
    const QPixmap image = QFileInfo(path).isFile() ? QPixmap(path) : QPixmap();
    if (image.isNull())
        report(QCoreApplication::translate("KvImageFile", "Cannot read the image file %1"), path,
               "KvImageFile::load");
    return image;
}

QPixmap decode(const QByteArray &bytes, const QString &path)
{
    if (bytes.isEmpty())
        return QPixmap();
    QPixmap image;
    image.loadFromData(bytes);
    if (image.isNull())
        report(
            QCoreApplication::translate("KvImageFile", "The image that the template holds of %1 is damaged"),
            path, "KvImageFile::decode");
    return image;
}

} // namespace KvImageFile
