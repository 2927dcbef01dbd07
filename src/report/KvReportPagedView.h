// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvPagedLayout.h"

#include <QBasicTimer>
#include <QGraphicsView>
#include <QPointer>

class KvBaseDisplayWidget;
class KvReportDragData;
class KvReportNode;
class KvSelectionOverlay;
class QDrag;
class QTextEdit;

/**
 * Shows a template as a column of pages on a dark background and flows its blocks onto them. Here blocks are
 * selected, edited, deleted, moved, and dropped from the palette or the host's gallery.
 *
 * A page always spans the view; blocks flow anew whenever the template, the page width or a block's size
 * changes.
 *
 * A click selects the piece under it. A text that is selected takes mouse and keys itself, so a block is
 * dragged while it is not selected, by anything that is no text, or by its margins.
 */
class KvReportPagedView : public QGraphicsView
{
    Q_OBJECT
public:
    explicit KvReportPagedView(QWidget *parent = nullptr);
    ~KvReportPagedView() override;

    /** Set once; not owned, may be null. */
    void setModel(KvTemplateModel *model);
    /** Null, too, once the model is gone. */
    KvTemplateModel *model() const;

    const QVector<KvReportPage *> &pages() const { return m_layout.pages(); }
    /** Items of all pieces of blocks, in layout order. */
    const QList<KvReportProxyWidgetItem *> &pieceItems() const { return m_layout.pieceItems(); }

    /** Null while nothing is selected. */
    KvReportProxyWidgetItem *selectedItem() const;
    /** The block whose piece is selected; null when nothing or a page section is. */
    KvReportNode *selectedNode() const;
    /** Selects the first piece of a block, as soon as it is laid out. */
    void selectNode(KvReportNode *node);
    /** Whether the keyboard is in a text on the pages, so that keys such as Delete are the text's. */
    bool isEditingText() const;
    /** Index of the mark of a drop among the blocks shown; -1 while there is none. */
    int dropIndex() const { return m_layout.dropIndex(); }

signals:
    /** The selected piece's display widget, or null when nothing is selected any more. */
    void signalSelectionChanged(KvBaseDisplayWidget *aSelectedWidget);

public slots:
    void slotCloseAllEditors();
    void slotWidgetsListChanged();
    void slotFocusItemChanged(QGraphicsItem *newFocusItem, QGraphicsItem *oldFocusItem,
                              Qt::FocusReason reason);
    void slotUpdateSceneWithSizes();
    void slotBeforeDeleteNode(KvReportNode *aNode);
    void slotDeleteButtonClicked();
    void slotFocusBackToPageView();

protected:
    /** Runs a drag until the drop. */
    virtual void runDrag(QDrag *drag);

    bool event(QEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void showEvent(QShowEvent *event) override;
    void timerEvent(QTimerEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    bool focusNextPrevChild(bool next) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void contextMenuEvent(QContextMenuEvent *event) override;
    void dragEnterEvent(QDragEnterEvent *event) override;
    void dragMoveEvent(QDragMoveEvent *event) override;
    void dragLeaveEvent(QDragLeaveEvent *event) override;
    void dropEvent(QDropEvent *event) override;
    void drawBackground(QPainter *painter, const QRectF &rect) override;

private slots:
    void slotDeleteDroppedItems();
    void slotFollowViewWidth();
    void slotModelDestroyed();

private:
    enum class Press {
        None,      ///< no button is down
        Forwarded, ///< an embedded widget has it
        OnItem,    ///< may become a click or a drag
        Ignored    ///< nothing follows from it
    };

    void rebuild(KvPagedLayout::OldItems oldItems);
    bool applyViewWidth(KvPagedLayout::OldItems oldItems);
    bool isLayoutHeld() const;

    void select(KvReportProxyWidgetItem *item);
    void clearSelection();
    void dropOverlay();
    void finishLayout();

    QTextEdit *editorOf(const KvReportProxyWidgetItem *item) const;
    bool belongsToEmbedded(const QPoint &viewPoint) const;
    void click(const QPoint &viewPoint);
    void placeTextCursor(const QPoint &viewPoint);
    void startDrag();
    void endDrag();

    bool trackDrag(const KvReportDragData &dragData, const QPoint &viewPoint);
    /** Answers an event of a drag; false where it carries nothing that pages take. */
    bool followDrag(QDragMoveEvent *event);
    void scrollToDrag();
    void leaveDrag();
    void setDropIndex(int index);
    /** \a target is the block under the drop, or null. Returns the block to select, or null. */
    KvReportNode *drop(const KvReportDragData &dragData, KvReportNode *target);
    KvReportNode *dropImage(const QString &path, KvReportNode *target, int index);
    void dropMovedBlock(int from, int to);

    QGraphicsScene *m_scene;
    KvPagedLayout m_layout;
    QPointer<KvTemplateModel> m_model;
    bool m_layoutRunning = false;
    bool m_updatesSuppressed = false;

    QPointer<KvReportProxyWidgetItem> m_selectedItem;
    KvSelectionOverlay *m_overlay = nullptr; ///< in the scene; null while nothing is selected
    KvReportNode *m_nodeToSelect = nullptr;  ///< selected by the next rebuild
    QGraphicsItem *m_focusItem = nullptr;    ///< only to be compared, never to be followed

    Press m_press = Press::None;
    QPoint m_pressPosition;
    QPointer<KvReportProxyWidgetItem> m_pressedItem;
    KvReportNode *m_draggedNode = nullptr;
    int m_draggedIndex = -1; ///< where the drag began; -1 while none runs that began here
    QPoint m_dragPosition;
    QBasicTimer m_scrollTimer; ///< goes on scrolling while a drag rests near an edge
};
