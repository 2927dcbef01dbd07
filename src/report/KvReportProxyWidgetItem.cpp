// SPDX-License-Identifier: MIT
#include "report/KvReportProxyWidgetItem.h"

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "report/KvNodeWrapperWidget.h"
#include "report/KvReportNode.h"
#include "templates/KvTemplateContext.h"

#include <QtMath>

KvReportProxyWidgetItem::KvReportProxyWidgetItem(QGraphicsItem *parent)
    : QGraphicsProxyWidget(parent)
{
    // What is selected has the keyboard. Tab leads out of the pages, not once through all that is on them.
    setFocusPolicy(Qt::ClickFocus);
}

KvReportProxyWidgetItem *KvReportProxyWidgetItem::createForPiece(KvReportNode *node, int index)
{
    KvBaseDisplayWidget *displayWidget = node->displayWidget();
    QWidget *piece = displayWidget ? displayWidget->subWidgetAt(index) : nullptr;
    return piece ? createForPiece(node, *piece) : nullptr;
}

KvReportProxyWidgetItem *KvReportProxyWidgetItem::createForPiece(KvReportNode *node, QWidget &piece)
{
    auto *wrapper = new KvNodeWrapperWidget(node, &piece);
    wrapper->setMargin(node->context()->marginPixels());
    wrapper->fitToPiece();
    auto *item = new KvReportProxyWidgetItem;
    item->setNode(node);
    item->setDisplayWidget(node->displayWidget());
    item->setWidget(wrapper);
    return item;
}

QWidget *KvReportProxyWidgetItem::piece() const
{
    const auto *wrapper = qobject_cast<const KvNodeWrapperWidget *>(widget());
    return wrapper ? wrapper->piece() : nullptr;
}

void KvReportProxyWidgetItem::setDisplayWidget(KvBaseDisplayWidget *displayWidget)
{
    if (m_displayWidget)
        m_displayWidget->displaySignals()->disconnect(this);
    m_displayWidget = displayWidget;
    if (m_displayWidget)
        connect(m_displayWidget->displaySignals(), SIGNAL(destroyed()), this,
                                                          SLOT(slotDisplayWidgetDestroyed()));
}

void KvReportProxyWidgetItem::slotDisplayWidgetDestroyed()
{
    m_displayWidget = nullptr;
}

void KvReportProxyWidgetItem::takeFocus()
{
    // In a window that is not active no event tells of it.
    m_hadFocus = true;
    setFocus(Qt::OtherFocusReason);
}

void KvReportProxyWidgetItem::focusInEvent(QFocusEvent *event)
{
    m_hadFocus = true;
    QGraphicsProxyWidget::focusInEvent(event);
}

void KvReportProxyWidgetItem::adjustToPiece()
{
    auto *wrapper = qobject_cast<KvNodeWrapperWidget *>(widget());
    if (!wrapper)
        return;
    if (m_node)
        wrapper->setMargin(m_node->context()->marginPixels());
    wrapper->fitToPiece();
    const QSizeF wanted = wrapper->size();
    if (size() != wanted)
        resize(wanted);
}

int KvReportProxyWidgetItem::pieceHeight() const
{
    return qCeil(boundingRect().height());
}
