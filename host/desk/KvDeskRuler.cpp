// SPDX-License-Identifier: MIT
#include "KvDeskRuler.h"

#include "gui/QtAdvancedStylesheet.h"
#include "measuring/ZtUnit.h"

#include <QPainter>

#include <cmath>

namespace {

constexpr double leastLabelDistance = 64.0; ///< at least so many pixels lie between two labels
constexpr double labelledLength = 12.0;
constexpr double plainLength = 5.0;
constexpr int fontSize = 10;
constexpr int textRoom = 3;
constexpr double mostTicks = 10000.0;

QColor color(const char *token)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
}

// The smallest of 1, 2, 5, 10, 20, ... that is not below the number.
double roundStep(double atLeast)
{
    const double power = std::pow(10.0, std::floor(std::log10(atLeast)));
    for (const double factor : {1.0, 2.0, 5.0}) {
        if (factor * power >= atLeast * (1.0 - 1e-9))
            return factor * power;
    }
    return 10.0 * power;
}

QString numberText(double value)
{
    return QString::number(std::abs(value) < 1e-12 ? 0.0 : value, 'g', 6);
}

} // namespace

KvDeskRuler::KvDeskRuler(Qt::Orientation orientation, QWidget *parent)
    : QWidget(parent)
    , m_orientation(orientation)
    , m_unitText(QStringLiteral("px"))
{
    // As the image, it is never mirrored.
    setLayoutDirection(Qt::LeftToRight);
    QFont font = this->font();
    font.setPixelSize(fontSize);
    setFont(font);
    setAccessibleName(orientation == Qt::Horizontal ? tr("Horizontal ruler") : tr("Vertical ruler"));
}

double KvDeskRuler::length() const
{
    return m_orientation == Qt::Horizontal ? width() : height();
}

double KvDeskRuler::extent(double scale, double pixelSize) const
{
    return scale > 0.0 ? length() / scale * pixelSize : 0.0;
}

void KvDeskRuler::setScale(double origin, double scale, double pixelSize, const ZtUnit &unit)
{
    m_origin = origin;
    m_pixelsPerUnit = scale;
    m_unitText = QStringLiteral("px");
    if (pixelSize > 0.0 && scale > 0.0) {
        m_pixelsPerUnit = scale / pixelSize * unit.factor();
        m_unitText = unit.text();
    }
    setToolTip(tr("Ruler in %1").arg(m_unitText));
    update();
}

void KvDeskRuler::setPointer(std::optional<double> position)
{
    if (position == m_pointer)
        return;
    m_pointer = position;
    update();
}

QVector<KvDeskRuler::Tick> KvDeskRuler::ticks(double origin, double pixelsPerUnit, double length)
{
    QVector<Tick> result;
    if (!(pixelsPerUnit > 0.0) || !std::isfinite(origin))
        return result;
    const double labelled = roundStep(leastLabelDistance / pixelsPerUnit);
    // Ten marks between 1 and 2 or 5 and 10, four between 2 and 4.
    const bool isTwo =
        std::abs(labelled / std::pow(10.0, std::floor(std::log10(labelled) + 1e-9)) - 2.0) < 0.1;
    const int parts = isTwo ? 4 : 5;
    const double step = labelled / parts;
    const double first = std::ceil(-origin / pixelsPerUnit / step);
    const double last = std::floor((length - origin) / pixelsPerUnit / step);
    if (last - first > mostTicks)
        return result;
    for (double i = first; i <= last; i += 1.0)
        result.append({origin + i * step * pixelsPerUnit, i * step, std::fmod(i, parts) == 0.0});
    return result;
}

std::optional<double> KvDeskRuler::textStart(double textWidth, double room, double distance)
{
    if (textRoom + textWidth <= room)
        return textRoom;
    // The text of the label before reads towards it.
    const bool hasRoomBefore = 2.0 * (textWidth + textRoom) + textRoom <= distance;
    return hasRoomBefore ? std::optional<double>(-textRoom - textWidth) : std::nullopt;
}

double KvDeskRuler::labelDistance() const
{
    return roundStep(leastLabelDistance / m_pixelsPerUnit) * m_pixelsPerUnit;
}

void KvDeskRuler::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QPainter painter(this);
    painter.fillRect(rect(), color("panel"));
    painter.setPen(color("line"));
    if (m_orientation == Qt::Horizontal)
        painter.drawLine(0, height() - 1, width(), height() - 1);
    else
        painter.drawLine(width() - 1, 0, width() - 1, height());
    for (const Tick &tick : ticks(m_origin, m_pixelsPerUnit, length()))
        drawTick(&painter, tick);
    drawPointer(&painter);
}

void KvDeskRuler::drawTick(QPainter *painter, const Tick &tick) const
{
    const double across = tick.isLabelled ? labelledLength : plainLength;
    const bool isLevel = m_orientation == Qt::Horizontal;
    painter->setPen(color("muted"));
    if (isLevel)
        painter->drawLine(QPointF(tick.position, thickness - across), QPointF(tick.position, thickness));
    else
        painter->drawLine(QPointF(thickness - across, tick.position), QPointF(thickness, tick.position));
    if (!tick.isLabelled)
        return;
    painter->save();
    painter->translate(isLevel ? QPointF(tick.position, 0.0) : QPointF(0.0, tick.position));
    if (!isLevel)
        painter->rotate(-90.0);
    const QString text = numberText(tick.value);
    // Upright texts read from the bottom to the top.
    const double room = isLevel ? length() - tick.position : tick.position;
    if (const auto start = textStart(painter->fontMetrics().horizontalAdvance(text), room, labelDistance()))
        painter->drawText(QPointF(*start, fontSize + 1), text);
    painter->restore();
}

void KvDeskRuler::drawPointer(QPainter *painter) const
{
    if (!m_pointer)
        return;
    painter->setPen(QPen(color("accent-hover"), 2.0));
    if (m_orientation == Qt::Horizontal)
        painter->drawLine(QPointF(*m_pointer, 0.0), QPointF(*m_pointer, thickness));
    else
        painter->drawLine(QPointF(0.0, *m_pointer), QPointF(thickness, *m_pointer));
}
