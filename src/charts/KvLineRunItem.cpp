// SPDX-License-Identifier: MIT
#include "charts/KvLineRunItem.h"

#include <QPainter>

#include <cmath>

namespace kvCharts {

KvLineRunItem::KvLineRunItem(const QVector<QLineF> &lines, const QPen &pen)
    : m_lines(lines)
    , m_pen(pen)
{
    for (const QLineF &line : lines)
        m_boundingRect |= lineRect(line, pen.widthF());
}

// Half a pen to all sides of the line, and beyond its ends; line items of no length cover only their point.
QRectF KvLineRunItem::lineRect(const QLineF &line, qreal penWidth)
{
    const QRectF rect = QRectF(line.p1(), line.p2()).normalized();
    const qreal length = line.length();
    const qreal directions = length > 0.0 ? (std::abs(line.dx()) + std::abs(line.dy())) / length : 0.0;
    const qreal reach = penWidth / 2 * directions;
    return rect.adjusted(-reach, -reach, reach, reach);
}

void KvLineRunItem::paint(QPainter *painter, const QStyleOptionGraphicsItem * /*option*/,
                          QWidget * /*widget*/)
{
    painter->setPen(m_pen);
    painter->drawLines(m_lines);
}

} // namespace kvCharts
