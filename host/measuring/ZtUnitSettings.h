// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtUnit.h"

#include <QList>
#include <QObject>
#include <QStringList>
#include <QVariant>

/**
 * The user's settings for the texts of measured values, read once and kept until they change.
 *
 * Group "Measurement": "MeasurementLabelsSignDigits" (unsigned, 0 is automatic), "LengthUnit" ("auto", "nm",
 * "um", "mm", "cm", "m"), "AngleUnit" ("auto", "deg", "rad"). When a unit changes, ZtSignalCenter announces
 * it. GUI thread only.
 */
class ZT_MEASURING_EXPORT ZtUnitSettings : public QObject
{
    Q_OBJECT
public:
    static ZtUnitSettings *getInstance();

    /** Significant digits of shown numbers, 1 to 15; 0 leaves the choice to the text. */
    int significantDigits() const { return m_digits; }

    /** The unit the user chose for values of a kind; no unit when the choice is automatic or the kind has
     * none. */
    const ZtUnit &chosenUnit(int measureKind) const;

    /** Reads the settings again and announces changed units. */
    void reload();

private slots:
    void slotValuesModified(QStringList aKeys, QList<QVariant> aVals);
    void slotProfileChanged();

private:
    ZtUnitSettings();

    void read();

    int m_digits = 0;
    ZtUnit m_length;
    ZtUnit m_area;
    ZtUnit m_angle;
};
