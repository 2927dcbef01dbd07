// SPDX-License-Identifier: MIT
#include "KvDeskMarks.h"

#include "gui/QtAdvancedStylesheet.h"
#include "measuring/ZtDrawnObjectPainter.h"

#include <QLineF>
#include <QPainter>

namespace {

constexpr double snapRadius = 8.0;
constexpr double crosshairArm = 16.0;
constexpr double crosshairGap = 4.0;
constexpr double textOffset = 16.0;

QColor color(const char *token)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
}

} // namespace

void KvDeskMarks::drawHandle(const QPointF &place) const
{
    m_painter->setPen(QPen(color("accent"), 2.0));
    m_painter->setBrush(color("on-accent"));
    m_painter->drawEllipse(place, handleRadius, handleRadius);
}

void KvDeskMarks::drawSnapMark(const QPointF &place) const
{
    m_painter->setBrush(Qt::NoBrush);
    m_painter->setPen(QPen(color("on-accent"), 4.0));
    m_painter->drawEllipse(place, snapRadius, snapRadius);
    m_painter->setPen(QPen(color("accent-hover"), 2.0));
    m_painter->drawEllipse(place, snapRadius, snapRadius);
}

void KvDeskMarks::drawCrosshair(const QPointF &place) const
{
    const QPointF directions[] = {{1, 0}, {-1, 0}, {0, 1}, {0, -1}};
    for (const bool isHalo : {true, false}) {
        m_painter->setPen(QPen(color(isHalo ? "on-accent" : "accent-hover"), isHalo ? 4.0 : 2.0));
        for (const QPointF &direction : directions)
            m_painter->drawLine(QLineF(place + direction * crosshairGap, place + direction * crosshairArm));
    }
}

void KvDeskMarks::drawBand(const QRectF &rect) const
{
    QColor inside = color("accent-hover");
    m_painter->setPen(QPen(inside, 1.0));
    inside.setAlphaF(0.2);
    m_painter->setBrush(inside);
    m_painter->drawRect(rect);
}

void KvDeskMarks::drawText(const QPointF &place, const QString &text, const QRectF &page) const
{
    if (text.isEmpty())
        return;
    QRectF box(place + QPointF(textOffset, textOffset), ZtDrawnObjectPainter::labelSize(text));
    if (box.right() > page.right())
        box.moveRight(place.x() - textOffset);
    if (box.bottom() > page.bottom())
        box.moveBottom(place.y() - textOffset);
    ZtDrawnObjectPainter(m_painter).drawLabelBox(box, text);
}
