// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsItemGroup>

class KvReportProxyWidgetItem;
class QGraphicsProxyWidget;

/** What shows that an item of a page is selected: a frame, handles at its corners, and a button that deletes
 * a block. */
class KvSelectionOverlay : public QGraphicsItemGroup
{
public:
    /**
     * Not in a scene yet.
     * \param item           the selected item; not owned
     * \param deleteReceiver its slotDeleteButtonClicked() is called, queued, when the button is clicked
     */
    KvSelectionOverlay(const KvReportProxyWidgetItem *item, QObject *deleteReceiver);

    /** Follows the place and size that the item has now. */
    void update();
    /** Place of the delete button in the scene; null where the item belongs to no block. */
    QRectF deleteButtonRect() const;

private:
    void addHandles();
    void addDeleteButton(QObject *receiver);

    const KvReportProxyWidgetItem *m_item;
    QGraphicsRectItem *m_frame;
    QVector<QGraphicsRectItem *> m_handles; ///< top left, top right, bottom left, bottom right
    QGraphicsProxyWidget *m_deleteButton = nullptr;
};
