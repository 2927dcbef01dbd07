// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationText.h"

#include "kernel/ZtLeftToRight.h"

#include <QLocale>
#include <QStringList>

namespace {

constexpr int digits = 5;

QString number(double value)
{
    return QString::number(value, 'g', digits);
}

} // namespace

QString KvDeskCalibrationText::pixelSize(const ZtCalibration &calibration)
{
    if (!calibration.isCalibrated())
        return QString();
    const QString x = number(calibration.micrometresPerPixelX());
    const QString y = number(calibration.micrometresPerPixelY());
    return ZtLeftToRight::isolated(x == y ? tr("%1 μm", "size of a pixel").arg(x)
                                          : tr("%1 × %2 μm", "width and height of a pixel").arg(x, y));
}

QString KvDeskCalibrationText::origin(ZtCalibration::Origin origin)
{
    switch (origin) {
    case ZtCalibration::Origin::KnownDistance:
        return tr("Known distance");
    case ZtCalibration::Origin::Metadata:
        return tr("Image file");
    default:
        return tr("Typed");
    }
}

QString KvDeskCalibrationText::date(const QDateTime &date)
{
    return date.isValid() ? QLocale().toString(date.toLocalTime(), QLocale::ShortFormat) : QString();
}

QString KvDeskCalibrationText::summary(const ZtCalibration &calibration)
{
    if (!calibration.isCalibrated())
        return tr("Not calibrated");
    QStringList parts{pixelSize(calibration), calibration.objective(), origin(calibration.origin()),
                      calibration.author(), date(calibration.date())};
    parts.removeAll(QString());
    return parts.join(QStringLiteral(", "));
}
