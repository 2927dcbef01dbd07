// SPDX-License-Identifier: MIT
#include "measuring/ZtScaleBar.h"

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtMeasureFormat.h"
#include "measuring/ZtUnit.h"
#include "measuring/ZtUnitSettings.h"

#include <QFontMetricsF>
#include <QGuiApplication>
#include <QPainter>

#include <cmath>

namespace {

// All lengths in device-independent pixels.
constexpr double shareOfPage = 0.25;
constexpr double longest = 240.0;
constexpr double shortest = 8.0;
constexpr double smallestPage = 120.0;
constexpr double margin = 16.0;
constexpr double padding = 8.0;
constexpr double gap = 4.0;
constexpr double barHeight = 4.0;
constexpr double boxRadius = 4.0;
constexpr int textPixelSize = 13;

const QColor boxColor(20, 20, 20, 190);
const QColor barColor(255, 255, 255);

QFont textFont()
{
    QFont font = QGuiApplication::font();
    font.setPixelSize(textPixelSize);
    return font;
}

// Round lengths have few digits; their text has no more.
QString lengthText(double micrometres)
{
    ZtUnit unit = ZtUnitSettings::getInstance()->chosenUnit(ZtGsManipulator::Length);
    if (unit.isEmpty())
        unit = ZtMeasureFormat::readableUnit(micrometres, ZtGsManipulator::Length);
    return ZtMeasureFormat::withUnit(ZtMeasureFormat::significant(unit.fromBase(micrometres), 1),
                                     unit.text());
}

} // namespace

double ZtScaleBar::roundLength(double atMost)
{
    if (!std::isfinite(atMost) || atMost <= 0.0)
        return 0.0;
    const double power = std::pow(10.0, std::floor(std::log10(atMost)));
    // Rounding must not make a length that is round already the next smaller one.
    const double limit = atMost * (1.0 + 1e-9);
    for (const double factor : {10.0, 5.0, 2.0}) {
        if (factor * power <= limit)
            return factor * power;
    }
    return power;
}

ZtScaleBar ZtScaleBar::choose(const ZtCalibration &calibration, double scale, double pageWidth)
{
    ZtScaleBar bar;
    if (!(scale > 0.0) || pageWidth < smallestPage)
        return bar;
    const double perUnit = scale / calibration.factor();
    const double inUnits = roundLength(qMin(pageWidth * shareOfPage, longest) / perUnit);
    if (!(inUnits * perUnit >= shortest))
        return bar;
    bar.length = inUnits * perUnit;
    bar.text =
        calibration.isCalibrated()
            ? lengthText(inUnits)
            : ZtMeasureFormat::withUnit(ZtMeasureFormat::significant(inUnits, 1), QStringLiteral("px"));
    return bar;
}

void ZtScaleBar::draw(QPainter *painter, const QRectF &page) const
{
    const QFontMetricsF metrics(textFont());
    const double width = qMax(length, metrics.horizontalAdvance(text)) + 2.0 * padding;
    const double height = metrics.height() + gap + barHeight + 2.0 * padding;
    if (length <= 0.0 || page.width() < width + margin || page.height() < height + margin)
        return;
    const QRectF box(page.right() - margin - width, page.bottom() - margin - height, width, height);
    const QRectF inside = box.adjusted(padding, padding, -padding, -padding);
    painter->save();
    painter->setWorldTransform(QTransform());
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setPen(Qt::NoPen);
    painter->setBrush(boxColor);
    painter->drawRoundedRect(box, boxRadius, boxRadius);
    painter->fillRect(
        QRectF(inside.center().x() - length / 2.0, inside.bottom() - barHeight, length, barHeight), barColor);
    painter->setFont(textFont());
    painter->setPen(barColor);
    painter->setLayoutDirection(Qt::LeftToRight);
    painter->drawText(inside, Qt::AlignHCenter | Qt::AlignTop | Qt::TextDontClip, text);
    painter->restore();
}
