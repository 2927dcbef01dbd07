// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QVariant>

/**
 * Turns measured numbers into display texts with an automatically chosen unit and the user's significant
 * digits, so that the same measurement reads the same everywhere. Measure kinds: 1 length, 2 area, 3 angle, 4
 * count, 5 percentage; any other has no unit. Base units are the micrometre and the square micrometre.
 */
class KvStatisticsUnitConverter
{
public:
    enum Unit {
        NoUnit = 0,
        AutomaticUnit = 1, ///< replaced by autoUnit() before use
        Nanometre = 2,
        Micrometre = 3,
        Millimetre = 4,
        Centimetre = 5,
        Metre = 6,
        SquareNanometre = 7,
        SquareMicrometre = 8,
        SquareMillimetre = 9,
        SquareCentimetre = 10,
        SquareMetre = 11,
        Degree = 12,
        Pieces = 13,
        Percent = 14
    };

    /** The unit in which a base value reads best. Zero and negative lengths get the smallest unit. */
    static int autoUnit(double value, int measureKind);
    /** One unit for a range of values: between the units of its two ends. */
    static int commonUnit(double low, double high, int measureKind);
    /** A base value in \a unit; unchanged for kinds other than length and area. NaN for a negative area. */
    static double convert(double value, int measureKind, int unit);

    /** Number text by the setting "Measurement"/"MeasurementLabelsSignDigits", read at each call. */
    static QString formatNumber(double value);
    /** The same for given significant digits; 0 means a fixed ladder of decimals, above 300 counts as 300. */
    static QString formatNumber(double value, uint significantDigits);

    /** Text of a unit code; empty for the automatic unit and for unknown codes. */
    static QString unitText(int unit);
    /** The display text of a value: number, one blank, unit text. The blank is there without a unit, too. */
    static QString formatValue(const QVariant &value, int measureKind, int unit);
};
