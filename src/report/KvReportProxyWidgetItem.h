// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsProxyWidget>

class KvBaseDisplayWidget;
class KvReportNode;

/** Scene item that carries one widget of a report: a piece of a block, or a page section. */
class KvReportProxyWidgetItem : public QGraphicsProxyWidget
{
    Q_OBJECT
public:
    explicit KvReportProxyWidgetItem(QGraphicsItem *parent = nullptr);

    /**
     * A new item with piece \a index of a block in its white frame with the page's margins, fitted to its
     * size; null when the block has no such piece. The caller owns the item; the piece stays the block's.
     */
    static KvReportProxyWidgetItem *createForPiece(KvReportNode *node, int index);
    /** As above, for a piece that was asked for already. */
    static KvReportProxyWidgetItem *createForPiece(KvReportNode *node, QWidget &piece);

    /** The block whose piece is shown; null for page sections. */
    KvReportNode *node() const { return m_node; }
    void setNode(KvReportNode *node) { m_node = node; }
    bool belongsToBlock() const { return m_node != nullptr; }

    /** The display widget of the piece; null once it is gone. */
    KvBaseDisplayWidget *displayWidget() const { return m_displayWidget; }
    void setDisplayWidget(KvBaseDisplayWidget *displayWidget);

    /** The piece in this item's frame; null for page sections, and once it died or moved on. */
    QWidget *piece() const;

    /** Takes the scene's focus, or will as soon as the scene's window is activated. */
    void takeFocus();
    /** Whether it ever had the focus. The scene may remember such an item and give the focus back to it. */
    bool hadFocus() const { return m_hadFocus; }

    /** Fits a block's item to the present size of its piece and of the page's margins. */
    void adjustToPiece();
    /** Height for the page flow, in whole pixels. */
    int pieceHeight() const;

protected:
    void focusInEvent(QFocusEvent *event) override;

private slots:
    void slotDisplayWidgetDestroyed();

private:
    KvReportNode *m_node = nullptr;
    KvBaseDisplayWidget *m_displayWidget = nullptr;
    bool m_hadFocus = false;
};
