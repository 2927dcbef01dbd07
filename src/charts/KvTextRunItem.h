// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvTextMeasure.h"

#include <QColor>
#include <QGraphicsItem>
#include <QVector>

class QGraphicsScene;

namespace kvCharts {

/** A text and where the bounding rectangle of its text item would have its top-left corner. */
struct KvPlacedText
{
    QString text;
    QPointF topLeft;
    KvTextExtent extent;
};

/**
 * Many one-line texts as one item: looks like a text item per text and covers the same rectangle, without the
 * cost of a text document each.
 */
class KvTextRunItem : public QGraphicsItem
{
public:
    /** Adds the texts to the scene: one item for all, and one each for those that need a text document. */
    static void addTo(QGraphicsScene *scene, const QVector<KvPlacedText> &texts, const QFont &font,
                      const QColor &color);

    /** The items that addTo() adds, for whoever puts them elsewhere and then owns them. */
    static QVector<QGraphicsItem *> make(const QVector<KvPlacedText> &texts, const QFont &font,
                                         const QColor &color);

    const QVector<KvPlacedText> &texts() const { return m_texts; }
    const QColor &color() const { return m_color; }

    QRectF boundingRect() const override { return m_boundingRect; }
    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;

private:
    KvTextRunItem(const QVector<KvPlacedText> &texts, const QFont &font, const QColor &color);

    QVector<KvPlacedText> m_texts;
    QFont m_font;
    QColor m_color;
    QRectF m_boundingRect;
};

} // namespace kvCharts
