// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

class QDateTime;
class QImage;
class ZtCalibration;
struct ZtFault;

/** Files of snapshots: PNG that states the size of its pixels. May be used from any thread. */
class KvDeskSnapshotFile
{
public:
    /** A path in \a folder, named after a time, that is neither a file nor one of \a taken. */
    static QString unusedPath(const QString &folder, const QDateTime &time, const QStringList &taken);

    /** States the pixel size of a calibration as the picture's resolution; without one the picture states
     * none that a reader would believe. */
    static void setPixelSize(QImage *image, const ZtCalibration &calibration);

    /** Writes the file, and its folder where there is none; a failure leaves nothing behind. */
    static bool save(const QImage &image, const QString &path, ZtFault *fault);
};
