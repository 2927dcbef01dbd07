// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseChartPart.h"
#include "charts/KvTextMeasure.h"

#include <QBrush>
#include <QFont>
#include <QPen>
#include <QVector>

class QGraphicsItemGroup;

namespace kvCharts {

/** The title of a chart and its coloured entries, above the plot. */
class KvLegend : public KvBaseChartPart
{
    Q_OBJECT
public:
    struct Item
    {
        QString text;
        QColor color;
    };

    KvLegend();

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override;

    void addItem(const QString &text, const QColor &color);
    void clearItems();
    const QVector<Item> &items() const { return m_items; }

    /** Announces a change even when the title is the same. */
    void setTitle(const QString &title);
    QString title() const { return m_title; }

private:
    double drawItems(QGraphicsScene *scene, const QColor &textColor);
    void addMarker(QGraphicsItemGroup *group, const QPointF &topLeft, const QColor &color);
    void drawTitle(QGraphicsScene *scene, const QColor &textColor, double itemsHeight) const;

    QFont m_itemFont;
    QFont m_titleFont;
    QPen m_markerPen;
    QBrush m_markerBrush;
    QString m_title;
    QVector<Item> m_items;
    KvTextMeasure m_measure;
    QVector<KvTextExtent> m_extents; ///< of the items, measured once as each further one redraws them all
};

} // namespace kvCharts
