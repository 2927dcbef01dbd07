// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QString>

class ZtUnit;

/**
 * Texts of measured values: number, blank, unit. Numbers are written with a decimal point and without group
 * separators, whatever the system's language.
 */
class ZT_MEASURING_EXPORT ZtMeasureFormat
{
public:
    /** A finite number with \a digits significant digits (1 to 15), without an exponent where it is readable
     * so. */
    static QString significant(double value, int digits);

    /** A finite number with three decimals below 100, two below 1000, else one. */
    static QString readable(double value);

    /** As readable(), but with significant digits where that would show nothing of a number but zeros. */
    static QString shortened(double value);

    /** The text of a value in base units, in the user's unit or, when that is automatic, in a readable one.
     */
    static QString drawnText(double baseValue, int measureKind);

    /** The text of a length (\a power 1) or area (\a power 2) in pixels. */
    static QString pixelText(double value, int power);

    /**
     * The text of an imported value. As long as the settings are automatic it is \a writtenText.
     * \param baseValue   the value in base units
     * \param source      the unit in which the table gave it
     * \param writtenText number as the table wrote it, and unit
     */
    static QString importedText(double baseValue, const ZtUnit &source, const QString &writtenText);

    /** The same where people look at many values one below another: no more digits than drawn objects have,
     * unless the user chose how many. The digits that the table wrote, where those are fewer. */
    static QString importedShortText(double baseValue, const ZtUnit &source, const QString &writtenText);

    /** The unit in which a value of kind Length or Area reads best; no unit for other kinds. */
    static ZtUnit readableUnit(double baseValue, int measureKind);

    /** Number and unit with a blank between them; the number alone where there is no unit. */
    static QString withUnit(const QString &number, const QString &unitText);
    /** A name and, behind it, its value, in this order in any script of the name. */
    static QString named(const QString &name, const QString &valueText);
};
