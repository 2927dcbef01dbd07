// SPDX-License-Identifier: MIT
#include "KvDeskGallerySettings.h"

#include "kernel/ZtAppSettings.h"

#include <QDir>
#include <QStandardPaths>
#include <QVariant>

namespace {

const char groupName[] = "DeskGallery";
const char snapshotsKey[] = "SnapshotsFolder";
const char folderKey[] = "Folder";
const char foldersKey[] = "Folders";
const char measurementsKey[] = "SnapshotsWithMeasurements";

QVariant value(const char *key)
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    const QVariant value = ZtAppSettings::value(QLatin1String(key));
    ZtAppSettings::endGroup();
    return value;
}

void setValue(const char *key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    ZtAppSettings::setValue(QLatin1String(key), value);
    ZtAppSettings::endGroup();
}

QString clean(const QString &path)
{
    return QDir::cleanPath(QFileInfo(path).absoluteFilePath());
}

} // namespace

QString KvDeskGallerySettings::snapshotsFolder()
{
    const QString chosen = value(snapshotsKey).toString();
    const QString pictures = QStandardPaths::writableLocation(QStandardPaths::PicturesLocation);
    return chosen.isEmpty() ? clean(pictures + QStringLiteral("/Measuring Desk")) : chosen;
}

void KvDeskGallerySettings::setSnapshotsFolder(const QString &path)
{
    setValue(snapshotsKey, clean(path));
}

QString KvDeskGallerySettings::folder()
{
    const QString shown = value(folderKey).toString();
    return shown.isEmpty() ? snapshotsFolder() : shown;
}

void KvDeskGallerySettings::setFolder(const QString &path)
{
    QStringList all = value(foldersKey).toStringList();
    all.removeAll(clean(path));
    all.prepend(clean(path));
    // One more: the snapshots' folder may be among them.
    setValue(foldersKey, QStringList(all.mid(0, maximumFolders + 1)));
    setValue(folderKey, clean(path));
}

QStringList KvDeskGallerySettings::folders()
{
    QStringList all = value(foldersKey).toStringList();
    all.removeAll(snapshotsFolder());
    return all.mid(0, maximumFolders);
}

bool KvDeskGallerySettings::areMeasurementsBurntIn()
{
    return value(measurementsKey).toBool();
}

void KvDeskGallerySettings::setMeasurementsBurntIn(bool burntIn)
{
    setValue(measurementsKey, burntIn);
}
