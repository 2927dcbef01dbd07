// SPDX-License-Identifier: MIT
#pragma once

#include <QPointer>
#include <QWidget>

#include <memory>

class KvReportNode;
namespace Ui {
class KvNodeWrapperWidgetUi;
}

/**
 * White frame around one piece of a block, with the page's margins at its left and right.
 *
 * Only carries the piece: when the frame dies it lets the piece go first, since pieces belong to their block.
 */
class KvNodeWrapperWidget : public QWidget
{
    Q_OBJECT
public:
    KvNodeWrapperWidget(KvReportNode *node, QWidget *piece);
    ~KvNodeWrapperWidget() override;

    KvReportNode *node() const { return m_node; }
    /** Null once the piece died or moved on into another frame. */
    QWidget *piece() const;

    void setMargin(int pixels);
    /** Takes the size that the piece asks for now. */
    void fitToPiece();

private:
    void applyStyle();

    std::unique_ptr<Ui::KvNodeWrapperWidgetUi> m_ui;
    KvReportNode *m_node;
    QPointer<QWidget> m_piece;
};
