// SPDX-License-Identifier: MIT
#include "charts/KvTextRunItem.h"

#include <QGraphicsScene>
#include <QGraphicsTextItem>
#include <QPainter>

namespace kvCharts {

namespace {

QGraphicsItem *makeDocument(const KvPlacedText &text, const QFont &font, const QColor &color)
{
    auto *item = new QGraphicsTextItem(text.text);
    item->setFont(font);
    item->setDefaultTextColor(color);
    item->setPos(text.topLeft);
    return item;
}

// A painter sizes fonts for the resolution of its device; a scene's texts have the screen's size on any.
QFont fontForDevice(const QFont &font, const QPaintDevice *device)
{
    QFont deviceFont = font;
    deviceFont.setPointSizeF(font.pointSizeF() * QFontMetricsF(font).fontDpi() / device->logicalDpiY());
    return deviceFont;
}

} // namespace

void KvTextRunItem::addTo(QGraphicsScene *scene, const QVector<KvPlacedText> &texts, const QFont &font,
                          const QColor &color)
{
    for (QGraphicsItem *item : make(texts, font, color))
        scene->addItem(item);
}

QVector<QGraphicsItem *> KvTextRunItem::make(const QVector<KvPlacedText> &texts, const QFont &font,
                                             const QColor &color)
{
    QVector<QGraphicsItem *> documents;
    QVector<KvPlacedText> oneLine;
    oneLine.reserve(texts.size());
    for (const KvPlacedText &text : texts) {
        if (text.extent.isOneLine())
            oneLine.append(text);
        else
            documents.append(makeDocument(text, font, color));
    }
    if (!oneLine.isEmpty())
        documents.prepend(new KvTextRunItem(oneLine, font, color));
    return documents;
}

KvTextRunItem::KvTextRunItem(const QVector<KvPlacedText> &texts, const QFont &font, const QColor &color)
    : m_texts(texts)
    , m_font(font)
    , m_color(color)
{
    for (const KvPlacedText &text : texts)
        m_boundingRect |= QRectF(text.topLeft, text.extent.size);
}

void KvTextRunItem::paint(QPainter *painter, const QStyleOptionGraphicsItem * /*option*/,
                          QWidget * /*widget*/)
{
    painter->setFont(fontForDevice(m_font, painter->device()));
    painter->setPen(m_color);
    // A painter's own direction is the program's; charts look alike in every language.
    painter->setLayoutDirection(Qt::LeftToRight);
    constexpr qreal margin = KvTextMeasure::Margin;
    for (const KvPlacedText &text : qAsConst(m_texts))
        painter->drawText(text.topLeft + QPointF(margin, margin + text.extent.ascent), text.text);
}

} // namespace kvCharts
