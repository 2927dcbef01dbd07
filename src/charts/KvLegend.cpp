// SPDX-License-Identifier: MIT
#include "charts/KvLegend.h"

#include "charts/KvChartFont.h"
#include "charts/KvChartPen.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLegendLayout.h"
#include "charts/KvTextRunItem.h"

#include <QGraphicsItemGroup>
#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QGraphicsTextItem>

namespace kvCharts {

KvLegend::KvLegend()
    : m_itemFont(KvChartFont::make(12.0))
    , m_titleFont(KvChartFont::make(14.0, QFont::Bold))
    , m_markerPen(KvChartPen::make(Qt::white))
    , m_markerBrush(Qt::SolidPattern)
    , m_measure(m_itemFont)
{}

void KvLegend::draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes)
{
    const QColor textColor = themes->color(KvChartThemes::LegendText);
    const double itemsHeight = m_items.isEmpty() ? 0.0 : drawItems(scene, textColor);
    if (!m_title.isEmpty())
        drawTitle(scene, textColor, itemsHeight);
}

void KvLegend::addItem(const QString &text, const QColor &color)
{
    m_items.append({text, color});
    m_extents.append(m_measure.measure(text));
    emit changed();
}

void KvLegend::clearItems()
{
    m_items.clear();
    m_extents.clear();
    emit changed();
}

void KvLegend::setTitle(const QString &title)
{
    m_title = title;
    emit changed();
}

double KvLegend::drawItems(QGraphicsScene *scene, const QColor &textColor)
{
    QVector<QSizeF> sizes;
    for (const KvTextExtent &extent : qAsConst(m_extents))
        sizes.append(extent.size);
    const QVector<KvLegendLayout::Entry> entries = KvLegendLayout::entries(sizes);
    auto *group = new QGraphicsItemGroup;
    QVector<KvPlacedText> texts;
    for (int i = 0; i < entries.size(); ++i) {
        addMarker(group, entries.at(i).marker, m_items.at(i).color);
        texts.append({m_items.at(i).text, entries.at(i).text, m_extents.at(i)});
    }
    for (QGraphicsItem *item : KvTextRunItem::make(texts, m_itemFont, textColor))
        group->addToGroup(item);
    group->setPos(KvLegendLayout::groupPosition(group->boundingRect().size()));
    scene->addItem(group);
    return group->boundingRect().height();
}

void KvLegend::addMarker(QGraphicsItemGroup *group, const QPointF &topLeft, const QColor &color)
{
    constexpr double side = KvLegendLayout::MarkerSize;
    m_markerBrush.setColor(color);
    m_markerPen.setColor(color);
    auto *marker = new QGraphicsRectItem(QRectF(topLeft, QSizeF(side, side)));
    marker->setBrush(m_markerBrush);
    marker->setPen(m_markerPen);
    group->addToGroup(marker);
}

void KvLegend::drawTitle(QGraphicsScene *scene, const QColor &textColor, double itemsHeight) const
{
    QGraphicsTextItem *title = scene->addText(m_title, m_titleFont);
    title->setDefaultTextColor(textColor);
    title->setPos(
        KvLegendLayout::titlePosition(title->boundingRect().size(), !m_items.isEmpty(), itemsHeight));
}

} // namespace kvCharts
