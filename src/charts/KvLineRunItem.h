// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsItem>
#include <QPen>
#include <QVector>

namespace kvCharts {

/** Many lines of one pen as one item: looks like a line item per line and covers the same rectangle. */
class KvLineRunItem : public QGraphicsItem
{
public:
    KvLineRunItem(const QVector<QLineF> &lines, const QPen &pen);

    /** The bounding rectangle of a line item with this line and a pen of this width with square caps. */
    static QRectF lineRect(const QLineF &line, qreal penWidth);

    const QVector<QLineF> &lines() const { return m_lines; }
    const QPen &pen() const { return m_pen; }

    QRectF boundingRect() const override { return m_boundingRect; }
    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;

private:
    QVector<QLineF> m_lines;
    QPen m_pen;
    QRectF m_boundingRect;
};

} // namespace kvCharts
