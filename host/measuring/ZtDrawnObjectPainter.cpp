// SPDX-License-Identifier: MIT
#include "measuring/ZtDrawnObjectPainter.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>

namespace {

// All lengths in device-independent pixels.
constexpr double haloWidth = 4.0;
constexpr double lineWidth = 1.6;
constexpr double markerArm = 5.0;
constexpr int labelPixelSize = 13;
constexpr double labelPadding = 3.0;
constexpr double labelOffset = 6.0;

const QColor haloColor(20, 20, 20, 190);
const QColor lineColor(255, 214, 64);
const QColor labelColor(255, 255, 255);

// Not cosmetic, as such pens are thin on screens with more than one pixel per device-independent one.
QPen linePen(const QColor &color, double width)
{
    return QPen(color, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin);
}

// The nearest place where a box can be seen; its upper left corner where it does not fit.
QRectF movedInto(QRectF box, const QRectF &page)
{
    box.moveRight(qMin(box.right(), page.right()));
    box.moveBottom(qMin(box.bottom(), page.bottom()));
    box.moveLeft(qMax(box.left(), page.left()));
    box.moveTop(qMax(box.top(), page.top()));
    return box;
}

} // namespace

void ZtDrawnObjectPainter::drawOutline(const QPainterPath &path) const
{
    strokeOnDevice(m_painter->worldTransform().map(path));
}

void ZtDrawnObjectPainter::drawMarkers(const QPolygonF &points) const
{
    QPainterPath path;
    const QPolygonF onDevice = m_painter->worldTransform().map(points);
    for (const QPointF &point : onDevice) {
        path.moveTo(point - QPointF(markerArm, 0));
        path.lineTo(point + QPointF(markerArm, 0));
        path.moveTo(point - QPointF(0, markerArm));
        path.lineTo(point + QPointF(0, markerArm));
    }
    strokeOnDevice(path);
}

void ZtDrawnObjectPainter::strokeOnDevice(const QPainterPath &path) const
{
    m_painter->save();
    m_painter->setWorldTransform(QTransform());
    m_painter->setRenderHint(QPainter::Antialiasing);
    m_painter->setBrush(Qt::NoBrush);
    m_painter->setPen(linePen(haloColor, haloWidth));
    m_painter->drawPath(path);
    m_painter->setPen(linePen(lineColor, lineWidth));
    m_painter->drawPath(path);
    m_painter->restore();
}

void ZtDrawnObjectPainter::drawLabel(const QPointF &anchor, const QString &text) const
{
    if (text.isEmpty())
        return;
    const QPointF corner = m_painter->worldTransform().map(anchor) + QPointF(labelOffset, -labelOffset);
    m_painter->save();
    QFont font = m_painter->font();
    font.setPixelSize(labelPixelSize);
    m_painter->setFont(font);
    const QFontMetricsF metrics(font);
    QRectF box(QPointF(), metrics.size(0, text));
    box.moveBottomLeft(corner);
    box.adjust(-labelPadding, -labelPadding, labelPadding, labelPadding);
    const QRectF page = m_painter->window();
    if (page.contains(m_painter->worldTransform().map(anchor)))
        box = movedInto(box, page);
    m_painter->setWorldTransform(QTransform());
    m_painter->setRenderHint(QPainter::Antialiasing);
    m_painter->setPen(Qt::NoPen);
    m_painter->setBrush(haloColor);
    m_painter->drawRoundedRect(box, labelPadding, labelPadding);
    box.adjust(labelPadding, labelPadding, -labelPadding, -labelPadding);
    m_painter->setPen(labelColor);
    m_painter->drawText(box, Qt::AlignLeft | Qt::TextDontClip, text);
    m_painter->restore();
}
