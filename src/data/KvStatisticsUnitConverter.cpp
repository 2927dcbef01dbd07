// SPDX-License-Identifier: MIT
#include "data/KvStatisticsUnitConverter.h"

#include "data/KvStatisticsEngine.h"
#include "kernel/ZtAppSettings.h"

#include <QCoreApplication>

#include <algorithm>
#include <cmath>

namespace {

enum MeasureKind { Length = 1, Area = 2, Angle = 3, Count = 4, Percentage = 5 };

// Codes of the area units follow those of the length units in the same order.
constexpr int kAreaOffset = KvStatisticsUnitConverter::SquareNanometre - KvStatisticsUnitConverter::Nanometre;

// Powers of ten end shortly above 10^308; up to here the scaled number stays finite.
constexpr uint kMaxDigits = 300;

int lengthUnit(double value)
{
    if (value < 1.0)
        return KvStatisticsUnitConverter::Nanometre;
    if (value < 1000.0)
        return KvStatisticsUnitConverter::Micrometre;
    if (value / 1000.0 < 10.0)
        return KvStatisticsUnitConverter::Millimetre;
    if (value / 1000.0 / 10.0 >= 100.0)
        return KvStatisticsUnitConverter::Metre;
    return KvStatisticsUnitConverter::Centimetre;
}

double scaleLength(double value, int unit)
{
    switch (unit) {
    case KvStatisticsUnitConverter::Nanometre:
    case KvStatisticsUnitConverter::SquareNanometre:
        return value * 1000.0;
    case KvStatisticsUnitConverter::Millimetre:
    case KvStatisticsUnitConverter::SquareMillimetre:
        return value / 1000.0;
    case KvStatisticsUnitConverter::Centimetre:
    case KvStatisticsUnitConverter::SquareCentimetre:
        return value / 10000.0;
    case KvStatisticsUnitConverter::Metre:
    case KvStatisticsUnitConverter::SquareMetre:
        return value / 1000000.0;
    default:
        return value;
    }
}

// A number as (mantissa / divisor) x 10^exponent, before rounding the mantissa to a whole number.
struct ScaledNumber
{
    double mantissa;
    double divisor;
    int exponent;
};

ScaledNumber scaleToDigits(double value, uint significantDigits)
{
    const int digits = static_cast<int>(std::min(significantDigits, kMaxDigits));
    // Truncated, not floored: 0.5 counts as one digit before the point, as 5 does; 0.05 as none.
    const int before =
        value > 0.0 && std::isfinite(value) ? std::max(static_cast<int>(std::log10(value)) + 1, 0) : 0;
    if (before > digits)
        return {value / std::pow(10.0, before - digits), 1.0, before - digits};
    const double divisor = std::trunc(std::pow(10.0, digits - before));
    return {value * divisor, divisor, 0};
}

ScaledNumber scaleByLadder(double value)
{
    if (value < 1.0)
        return {value * 10000.0, 10000.0, 0};
    if (value < 100.0)
        return {value * 1000.0, 1000.0, 0};
    if (value < 1000.0)
        return {value * 100.0, 100.0, 0};
    if (value < 10000.0)
        return {value * 10.0, 10.0, 0};
    if (value < 100000.0)
        return {value, 1000.0, 3};
    if (value < 1000000.0)
        return {value / 10.0, 100.0, 3};
    if (value < 10000000.0)
        return {value / 100.0, 10000.0, 6};
    return {value / 1000.0, 1000.0, 6};
}

// Only the exponents of the ladder have a superscript; a digits setting can yield others, which then read as
// a bare factor of ten. Kept as it is.
QString exponentText(int exponent)
{
    QString text;
    if (exponent > 0)
        text = QChar(0x2219) + QStringLiteral("10");
    else if (exponent < 0)
        text = QChar(0x2219) + QStringLiteral("10 ") + QChar(0x0304);
    if (std::abs(exponent) == 3)
        text += QChar(0x00B3);
    else if (std::abs(exponent) == 6)
        text += QChar(0x2076);
    return text;
}

QString plainText(const QVariant &value)
{
    switch (value.userType()) {
    case QMetaType::Int:
    case QMetaType::Short:
    case QMetaType::Long:
    case QMetaType::LongLong:
        return QString::number(value.toLongLong());
    case QMetaType::UInt:
    case QMetaType::UShort:
    case QMetaType::ULong:
    case QMetaType::ULongLong:
        return QString::number(value.toULongLong());
    case QMetaType::Double:
    case QMetaType::Float:
        return QString::number(value.toDouble(), 'f', 3);
    default:
        return value.toString();
    }
}

QString translated(const char *text)
{
    return QCoreApplication::translate("KvStatisticsUnitConverter", text);
}

} // namespace

int KvStatisticsUnitConverter::autoUnit(double value, int measureKind)
{
    switch (measureKind) {
    case Length:
        return lengthUnit(value);
    case Area:
        return lengthUnit(std::sqrt(value)) + kAreaOffset;
    case Angle:
        return Degree;
    case Count:
        return Pieces;
    case Percentage:
        return Percent;
    default:
        return NoUnit;
    }
}

int KvStatisticsUnitConverter::commonUnit(double low, double high, int measureKind)
{
    const int lowUnit = autoUnit(low, measureKind);
    const int highUnit = autoUnit(high, measureKind);
    return lowUnit == highUnit ? lowUnit : (lowUnit + 1 + highUnit) >> 1;
}

double KvStatisticsUnitConverter::convert(double value, int measureKind, int unit)
{
    if (measureKind == Length)
        return scaleLength(value, unit);
    if (measureKind != Area)
        return value;
    const double side = scaleLength(std::sqrt(value), unit);
    return side * side;
}

QString KvStatisticsUnitConverter::formatNumber(double value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    const uint digits = ZtAppSettings::value(QStringLiteral("MeasurementLabelsSignDigits"), 0).toUInt();
    ZtAppSettings::endGroup();
    return formatNumber(value, digits);
}

QString KvStatisticsUnitConverter::formatNumber(double value, uint significantDigits)
{
    const ScaledNumber scaled =
        significantDigits > 0 ? scaleToDigits(value, significantDigits) : scaleByLadder(value);
    // Kept as a double: whole numbers beyond 32 bits occur from about 2.1e12 on, and values that are not
    // finite have no integer. Halves of negative numbers round towards zero here, as they always did.
    const double mantissa = std::trunc(scaled.mantissa + 0.5);
    const int decimals = static_cast<int>(std::lround(std::log10(scaled.divisor)));
    const QString text =
        mantissa == 0.0 ? QStringLiteral("0") : QString::number(mantissa / scaled.divisor, 'f', decimals);
    return text + exponentText(scaled.exponent);
}

QString KvStatisticsUnitConverter::unitText(int unit)
{
    switch (unit) {
    case Nanometre:
        return QStringLiteral("nm");
    case Micrometre:
        return QStringLiteral("\u03BCm");
    case Millimetre:
        return QStringLiteral("mm");
    case Centimetre:
        return QStringLiteral("cm");
    case Metre:
        return QStringLiteral("m");
    case SquareNanometre:
        return QStringLiteral("nm\u00B2");
    case SquareMicrometre:
        return QStringLiteral("\u03BCm\u00B2");
    case SquareMillimetre:
        return QStringLiteral("mm\u00B2");
    case SquareCentimetre:
        return QStringLiteral("cm\u00B2");
    case SquareMetre:
        return QStringLiteral("m\u00B2");
    case Degree:
        return translated(QT_TRANSLATE_NOOP("KvStatisticsUnitConverter", "deg")) + QStringLiteral("(\u00B0)");
    case Pieces:
        return translated(QT_TRANSLATE_NOOP("KvStatisticsUnitConverter", "pcs"));
    case Percent:
        return translated(QT_TRANSLATE_NOOP("KvStatisticsUnitConverter", "%"));
    default:
        return QString();
    }
}

QString KvStatisticsUnitConverter::formatValue(const QVariant &value, int measureKind, int unit)
{
    if (value.isNull())
        return QString();
    const double number = KvStatisticsEngine::numericValue(value);
    const int shownUnit = unit == AutomaticUnit ? autoUnit(number, measureKind) : unit;
    const bool isScaled = measureKind == Length || measureKind == Area;
    const QString text = isScaled ? formatNumber(convert(number, measureKind, shownUnit)) : plainText(value);
    return text + QLatin1Char(' ') + unitText(shownUnit);
}
