// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QMap>
#include <QObject>
#include <QStringList>
#include <QVector>

/**
 * The calibrations of the microscope's objectives, kept in the current profile of the settings.
 *
 * Nothing is ever changed or removed: a new calibration of an objective is one more entry, and the newest is
 * the current one. Programs that run at the same time do not overwrite each other's entries. Entries that
 * cannot be understood are reported to the status log and left out, but stay in the settings.
 *
 * Group "Calibrations": "Author", "Objective"; group "Calibrations/History": one JSON text per entry, under
 * keys that sort by the time they were added. GUI thread only.
 */
class ZT_MEASURING_EXPORT ZtCalibrationStore : public QObject
{
    Q_OBJECT
public:
    explicit ZtCalibrationStore(QObject *parent = nullptr);

    /** Objectives that were calibrated, as people sort them: "5x" before "10x". That without a name is left
     * out. */
    QStringList objectives() const;
    /** All calibrations of an objective, the newest first. */
    QVector<ZtCalibration> history(const QString &objective) const;
    /** The newest calibration of an objective; uncalibrated where there is none. */
    ZtCalibration current(const QString &objective) const;

    /** Adds an entry, which becomes the current one of its objective; false for one without a pixel size. */
    bool append(const ZtCalibration &calibration);

    /** Who calibrated last. */
    QString author() const;
    void setAuthor(const QString &author);
    /** The objective that was used last. */
    QString lastObjective() const;
    void setLastObjective(const QString &objective);

signals:
    void signalChanged(); ///< there are other entries now

private slots:
    void slotProfileChanged();

private:
    void load();
    void readEntry(const QString &key, const QString &text);
    QString newKey() const;

    QMap<QString, ZtCalibration> m_entries; ///< by their keys
};
