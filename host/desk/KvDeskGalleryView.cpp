// SPDX-License-Identifier: MIT
#include "KvDeskGalleryView.h"

#include "KvDeskGalleryDelegate.h"
#include "KvDeskGalleryModel.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QDrag>
#include <QKeyEvent>
#include <QMimeData>
#include <QPainter>
#include <QScrollBar>

#include <algorithm>

namespace {

constexpr double dragOpacity = 0.8;
constexpr int badgeSize = 24;

bool isOpenKey(const QKeyEvent &event)
{
    return event.key() == Qt::Key_Return || event.key() == Qt::Key_Enter;
}

// Keys with modifiers are others' shortcuts.
bool isOwnKey(const QKeyEvent &event)
{
    const bool isPlain = (event.modifiers() & ~Qt::KeypadModifier) == Qt::NoModifier;
    return isPlain && (isOpenKey(event) || event.key() == Qt::Key_Delete);
}

void drawCount(QPainter *painter, const QPoint &topRight, int count)
{
    const auto color = [](const char *token) {
        return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
    };
    const QString text = QString::number(count);
    const int width = qMax(badgeSize, painter->fontMetrics().horizontalAdvance(text) + badgeSize / 2);
    const QRect badge(topRight.x() - width, topRight.y(), width, badgeSize);
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setPen(Qt::NoPen);
    painter->setBrush(color("accent"));
    painter->drawRoundedRect(badge, badgeSize / 2.0, badgeSize / 2.0);
    painter->setPen(color("on-accent"));
    painter->drawText(badge, Qt::AlignCenter, text);
}

} // namespace

KvDeskGalleryView::KvDeskGalleryView(QWidget *parent)
    : QListView(parent)
{
    setProperty("panel", true);
    setFrameShape(QFrame::NoFrame);
    setAccessibleName(tr("Gallery"));
    setItemDelegate(new KvDeskGalleryDelegate(this));
    setViewMode(IconMode);
    setMovement(Static);
    setResizeMode(Adjust);
    setGridSize(KvDeskGalleryDelegate::cell);
    setUniformItemSizes(true);
    setSelectionMode(ExtendedSelection);
    setEditTriggers(NoEditTriggers);
    setDragDropMode(DragOnly);
    // Files are dropped on the window.
    setAcceptDrops(false);
    viewport()->setAcceptDrops(false);
    setMouseTracking(true);
    setVerticalScrollMode(ScrollPerPixel);
    verticalScrollBar()->setSingleStep(KvDeskGalleryDelegate::cell.height() / 3);
    setTabKeyNavigation(false);
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotThemeChanged()));
}

QModelIndexList KvDeskGalleryView::selectedRows() const
{
    QModelIndexList rows = selectedIndexes();
    std::sort(rows.begin(), rows.end());
    return rows;
}

QModelIndexList KvDeskGalleryView::draggedRows() const
{
    QModelIndexList rows;
    for (const QModelIndex &index : selectedRows()) {
        if (!model()->flags(index).testFlag(Qt::ItemIsDragEnabled))
            continue;
        if (index == currentIndex())
            rows.prepend(index);
        else
            rows.append(index);
    }
    return rows;
}

QPixmap KvDeskGalleryView::dragPixmap(const QModelIndexList &indexes) const
{
    const auto thumbnail = indexes.first().data(KvDeskGalleryModel::ThumbnailRole).value<QImage>();
    const QPixmap picture = KvDeskGalleryDelegate::fitted(thumbnail, devicePixelRatioF());
    // Large enough for the badge, whatever the picture is.
    const QSize size =
        (picture.size() / picture.devicePixelRatio()).expandedTo(QSize(2 * badgeSize, badgeSize));
    QPixmap pixmap(size * devicePixelRatioF());
    pixmap.setDevicePixelRatio(devicePixelRatioF());
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setFont(font());
    painter.setOpacity(dragOpacity);
    painter.drawPixmap(0, 0, picture);
    painter.setOpacity(1.0);
    if (indexes.size() > 1)
        drawCount(&painter, QPoint(size.width(), 0), indexes.size());
    return pixmap;
}

void KvDeskGalleryView::startDrag(Qt::DropActions supportedActions)
{
    const QModelIndexList rows = draggedRows();
    if (rows.isEmpty())
        return;
    auto *const drag = new QDrag(this);
    drag->setMimeData(model()->mimeData(rows));
    drag->setPixmap(dragPixmap(rows));
    drag->setHotSpot(QPoint(badgeSize / 2, badgeSize / 2));
    drag->exec(supportedActions, Qt::CopyAction);
}

// Else the shortcuts of the window would take them.
bool KvDeskGalleryView::event(QEvent *event)
{
    if (event->type() == QEvent::ShortcutOverride && isOwnKey(*static_cast<QKeyEvent *>(event))) {
        event->accept();
        return true;
    }
    return QListView::event(event);
}

void KvDeskGalleryView::keyPressEvent(QKeyEvent *event)
{
    if (!isOwnKey(*event)) {
        QListView::keyPressEvent(event);
        return;
    }
    event->accept();
    if (!isOpenKey(*event))
        emit signalRemoveRequested();
    else if (currentIndex().isValid())
        emit signalOpenRequested(currentIndex());
}

void KvDeskGalleryView::mouseDoubleClickEvent(QMouseEvent *event)
{
    const QModelIndex index = indexAt(event->pos());
    if (event->button() == Qt::LeftButton && index.isValid())
        emit signalOpenRequested(index);
    else
        QListView::mouseDoubleClickEvent(event);
}

void KvDeskGalleryView::slotThemeChanged()
{
    viewport()->update();
}
