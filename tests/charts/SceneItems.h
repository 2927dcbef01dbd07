// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsScene>
#include <QVector>

/** The items of one class in a scene, the lowest first. */
template <class Item>
QVector<Item *> itemsOf(const QGraphicsScene *scene)
{
    QVector<Item *> result;
    const QList<QGraphicsItem *> items = scene->items(Qt::AscendingOrder);
    for (QGraphicsItem *item : items) {
        if (auto *found = dynamic_cast<Item *>(item))
            result.append(found);
    }
    return result;
}
