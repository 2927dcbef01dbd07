// SPDX-License-Identifier: MIT
#include "measuring/ZtPixelSizeReader.h"

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtUnit.h"

#include <QRegularExpression>
#include <QXmlStreamReader>

#include <algorithm>
#include <cmath>

namespace {

constexpr double inchesPerMetre = 1000.0 / 25.4;
constexpr double micrometresPerInch = 25400.0;

struct UnitName
{
    const char *name; // lower case, UTF-8
    double micrometres;
};

// What ZtUnit does not know, as nobody measures in it.
const UnitName unitNames[] = {
    {"micrometer", 1.0},
    {"micrometre", 1.0},
    {"micrometers", 1.0},
    {"micrometres", 1.0},
    {"nanometer", 1e-3},
    {"nanometre", 1e-3},
    {"millimeter", 1e3},
    {"millimetre", 1e3},
    {"centimeter", 1e4},
    {"centimetre", 1e4},
    {"meter", 1e6},
    {"metre", 1e6},
    {"pm", 1e-6},
    {"\u00E5", 1e-4},
    {"angstrom", 1e-4},
    {"inch", micrometresPerInch},
    {"inches", micrometresPerInch},
    {"in", micrometresPerInch},
    {"\"", micrometresPerInch},
    {"dm", 1e5},
    {"km", 1e9},
    {"ft", 304800.0},
    {"mil", 25.4},
    {"thou", 25.4},
};

// Resolutions of screens, also those of screens scaled by 1.25 to 2.
bool isMeaningless(double dotsPerMetre)
{
    const double dpi = dotsPerMetre / inchesPerMetre;
    // Many formats hold whole dots per metre, so 72 dpi comes as 2834 or 2835.
    const auto isScreen = [dpi](double screen) { return std::abs(dpi - screen) < 0.1; };
    const auto screens = {72.0, 96.0, 120.0, 144.0, 192.0};
    return std::any_of(screens.begin(), screens.end(), isScreen);
}

bool isPositive(double value)
{
    return std::isfinite(value) && value > 0.0;
}

// A missing direction is like the other one; nothing at all when both are missing or useless.
ZtOfferedPixelSize complete(double x, double y, const QString &origin)
{
    if (!isPositive(x) && !isPositive(y))
        return ZtOfferedPixelSize();
    return {isPositive(x) ? x : y, isPositive(y) ? y : x, origin};
}

// Literal "\u00B5" of programs that write plain ASCII.
QString unescaped(QString text)
{
    static const QRegularExpression escape(QStringLiteral("\\\\u([0-9A-Fa-f]{4})"));
    for (QRegularExpressionMatch match = escape.match(text); match.hasMatch(); match = escape.match(text))
        text.replace(match.capturedStart(), match.capturedLength(),
                     QChar(static_cast<ushort>(match.captured(1).toUInt(nullptr, 16))));
    return text;
}

// The value of a line "key=value"; empty where there is none.
QString lineValue(const QString &description, const QString &key)
{
    const QRegularExpression line(QStringLiteral("^%1=([^\\r\\n]*)").arg(key),
                                  QRegularExpression::MultilineOption);
    return line.match(description).captured(1).trimmed();
}

QXmlStreamAttributes pixelsOfOme(const QString &description)
{
    QXmlStreamReader xml(description);
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement && xml.name() == QLatin1String("Pixels"))
            return xml.attributes();
    }
    return QXmlStreamAttributes();
}

double sizeOfOme(const QXmlStreamAttributes &pixels, const QString &name)
{
    const QString unit = pixels.value(name + QStringLiteral("Unit")).toString();
    const double size = pixels.value(name).toDouble();
    return size * (unit.isEmpty() ? 1.0 : ZtPixelSizeReader::micrometresOf(unit));
}

} // namespace

ZtOfferedPixelSize ZtPixelSizeReader::fromResolution(double dotsPerMetreX, double dotsPerMetreY,
                                                     const QString &origin)
{
    if (isMeaningless(dotsPerMetreX) && isMeaningless(dotsPerMetreY))
        return ZtOfferedPixelSize();
    return complete(1e6 / dotsPerMetreX, 1e6 / dotsPerMetreY, origin);
}

bool ZtPixelSizeReader::isOme(const QString &description)
{
    return description.contains(QLatin1String("<OME")) || description.contains(QLatin1String(":OME "));
}

ZtOfferedPixelSize ZtPixelSizeReader::fromOme(const QString &description)
{
    const QXmlStreamAttributes pixels = pixelsOfOme(description);
    return complete(sizeOfOme(pixels, QStringLiteral("PhysicalSizeX")),
                    sizeOfOme(pixels, QStringLiteral("PhysicalSizeY")), QStringLiteral("OME"));
}

int ZtPixelSizeReader::significantBitsOfOme(const QString &description)
{
    return qMax(0, pixelsOfOme(description).value(QLatin1String("SignificantBits")).toInt());
}

bool ZtPixelSizeReader::isImageJ(const QString &description)
{
    return description.startsWith(QLatin1String("ImageJ="));
}

ZtOfferedPixelSize ZtPixelSizeReader::fromImageJ(const QString &description, double pixelsPerUnitX,
                                                 double pixelsPerUnitY)
{
    const double unit = micrometresOf(lineValue(description, QStringLiteral("unit")));
    if (unit == micrometresPerInch)
        return fromResolution(pixelsPerUnitX * inchesPerMetre, pixelsPerUnitY * inchesPerMetre,
                              QStringLiteral("ImageJ"));
    // The vertical direction has a unit of its own only where it differs.
    const double unitY = micrometresOf(lineValue(description, QStringLiteral("yunit")));
    return complete(unit / pixelsPerUnitX, (unitY > 0.0 ? unitY : unit) / pixelsPerUnitY,
                    QStringLiteral("ImageJ"));
}

double ZtPixelSizeReader::micrometresOf(const QString &unit)
{
    const QString plain = unescaped(unit).trimmed();
    const ZtUnit known = ZtUnit::parse(plain);
    if (known.kind() == ZtGsManipulator::Length)
        return known.factor();
    for (const UnitName &entry : unitNames) {
        if (plain.compare(QString::fromUtf8(entry.name), Qt::CaseInsensitive) == 0)
            return entry.micrometres;
    }
    return 0.0;
}
