// SPDX-License-Identifier: MIT
#include "measuring/ZtMeasureFormat.h"

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtUnit.h"
#include "measuring/ZtUnitSettings.h"

#include <QCoreApplication>

#include <cmath>

namespace {

// Beyond these powers of ten a number without an exponent is only a row of zeros.
constexpr int largestPlainExponent = 15;
constexpr int smallestPlainExponent = -9;

// Rounding may leave a minus before nothing but zeros.
QString withoutNegativeZero(const QString &text)
{
    if (!text.startsWith(QLatin1Char('-')))
        return text;
    for (const QChar c : text) {
        if (c >= QLatin1Char('1') && c <= QLatin1Char('9'))
            return text;
    }
    return text.mid(1);
}

// Sets the decimal point into the digits of d.ddd * 10^exponent.
QString plainNumber(const QString &digits, int exponent)
{
    const int count = digits.size();
    if (exponent < 0)
        return QStringLiteral("0.") + QString(-exponent - 1, QLatin1Char('0')) + digits;
    if (exponent >= count - 1)
        return digits + QString(exponent - count + 1, QLatin1Char('0'));
    return digits.left(exponent + 1) + QLatin1Char('.') + digits.mid(exponent + 1);
}

QString unitTextOf(int measureKind)
{
    switch (measureKind) {
    case ZtGsManipulator::Angle:
        return QString(QChar(0x00B0));
    case ZtGsManipulator::Count:
        return QCoreApplication::translate("ZtMeasureFormat", "pcs");
    case ZtGsManipulator::Percentage:
        return QStringLiteral("%");
    default:
        return QString();
    }
}

QString formatted(double value)
{
    const int digits = ZtUnitSettings::getInstance()->significantDigits();
    return digits > 0 ? ZtMeasureFormat::significant(value, digits) : ZtMeasureFormat::readable(value);
}

} // namespace

QString ZtMeasureFormat::significant(double value, int digits)
{
    if (value == 0.0)
        return QStringLiteral("0");
    const QString scientific = QString::number(std::abs(value), 'e', digits - 1);
    const int split = scientific.indexOf(QLatin1Char('e'));
    const int exponent = scientific.mid(split + 1).toInt();
    const QString sign = value < 0 ? QStringLiteral("-") : QString();
    if (exponent > largestPlainExponent || exponent < smallestPlainExponent)
        return sign + scientific;
    QString mantissa = scientific.left(split);
    mantissa.remove(QLatin1Char('.'));
    return sign + plainNumber(mantissa, exponent);
}

QString ZtMeasureFormat::readable(double value)
{
    const double magnitude = std::abs(value);
    if (magnitude >= 1e15)
        return QString::number(value, 'e', 6);
    const int decimals = magnitude < 100.0 ? 3 : magnitude < 1000.0 ? 2 : 1;
    return withoutNegativeZero(QString::number(value, 'f', decimals));
}

QString ZtMeasureFormat::shortened(double value)
{
    constexpr int digits = 3;
    constexpr double smallest = 0.0005; // that three decimals show
    return value != 0.0 && std::abs(value) < smallest ? significant(value, digits) : readable(value);
}

QString ZtMeasureFormat::withUnit(const QString &number, const QString &unitText)
{
    return unitText.isEmpty() ? number : number + QLatin1Char(' ') + unitText;
}

ZtUnit ZtMeasureFormat::readableUnit(double baseValue, int measureKind)
{
    if (measureKind != ZtGsManipulator::Length && measureKind != ZtGsManipulator::Area)
        return ZtUnit();
    const bool isArea = measureKind == ZtGsManipulator::Area;
    const double length = isArea ? std::sqrt(std::abs(baseValue)) : std::abs(baseValue);
    const char *symbol = "m";
    if (length < 1.0)
        symbol = "nm";
    else if (length < 1000.0)
        symbol = "um";
    else if (length < 10000.0)
        symbol = "mm";
    else if (length < 1000000.0)
        symbol = "cm";
    const ZtUnit unit = ZtUnit::parse(QLatin1String(symbol));
    return isArea ? unit.squared() : unit;
}

QString ZtMeasureFormat::named(const QString &name, const QString &valueText)
{
    // A number is drawn into a name before it that runs from right to left, and parts from its unit, unless
    // something that runs to the right stands between them.
    const QString gap = name.isRightToLeft() ? QStringLiteral("\u200E  ") : QStringLiteral("  ");
    return name + gap + valueText;
}

QString ZtMeasureFormat::drawnText(double baseValue, int measureKind)
{
    if (measureKind == ZtGsManipulator::Count)
        return withUnit(QString::number(baseValue, 'f', 0), unitTextOf(measureKind));
    ZtUnit unit = ZtUnitSettings::getInstance()->chosenUnit(measureKind);
    if (unit.isEmpty())
        unit = readableUnit(baseValue, measureKind);
    if (unit.isEmpty())
        return withUnit(formatted(baseValue), unitTextOf(measureKind));
    return withUnit(formatted(unit.fromBase(baseValue)), unit.text());
}

QString ZtMeasureFormat::pixelText(double value, int power)
{
    const int digits = ZtUnitSettings::getInstance()->significantDigits();
    const QString number = digits > 0 ? significant(value, digits) : QString::number(value, 'f', 1);
    return withUnit(number, power == 2 ? QStringLiteral("px\u00B2") : QStringLiteral("px"));
}

QString ZtMeasureFormat::importedText(double baseValue, const ZtUnit &source, const QString &writtenText)
{
    const ZtUnitSettings *settings = ZtUnitSettings::getInstance();
    const ZtUnit &chosen = settings->chosenUnit(source.kind());
    const bool isConverted = !chosen.isEmpty() && chosen != source;
    // Pieces are whole: rounding them to few digits would show a count that nobody counted.
    const int digits = source.kind() == ZtGsManipulator::Count ? 0 : settings->significantDigits();
    if (!isConverted && digits == 0)
        return writtenText;
    const ZtUnit &unit = isConverted ? chosen : source;
    return withUnit(formatted(unit.fromBase(baseValue)), unit.text());
}

QString ZtMeasureFormat::importedShortText(double baseValue, const ZtUnit &source, const QString &writtenText)
{
    const QString text = importedText(baseValue, source, writtenText);
    if (text != writtenText || source.kind() == ZtGsManipulator::Count)
        return text;
    const QString shorter = withUnit(shortened(source.fromBase(baseValue)), source.text());
    return shorter.size() < text.size() ? shorter : text;
}
