// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"

#include <QCoreApplication>

/** How calibrations read. */
class KvDeskCalibrationText
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskCalibrationText)
public:
    /** The size of a pixel: once where both directions read the same; empty when uncalibrated. */
    static QString pixelSize(const ZtCalibration &calibration);
    static QString origin(ZtCalibration::Origin origin);
    /** In the user's time zone; empty for no date. */
    static QString date(const QDateTime &date);
    /** Everything in one line, as far as it is known: what pixel size, which objective, by whom and when. */
    static QString summary(const ZtCalibration &calibration);
};
