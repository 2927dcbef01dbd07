// SPDX-License-Identifier: MIT
#include "KvDeskSnapshotFile.h"

#include "measuring/ZtCalibration.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtFileFault.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>
#include <QImage>
#include <QSaveFile>

namespace {

constexpr double micrometresPerMetre = 1e6;
/// 96 dots per inch is what pictures have whose resolution means nothing.
constexpr int meaninglessResolution = 3780;

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskSnapshotFile)
};

int dotsPerMetre(double micrometresPerPixel)
{
    const double dots = micrometresPerMetre / micrometresPerPixel;
    const bool canBeStated = dots >= 1.0 && dots < std::numeric_limits<int>::max();
    return canBeStated ? qRound(dots) : meaninglessResolution;
}

bool fail(const QString &message, ZtFault *fault)
{
    fault->message = message;
    return false;
}

} // namespace

QString KvDeskSnapshotFile::unusedPath(const QString &folder, const QDateTime &time, const QStringList &taken)
{
    const QString base = folder + QLatin1Char('/') + time.toString(QStringLiteral("yyyy-MM-dd HH-mm-ss"));
    QString path = base + QStringLiteral(".png");
    for (int i = 2; QFileInfo::exists(path) || taken.contains(path); ++i)
        path = QStringLiteral("%1 (%2).png").arg(base).arg(i);
    return path;
}

void KvDeskSnapshotFile::setPixelSize(QImage *image, const ZtCalibration &calibration)
{
    const bool isKnown = calibration.isCalibrated();
    image->setDotsPerMeterX(isKnown ? dotsPerMetre(calibration.micrometresPerPixelX())
                                    : meaninglessResolution);
    image->setDotsPerMeterY(isKnown ? dotsPerMetre(calibration.micrometresPerPixelY())
                                    : meaninglessResolution);
}

bool KvDeskSnapshotFile::save(const QImage &image, const QString &path, ZtFault *fault)
{
    *fault = ZtFault();
    fault->file = path;
    if (!QDir().mkpath(QFileInfo(path).path()))
        return fail(Text::tr("The folder cannot be created"), fault);
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly))
        return fail(ZtFileFault::text(file), fault);
    if (!image.save(&file, "PNG")) {
        const bool isRefused = file.error() != QFileDevice::NoError;
        return fail(isRefused ? ZtFileFault::text(file) : Text::tr("The picture cannot be encoded"), fault);
    }
    return file.commit() || fail(ZtFileFault::text(file), fault);
}
