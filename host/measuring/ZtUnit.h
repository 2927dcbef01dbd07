// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QString>

/**
 * A unit: what it measures, its factor to the base unit, and the text shown to the user.
 *
 * Base units are micrometre, square micrometre, degree, piece and percent. A text that is none of the known
 * units ("g", "px") is a unit without a kind: factor 1, shown as written.
 */
class ZT_MEASURING_EXPORT ZtUnit
{
public:
    /** No unit at all: kind NoKind, factor 1, empty text. */
    ZtUnit() = default;
    ZtUnit(int kind, double factor, const QString &text);

    /**
     * The unit that a table, a file or an option names. Symbols are compared as written ("m" is not "M"),
     * words in any letter case; a blank text is no unit.
     */
    static ZtUnit parse(const QString &text);

    /** The area of a square with a side of one unit; the unit itself when it is no unit. */
    ZtUnit squared() const;

    int kind() const { return m_kind; } ///< ZtGsManipulator::MeasureKind
    double factor() const { return m_factor; }
    QString text() const { return m_text; }
    bool isEmpty() const { return m_text.isEmpty(); }

    double toBase(double value) const { return value * m_factor; }
    double fromBase(double value) const { return value / m_factor; }

    bool operator==(const ZtUnit &other) const { return m_kind == other.m_kind && m_text == other.m_text; }
    bool operator!=(const ZtUnit &other) const { return !(*this == other); }

private:
    int m_kind = 0;
    double m_factor = 1.0;
    QString m_text;
};
