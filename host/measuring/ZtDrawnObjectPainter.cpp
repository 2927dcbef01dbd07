// SPDX-License-Identifier: MIT
#include "measuring/ZtDrawnObjectPainter.h"

#include "measuring/ZtLabelLayout.h"

#include <QFontMetricsF>
#include <QGuiApplication>
#include <QPainter>
#include <QPainterPath>

#include <cstdlib>

namespace {

// All lengths in device-independent pixels.
constexpr double haloWidth = 4.0;
constexpr double lineWidth = 1.6;
constexpr double markerArm = 5.0;
constexpr int labelPixelSize = 13;
constexpr double labelPadding = 3.0;
constexpr double labelOffset = 6.0;

const QColor labelColor(255, 255, 255);

constexpr int leastDistance = 120; ///< of colours that are told apart, over all three parts

int distance(const QColor &a, const QColor &b)
{
    return std::abs(a.red() - b.red()) + std::abs(a.green() - b.green()) + std::abs(a.blue() - b.blue());
}

// They differ in brightness as well as in hue; neighbours differ most, and the first are bright on dark
// stains.
QVector<QColor> makeCounterColors()
{
    const QColor palette[] = {{160, 235, 235}, {240, 110, 50},  {255, 255, 255}, {40, 190, 140},
                              {240, 228, 66},  {235, 150, 205}, {120, 95, 255},  {86, 180, 233}};
    const QColor own = ZtDrawnObjectPainter::lineColor();
    QVector<QColor> colors{own};
    for (const QColor &color : palette) {
        if (distance(color, own) >= leastDistance)
            colors.append(color);
    }
    return colors;
}

// Not cosmetic, as such pens are thin on screens with more than one pixel per device-independent one.
QPen linePen(const QColor &color, double width)
{
    return QPen(color, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin);
}

QFont labelFont()
{
    QFont font = QGuiApplication::font();
    font.setPixelSize(labelPixelSize);
    return font;
}

} // namespace

QColor ZtDrawnObjectPainter::lineColor()
{
    return QColor(255, 214, 64);
}

QColor ZtDrawnObjectPainter::haloColor()
{
    return QColor(20, 20, 20, 190);
}

const QVector<QColor> &ZtDrawnObjectPainter::counterColors()
{
    static const QVector<QColor> colors = makeCounterColors();
    return colors;
}

int ZtDrawnObjectPainter::counterColorIndex(int id)
{
    return qMax(0, id - 1) % counterColors().size();
}

void ZtDrawnObjectPainter::drawOutline(const QPainterPath &path) const
{
    strokeOnDevice(m_painter->worldTransform().map(path));
}

void ZtDrawnObjectPainter::drawMarkers(const QPolygonF &points, const QColor &color) const
{
    QPainterPath path;
    const QPolygonF onDevice = m_painter->worldTransform().map(points);
    for (const QPointF &point : onDevice) {
        path.moveTo(point - QPointF(markerArm, 0));
        path.lineTo(point + QPointF(markerArm, 0));
        path.moveTo(point - QPointF(0, markerArm));
        path.lineTo(point + QPointF(0, markerArm));
    }
    strokeOnDevice(path, color);
}

void ZtDrawnObjectPainter::strokeOnDevice(const QPainterPath &path, const QColor &color) const
{
    m_painter->save();
    m_painter->setWorldTransform(QTransform());
    m_painter->setRenderHint(QPainter::Antialiasing);
    m_painter->setBrush(Qt::NoBrush);
    m_painter->setPen(linePen(haloColor(), haloWidth));
    m_painter->drawPath(path);
    m_painter->setPen(linePen(color, lineWidth));
    m_painter->drawPath(path);
    m_painter->restore();
}

QRectF ZtDrawnObjectPainter::page(const QPainter &painter)
{
    const QPaintDevice *const device = painter.device();
    // Pictures tell their size in pixels; all other devices, and the painter, count in larger units.
    const bool isPicture = device->devType() == QInternal::Image || device->devType() == QInternal::Pixmap;
    const double ratio = isPicture ? device->devicePixelRatioF() : 1.0;
    return QRectF(QPointF(), QSizeF(device->width(), device->height()) / ratio);
}

QSizeF ZtDrawnObjectPainter::labelSize(const QString &text)
{
    const QSizeF size = QFontMetricsF(labelFont()).size(0, text);
    return size + QSizeF(2.0 * labelPadding, 2.0 * labelPadding);
}

void ZtDrawnObjectPainter::drawLabel(const QPointF &anchor, const QString &text) const
{
    if (text.isEmpty())
        return;
    const QPointF place = m_painter->worldTransform().map(anchor);
    QRectF box(QPointF(), labelSize(text));
    box.moveBottomLeft(place + QPointF(labelOffset - labelPadding, labelPadding - labelOffset));
    const QRectF page = ZtDrawnObjectPainter::page(*m_painter);
    drawLabelBox(page.contains(place) ? ZtLabelLayout::movedInto(box, page) : box, text);
}

void ZtDrawnObjectPainter::drawLabelBox(const QRectF &box, const QString &text) const
{
    m_painter->save();
    m_painter->setWorldTransform(QTransform());
    m_painter->setRenderHint(QPainter::Antialiasing);
    m_painter->setFont(labelFont());
    m_painter->setPen(Qt::NoPen);
    m_painter->setBrush(haloColor());
    m_painter->drawRoundedRect(box, labelPadding, labelPadding);
    m_painter->setPen(labelColor);
    const QRectF inside = box.adjusted(labelPadding, labelPadding, -labelPadding, -labelPadding);
    // The name comes before the value whatever script it is in.
    m_painter->setLayoutDirection(Qt::LeftToRight);
    m_painter->drawText(inside, Qt::AlignLeft | Qt::TextDontClip, text);
    m_painter->restore();
}
