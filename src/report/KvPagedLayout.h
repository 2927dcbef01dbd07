// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QList>
#include <QPointer>
#include <QRectF>
#include <QVector>

#include <memory>
#include <vector>

class KvReportNode;
class KvReportPage;
class KvReportProxyWidgetItem;
class KvTemplateModel;
class QGraphicsItem;
class QGraphicsRectItem;
class QGraphicsScene;
class QWidget;

/**
 * The pages of the paged view and the blocks' pieces on them: makes the scene's items, flows them, finds what
 * is under a point.
 *
 * While a block is dragged it is left out, and a mark stands where it would be dropped.
 */
class KvPagedLayout
{
public:
    /**
     * \param scene    not owned; all of its items are this layout's
     * \param listener has the slots slotUpdateSceneWithSizes() and slotWidgetsListChanged(), which blocks and
     *                 sections call when their size or their pieces change
     */
    KvPagedLayout(QGraphicsScene *scene, QObject *listener);
    ~KvPagedLayout();

    /** Deletes all pages and items; the blocks keep their widgets. */
    void clear();
    enum class OldItems { DeletedNow, Dropped };

    /**
     * Makes pages and items for all blocks of \a model but \a leftOut, which may be null. The old ones are
     * deleted now, but those that new ones would only repeat: they stay. Or all of them are dropped: that is
     * for callers inside of events that Qt sends to a list of widgets.
     */
    void rebuild(KvTemplateModel *model, const KvReportNode *leftOut,
                 OldItems oldItems = OldItems::DeletedNow);
    /** Measures all pieces and sections and flows the pieces anew. */
    void updateSizes();
    /** Removes the items of a block that is about to die. */
    void removeNode(const KvReportNode *node);

    /**
     * Pages that are no longer needed are hidden at once, but the header in which the user types may be on
     * one of them: whoever flows pieces has them deleted later, from the event loop.
     */
    bool hasDroppedItems() const { return !m_droppedItems.empty(); }
    void deleteDroppedItems();

    const QVector<KvReportPage *> &pages() const { return m_pages; }
    /** Items of all pieces of blocks, in layout order. */
    const QList<KvReportProxyWidgetItem *> &pieceItems() const { return m_pieceItems; }

    /** The page under a point of the scene, or null. */
    KvReportPage *pageAt(const QPointF &point) const;
    /** The item under a point whose piece is a block's, or null. */
    KvReportProxyWidgetItem *blockItemAt(const QPointF &point) const;
    /** The item under a point, be it a block's or a page section's, or null. */
    KvReportProxyWidgetItem *itemAt(const QPointF &point) const;
    /** The first item of a block, or null. */
    KvReportProxyWidgetItem *firstItemOf(const KvReportNode *node) const;

    /** Where the mark stands, as an index among the blocks that are shown; -1 for no mark. */
    int dropIndex() const { return m_dropIndex; }
    /** Moves the mark and flows the pieces around it; they are not measured. */
    void setDropIndex(int index);
    /** Rectangle of the mark in the scene; null without a mark. */
    QRectF markRect() const;
    /**
     * The index for a drop at height \a y of the scene. It counts pieces while blocks are inserted by their
     * own index; behind a block of several pieces the two differ. Deliberate.
     */
    int dropIndexAt(qreal y) const;

private:
    enum class Measuring { All, Nothing };

    void connectNode(KvReportNode *node);
    void addItemsOf(KvReportNode *node);
    void offerAgain(const QVector<KvReportPage *> &pages, const QList<KvReportProxyWidgetItem *> &items);
    KvReportProxyWidgetItem *takeOldItem(const KvReportNode *node, const QWidget *piece);
    KvReportPage *makePage(int index);
    void place(Measuring measuring);
    KvReportPage *addPage();
    QRect contentRectOf(int page);
    void dropPagesFrom(int count);
    void drop(QGraphicsItem *item);
    void drop(KvReportPage *page);
    template <typename List>
    void removeSurplus(const List &old, const List &kept, OldItems fate);
    void showMarkAt(const QPoint &topLeft);
    void finish();

    QGraphicsScene *m_scene;
    QObject *m_listener;
    QPointer<KvTemplateModel> m_model;
    QVector<KvReportPage *> m_pages;
    std::vector<std::unique_ptr<QGraphicsItem>> m_droppedItems; ///< in the scene, hidden
    QVector<const KvReportNode *> m_nodes; ///< the blocks shown, in order, also those without pieces
    QList<KvReportProxyWidgetItem *> m_pieceItems;
    // What a rebuild may take again; empty at all other times.
    QVector<KvReportPage *> m_oldPages;
    QHash<const QWidget *, KvReportProxyWidgetItem *> m_oldItems; ///< by their pieces
    QGraphicsRectItem *m_mark = nullptr; ///< in the scene while there is a drop index that is met
    int m_dropIndex = -1;
};
