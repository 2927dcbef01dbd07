// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QCoreApplication>
#include <QJsonObject>

class ZtCalibration;
struct ZtFault;

/** Calibrations as session files and settings hold them. */
class ZT_MEASURING_EXPORT ZtCalibrationJson
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
public:
    /** Of a calibration with a pixel size; texts that are empty are left out. */
    static QJsonObject toJson(const ZtCalibration &calibration);

    /** False with place and message of the first fault found; then \a calibration is untouched. Both pixel
     * sizes are needed, all else may be missing. */
    static bool read(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault);

private:
    static bool readPixelSize(const QJsonObject &json, const QString &key, double *size, ZtFault *fault);
    static bool readText(const QJsonObject &json, const QString &key, QString *text, ZtFault *fault);
    static bool readDate(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault);
    static bool readOrigin(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault);
    static bool readTexts(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault);
};
