// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

/** What the gallery remembers. Paths are absolute. */
class KvDeskGallerySettings
{
public:
    static constexpr int maximumFolders = 6;

    /** Where snapshots are saved: "Measuring Desk" among the user's pictures unless the user chose another
     * folder. It need not exist. */
    static QString snapshotsFolder();
    static void setSnapshotsFolder(const QString &path);

    /** The folder that the gallery shows; the snapshots' one at first. */
    static QString folder();
    /** Also remembers \a path among folders(). */
    static void setFolder(const QString &path);
    /** Folders that were shown, but for the snapshots' one, the last first. */
    static QStringList folders();

    /** Whether snapshots show the measured objects. */
    static bool areMeasurementsBurntIn();
    static void setMeasurementsBurntIn(bool burntIn);
};
