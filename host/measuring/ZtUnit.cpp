// SPDX-License-Identifier: MIT
#include "measuring/ZtUnit.h"

#include "kernel/ZtGsManipulator.h"

#include <QtMath>

namespace {

struct LengthSymbol
{
    const char *written; // UTF-8
    const char *shown;   // UTF-8
    double micrometres;
};

// The micro sign U+00B5 and the Greek mu U+03BC look alike; the Greek letter is the one shown.
const LengthSymbol lengthSymbols[] = {
    {"nm", "nm", 0.001},  {"um", "\u03BCm", 1.0}, {"\u00B5m", "\u03BCm", 1.0}, {"\u03BCm", "\u03BCm", 1.0},
    {"mm", "mm", 1000.0}, {"cm", "cm", 10000.0},  {"m", "m", 1000000.0},
};

struct UnitWord
{
    const char *written; // UTF-8, lower case
    int kind;
    double factor;
    const char *shown; // UTF-8
};

const UnitWord unitWords[] = {
    {"micron", ZtGsManipulator::Length, 1.0, "\u03BCm"},
    {"microns", ZtGsManipulator::Length, 1.0, "\u03BCm"},
    {"deg", ZtGsManipulator::Angle, 1.0, "\u00B0"},
    {"degree", ZtGsManipulator::Angle, 1.0, "\u00B0"},
    {"degrees", ZtGsManipulator::Angle, 1.0, "\u00B0"},
    {"\u00B0", ZtGsManipulator::Angle, 1.0, "\u00B0"},
    {"rad", ZtGsManipulator::Angle, 180.0 / M_PI, "rad"},
    {"pcs", ZtGsManipulator::Count, 1.0, "pcs"},
    {"pc", ZtGsManipulator::Count, 1.0, "pcs"},
    {"count", ZtGsManipulator::Count, 1.0, "pcs"},
    {"%", ZtGsManipulator::Percentage, 1.0, "%"},
    {"percent", ZtGsManipulator::Percentage, 1.0, "%"},
    {"pct", ZtGsManipulator::Percentage, 1.0, "%"},
};

const QChar superscriptTwo(0x00B2);

bool findLength(const QString &text, ZtUnit *unit)
{
    for (const LengthSymbol &symbol : lengthSymbols) {
        if (text == QString::fromUtf8(symbol.written)) {
            *unit = ZtUnit(ZtGsManipulator::Length, symbol.micrometres, QString::fromUtf8(symbol.shown));
            return true;
        }
    }
    return false;
}

bool findWord(const QString &text, ZtUnit *unit)
{
    for (const UnitWord &word : unitWords) {
        if (text.compare(QString::fromUtf8(word.written), Qt::CaseInsensitive) == 0) {
            *unit = ZtUnit(word.kind, word.factor, QString::fromUtf8(word.shown));
            return true;
        }
    }
    return false;
}

// The side of a square unit: "mm" of "mm2", "mm^2", "mm²", "sq mm" and "square mm"; empty for any other text.
QString squareSide(const QString &text)
{
    for (const QString &suffix : {QStringLiteral("^2"), QStringLiteral("2"), QString(superscriptTwo)}) {
        if (text.endsWith(suffix))
            return text.left(text.size() - suffix.size()).trimmed();
    }
    for (const QString &prefix : {QStringLiteral("sq "), QStringLiteral("sq. "), QStringLiteral("square ")}) {
        if (text.startsWith(prefix, Qt::CaseInsensitive))
            return text.mid(prefix.size()).trimmed();
    }
    return QString();
}

} // namespace

ZtUnit::ZtUnit(int kind, double factor, const QString &text)
    : m_kind(kind)
    , m_factor(factor)
    , m_text(text)
{}

ZtUnit ZtUnit::parse(const QString &text)
{
    const QString trimmed = text.trimmed();
    ZtUnit unit;
    if (findLength(trimmed, &unit) || findWord(trimmed, &unit))
        return unit;
    const QString side = squareSide(trimmed);
    if (findLength(side, &unit) || (findWord(side, &unit) && unit.kind() == ZtGsManipulator::Length))
        return unit.squared();
    return ZtUnit(ZtGsManipulator::NoKind, 1.0, trimmed);
}

ZtUnit ZtUnit::squared() const
{
    if (isEmpty())
        return *this;
    const int kind = m_kind == ZtGsManipulator::Length ? ZtGsManipulator::Area : ZtGsManipulator::NoKind;
    const double factor = m_kind == ZtGsManipulator::Length ? m_factor * m_factor : 1.0;
    return ZtUnit(kind, factor, m_text + superscriptTwo);
}
