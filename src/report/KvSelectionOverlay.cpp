// SPDX-License-Identifier: MIT
#include "report/KvSelectionOverlay.h"

#include "report/KvReportProxyWidgetItem.h"
#include "widgets/KvTransparentIconButton.h"

#include <QCoreApplication>
#include <QGraphicsProxyWidget>
#include <QPen>

namespace {

constexpr qreal kFrameZ = 1;
constexpr qreal kHandleZ = 2;
constexpr qreal kButtonZ = 3;
constexpr QSizeF kHandleSize(6, 4);
constexpr QPointF kHandleOffset(-3, -2);
constexpr qreal kButtonGap = 10; // pixels from the item's right edge

const Qt::ConnectionType kQueuedUnique = Qt::ConnectionType(Qt::QueuedConnection | Qt::UniqueConnection);

QColor accent()
{
    return QColor(QStringLiteral("#00659D"));
}

} // namespace

KvSelectionOverlay::KvSelectionOverlay(const KvReportProxyWidgetItem *item, QObject *deleteReceiver)
    : m_item(item)
    , m_frame(new QGraphicsRectItem)
{
    setHandlesChildEvents(false);
    // Above the blocks.
    setZValue(kFrameZ);
    m_frame->setPen(QPen(accent()));
    m_frame->setZValue(kFrameZ);
    addToGroup(m_frame);
    addHandles();
    if (m_item->belongsToBlock())
        addDeleteButton(deleteReceiver);
    update();
}

void KvSelectionOverlay::addHandles()
{
    for (int i = 0; i < 4; ++i) {
        auto *handle = new QGraphicsRectItem(QRectF(kHandleOffset, kHandleSize));
        handle->setPen(Qt::NoPen);
        handle->setBrush(accent());
        handle->setZValue(kHandleZ);
        addToGroup(handle);
        m_handles.append(handle);
    }
}

void KvSelectionOverlay::addDeleteButton(QObject *receiver)
{
    auto *button = new KvTransparentIconButton(QStringLiteral("Icons/IconTrash.svg"));
    // The same in both themes: the button stands on white paper.
    button->setIconColors(QColor(0xf0, 0xb1, 0xb5), QColor(0xa6, 0x1d, 0x24), QColor(0xe8, 0x47, 0x49),
                          QColor(0x4d, 0x4d, 0x4d));
    const QString text = QCoreApplication::translate("KvSelectionOverlay", "Delete block");
    button->setAccessibleName(text);
    button->setToolTip(QCoreApplication::translate("KvSelectionOverlay", "Delete block (Del)"));
    // A window of its own inside of the scene: without this it would paint the program's background.
    button->setAttribute(Qt::WA_TranslucentBackground);
    button->setFocusPolicy(Qt::NoFocus);
    // Queued: the button dies with the block.
    QObject::connect(button, SIGNAL(clicked(bool)), receiver, SLOT(slotDeleteButtonClicked()), kQueuedUnique);
    m_deleteButton = new QGraphicsProxyWidget;
    m_deleteButton->setFocusPolicy(Qt::NoFocus);
    m_deleteButton->setWidget(button);
    m_deleteButton->setZValue(kButtonZ);
    addToGroup(m_deleteButton);
}

void KvSelectionOverlay::update()
{
    const QRectF rect(m_item->scenePos(), m_item->size());
    m_frame->setRect(QRectF(QPointF(0, 0), rect.size()));
    m_frame->setPos(rect.topLeft());
    m_handles.at(0)->setPos(rect.topLeft());
    m_handles.at(1)->setPos(rect.topRight());
    m_handles.at(2)->setPos(rect.bottomLeft());
    m_handles.at(3)->setPos(rect.bottomRight());
    if (!m_deleteButton)
        return;
    const QSizeF size = m_deleteButton->size();
    m_deleteButton->setPos(rect.left() + (rect.width() - size.width() - kButtonGap),
                           rect.top() + (rect.height() - size.height()) * 0.5);
}

QRectF KvSelectionOverlay::deleteButtonRect() const
{
    return m_deleteButton ? QRectF(m_deleteButton->scenePos(), m_deleteButton->size()) : QRectF();
}
