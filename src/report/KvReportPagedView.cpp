// SPDX-License-Identifier: MIT
#include "report/KvReportPagedView.h"

#include "report/KvBaseDisplayWidget.h"
#include "report/KvReportDragData.h"
#include "report/KvReportNode.h"
#include "report/KvReportPage.h"
#include "report/KvReportProxyWidgetItem.h"
#include "report/KvSelectionOverlay.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvTemplateModel.h"

#include <QApplication>
#include <QDrag>
#include <QGraphicsScene>
#include <QJsonObject>
#include <QMimeData>
#include <QMouseEvent>
#include <QScopeGuard>
#include <QScopedValueRollback>
#include <QScrollBar>
#include <QTextEdit>

namespace {

constexpr int kScrollMargin = 50;    // pixels around the cursor that a drag keeps in view
constexpr int kCursorHeight = 60;    // of which half is above the cursor
constexpr int kScrollInterval = 100; // ms

constexpr int kShadowWidth = 6;
constexpr int kShadowAlpha = 14; // of each of the nested frames that make up the shadow

const char kImageType[] = "Image View";
const char kImagePathKey[] = "imgPath";
const char kImageDataKey[] = "imgData";

/** Points the configuration to an image file and drops the picture that it holds. */
void setImagePath(KvBaseEditorNodeCfg *cfg, const QString &path)
{
    QJsonObject config;
    // The picture is not written where there is a value already: encoding it would be for nothing.
    config[QLatin1String(kImageDataKey)] = QString();
    cfg->toJson(config);
    config.remove(QLatin1String(kImageDataKey));
    config[QLatin1String(kImagePathKey)] = path;
    cfg->fromJson(config);
}

QJsonObject newImageConfig(const QString &path)
{
    return {{QLatin1String(kImagePathKey), path},
            {QStringLiteral("alignment"), QStringLiteral("132")},
            {QStringLiteral("widthPercent"), QStringLiteral("75")}};
}

} // namespace

KvReportPagedView::KvReportPagedView(QWidget *parent)
    : QGraphicsView(parent)
    , m_scene(new QGraphicsScene(this))
    , m_layout(m_scene, this)
{
    qRegisterMetaType<KvBaseDisplayWidget *>("KvBaseDisplayWidget*");
    setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    setFrameShape(QFrame::NoFrame);
    setAcceptDrops(true);
    // Report pages read from left to right whatever the language of the program around them.
    setLayoutDirection(Qt::LeftToRight);
    m_scene->setBackgroundBrush(QColor(QStringLiteral("#313131")));
    // Pages are few for a list, and come, go and grow with every measurement: a tree of their places would be
    // built anew each time, at more than it ever saves.
    m_scene->setItemIndexMethod(QGraphicsScene::NoIndex);
    setScene(m_scene);
    connect(m_scene, SIGNAL(focusItemChanged(QGraphicsItem*,QGraphicsItem*,Qt::FocusReason)), this,
                            SLOT(slotFocusItemChanged(QGraphicsItem*,QGraphicsItem*,Qt::FocusReason)));
    slotWidgetsListChanged();
}

KvReportPagedView::~KvReportPagedView()
{
    // The scene tells of every focus that it takes away while it dies, and pieces that are let go may tell of
    // their size or give the keyboard back.
    m_scene->disconnect(this);
    m_layoutRunning = true;
    dropOverlay();
    m_selectedItem = nullptr;
    m_pressedItem = nullptr;
    m_layout.clear();
}

KvTemplateModel *KvReportPagedView::model() const
{
    return m_model;
}

void KvReportPagedView::setModel(KvTemplateModel *model)
{
    m_model = model;
    if (m_model) {
        connect(m_model, SIGNAL(signalCloseAllEditors()), this, SLOT(slotCloseAllEditors()));
        connect(m_model, SIGNAL(signalBeforeDeleteNode(KvReportNode*)), this,
                                SLOT(slotBeforeDeleteNode(KvReportNode*)));
        connect(m_model, SIGNAL(signalListChanged()), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(signalHeaderStateChanged(bool)), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(signalFooterStateChanged(bool)), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(signalPageNumberingStateChanged(bool)), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(destroyed(QObject*)), this, SLOT(slotModelDestroyed()));
    }
    if (!applyViewWidth(KvPagedLayout::OldItems::DeletedNow))
        slotWidgetsListChanged();
}

bool KvReportPagedView::isLayoutHeld() const
{
    // A file that is read announces each of its blocks; the last announcement finds the loading over. While a
    // report is printed its pieces are on the printer's pages.
    return m_updatesSuppressed || (m_model && (m_model->isLoading() || m_model->context()->isPrinting()));
}

void KvReportPagedView::slotWidgetsListChanged()
{
    rebuild(KvPagedLayout::OldItems::DeletedNow);
}

void KvReportPagedView::rebuild(KvPagedLayout::OldItems oldItems)
{
    if (isLayoutHeld())
        return;
    const int scrollPosition = verticalScrollBar()->value();
    {
        // Blocks answer to the page's content height, and texts to the end of their editing, with size
        // changes, which the rebuild takes in anyway.
        const QScopedValueRollback<bool> guard(m_layoutRunning, true);
        slotCloseAllEditors();
        m_pressedItem = nullptr;
        m_focusItem = nullptr;
        if (m_model)
            m_layout.rebuild(m_model, m_draggedNode, oldItems);
        else
            m_layout.clear();
    }
    finishLayout();
    if (KvReportNode *node = std::exchange(m_nodeToSelect, nullptr))
        select(m_layout.firstItemOf(node));
    verticalScrollBar()->setValue(scrollPosition);
}

void KvReportPagedView::slotUpdateSceneWithSizes()
{
    // Sections and tables signal back into the pass that measures them.
    if (m_layoutRunning || isLayoutHeld() || !m_model || pages().isEmpty())
        return;
    const QScopedValueRollback<bool> guard(m_layoutRunning, true);
    m_layout.updateSizes();
    finishLayout();
}

void KvReportPagedView::slotBeforeDeleteNode(KvReportNode *aNode)
{
    if (m_selectedItem && m_selectedItem->node() == aNode)
        slotCloseAllEditors();
    if (m_nodeToSelect == aNode)
        m_nodeToSelect = nullptr;
    if (m_draggedNode == aNode)
        m_draggedNode = nullptr;
    m_layout.removeNode(aNode);
}

// ---- selection ----

KvReportProxyWidgetItem *KvReportPagedView::selectedItem() const
{
    return m_selectedItem;
}

KvReportNode *KvReportPagedView::selectedNode() const
{
    return m_selectedItem ? m_selectedItem->node() : nullptr;
}

void KvReportPagedView::selectNode(KvReportNode *node)
{
    if (KvReportProxyWidgetItem *item = m_layout.firstItemOf(node))
        select(item);
    else
        m_nodeToSelect = node;
}

void KvReportPagedView::select(KvReportProxyWidgetItem *item)
{
    if (!item) {
        slotCloseAllEditors();
        return;
    }
    if (item == m_selectedItem)
        return;
    dropOverlay();
    m_selectedItem = item;
    m_overlay = new KvSelectionOverlay(item, this);
    m_scene->addItem(m_overlay);
    item->takeFocus();
    setFocus(Qt::OtherFocusReason);
    emit signalSelectionChanged(item->displayWidget());
    if (QTextEdit *editor = m_selectedItem ? editorOf(m_selectedItem) : nullptr)
        editor->setFocus(Qt::OtherFocusReason);
}

void KvReportPagedView::slotCloseAllEditors()
{
    if (!m_selectedItem && !m_overlay)
        return;
    clearSelection();
    emit signalSelectionChanged(nullptr);
}

void KvReportPagedView::clearSelection()
{
    dropOverlay();
    m_selectedItem = nullptr;
    m_scene->setFocusItem(nullptr);
}

void KvReportPagedView::dropOverlay()
{
    delete std::exchange(m_overlay, nullptr);
}

void KvReportPagedView::finishLayout()
{
    const bool isShown = m_selectedItem && m_selectedItem->isVisible();
    if (m_overlay) {
        m_overlay->setVisible(isShown);
        if (isShown)
            m_overlay->update();
    }
    if (m_layout.hasDroppedItems())
        QMetaObject::invokeMethod(this, "slotDeleteDroppedItems", Qt::QueuedConnection);
}

void KvReportPagedView::slotDeleteDroppedItems()
{
    // A selected section may be on one of these pages; its text is taken over first.
    if (m_selectedItem && !m_selectedItem->isVisible())
        slotCloseAllEditors();
    m_layout.deleteDroppedItems();
}

void KvReportPagedView::slotModelDestroyed()
{
    const QScopedValueRollback<bool> guard(m_layoutRunning, true);
    const bool wasSelected = m_selectedItem || m_overlay;
    m_nodeToSelect = nullptr;
    clearSelection();
    // Before anybody is told: an options panel that dies takes its text over, and the template's are gone.
    m_layout.clear();
    if (wasSelected)
        emit signalSelectionChanged(nullptr);
}

void KvReportPagedView::slotFocusItemChanged(QGraphicsItem *newFocusItem, QGraphicsItem *oldFocusItem,
                                             Qt::FocusReason reason)
{
    Q_UNUSED(oldFocusItem)
    Q_UNUSED(reason)
    m_focusItem = newFocusItem;
}

void KvReportPagedView::slotDeleteButtonClicked()
{
    KvReportNode *node = selectedNode();
    if (!node || !m_model)
        return;
    // The selection goes with the block.
    m_model->removeNode(node);
}

void KvReportPagedView::slotFocusBackToPageView()
{
    if (m_selectedItem)
        m_selectedItem->takeFocus();
    setFocus(Qt::OtherFocusReason);
}

QTextEdit *KvReportPagedView::editorOf(const KvReportProxyWidgetItem *item) const
{
    return qobject_cast<QTextEdit *>(item->belongsToBlock() ? item->piece() : item->widget());
}

// Nothing on the pages is to be reached by Tab: what is edited gets the keyboard when it is selected.

bool KvReportPagedView::event(QEvent *event)
{
    const auto *key = event->type() == QEvent::KeyPress ? static_cast<QKeyEvent *>(event) : nullptr;
    const bool isTab = key && (key->key() == Qt::Key_Tab || key->key() == Qt::Key_Backtab) &&
                       !(key->modifiers() & (Qt::ControlModifier | Qt::AltModifier));
    if (!isTab || isEditingText())
        return QGraphicsView::event(event);
    event->accept();
    focusNextPrevChild(key->key() == Qt::Key_Tab);
    return true;
}

void KvReportPagedView::focusInEvent(QFocusEvent *event)
{
    const bool isByTab = event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason;
    QFocusEvent other(event->type(), isByTab ? Qt::OtherFocusReason : event->reason());
    QGraphicsView::focusInEvent(&other);
}

bool KvReportPagedView::focusNextPrevChild(bool next)
{
    return QAbstractScrollArea::focusNextPrevChild(next);
}

bool KvReportPagedView::isEditingText() const
{
    const QTextEdit *editor = m_selectedItem ? editorOf(m_selectedItem) : nullptr;
    return editor && !editor->isReadOnly() && m_focusItem == m_selectedItem.data();
}

// ---- mouse ----

bool KvReportPagedView::belongsToEmbedded(const QPoint &viewPoint) const
{
    const QPointF point = mapToScene(viewPoint);
    if (m_overlay && m_overlay->deleteButtonRect().contains(point))
        return true;
    if (!m_selectedItem)
        return false;
    const QTextEdit *editor = editorOf(m_selectedItem);
    if (!editor || m_layout.itemAt(point) != m_selectedItem)
        return false;
    const QPointF origin = editor->mapTo(m_selectedItem->widget(), QPoint(0, 0));
    return QRectF(m_selectedItem->scenePos() + origin, editor->size()).contains(point);
}

void KvReportPagedView::mousePressEvent(QMouseEvent *event)
{
    if (belongsToEmbedded(event->pos())) {
        m_press = Press::Forwarded;
        QGraphicsView::mousePressEvent(event);
        return;
    }
    event->accept();
    m_pressPosition = event->pos();
    m_pressedItem = m_layout.itemAt(mapToScene(event->pos()));
    m_press = event->button() == Qt::LeftButton ? Press::OnItem : Press::Ignored;
}

void KvReportPagedView::mouseMoveEvent(QMouseEvent *event)
{
    // The release may have gone to a window that popped up meanwhile.
    if (event->buttons() == Qt::NoButton)
        m_press = Press::None;
    if (m_press == Press::None || m_press == Press::Forwarded) {
        QGraphicsView::mouseMoveEvent(event);
        return;
    }
    event->accept();
    const bool isFar = (event->pos() - m_pressPosition).manhattanLength() > QApplication::startDragDistance();
    if (m_press == Press::OnItem && isFar && m_pressedItem && m_pressedItem->belongsToBlock())
        startDrag();
}

void KvReportPagedView::mouseReleaseEvent(QMouseEvent *event)
{
    const Press press = std::exchange(m_press, Press::None);
    if (press == Press::Forwarded) {
        QGraphicsView::mouseReleaseEvent(event);
        return;
    }
    event->accept();
    if (press == Press::OnItem && event->button() == Qt::LeftButton)
        click(event->pos());
}

void KvReportPagedView::mouseDoubleClickEvent(QMouseEvent *event)
{
    if (!belongsToEmbedded(event->pos())) {
        mousePressEvent(event);
        return;
    }
    m_press = Press::Forwarded;
    QGraphicsView::mouseDoubleClickEvent(event);
}

void KvReportPagedView::contextMenuEvent(QContextMenuEvent *event)
{
    if (belongsToEmbedded(event->pos()))
        QGraphicsView::contextMenuEvent(event);
}

void KvReportPagedView::click(const QPoint &viewPoint)
{
    KvReportProxyWidgetItem *item = m_layout.itemAt(mapToScene(viewPoint));
    if (item && item == m_selectedItem) {
        slotFocusBackToPageView();
        return;
    }
    select(item);
    placeTextCursor(viewPoint);
}

void KvReportPagedView::placeTextCursor(const QPoint &viewPoint)
{
    // Only now the text under the mouse is open for editing.
    const QPointF point = mapToScene(viewPoint);
    if (!belongsToEmbedded(viewPoint) || (m_overlay && m_overlay->deleteButtonRect().contains(point)))
        return;
    QTextEdit *editor = editorOf(m_selectedItem);
    const QPointF origin = m_selectedItem->scenePos() + editor->mapTo(m_selectedItem->widget(), QPoint(0, 0));
    editor->setTextCursor(editor->cursorForPosition((point - origin).toPoint()));
}

// ---- dragging a block ----

void KvReportPagedView::startDrag()
{
    KvReportNode *node = m_pressedItem->node();
    const int index = m_model ? m_model->nodes().indexOf(node) : -1;
    m_press = Press::None;
    if (index < 0)
        return;
    auto *drag = new QDrag(this);
    drag->setMimeData(node->mimeData(index));
    drag->setPixmap(node->factory()->dragPixmap());
    m_draggedNode = node;
    m_draggedIndex = index;
    slotWidgetsListChanged();
    const QPointer<KvReportPagedView> guard(this);
    runDrag(drag);
    if (guard)
        endDrag();
}

void KvReportPagedView::runDrag(QDrag *drag)
{
    drag->exec(Qt::MoveAction);
}

void KvReportPagedView::endDrag()
{
    m_scrollTimer.stop();
    m_draggedNode = nullptr;
    m_draggedIndex = -1;
    m_layout.setDropIndex(-1);
    slotWidgetsListChanged();
}

// ---- drops ----

void KvReportPagedView::setDropIndex(int index)
{
    if (index == m_layout.dropIndex())
        return;
    const QScopedValueRollback<bool> guard(m_layoutRunning, true);
    slotCloseAllEditors();
    m_layout.setDropIndex(index);
    finishLayout();
}

bool KvReportPagedView::trackDrag(const KvReportDragData &dragData, const QPoint &viewPoint)
{
    const QPointF point = mapToScene(viewPoint);
    if (dragData.kind() == KvReportDragData::Kind::Nothing || !m_layout.pageAt(point)) {
        setDropIndex(-1);
        return false;
    }
    if (m_layout.markRect().contains(point))
        return true;
    const bool replacesImage =
        dragData.kind() == KvReportDragData::Kind::GalleryImage && m_layout.blockItemAt(point);
    setDropIndex(replacesImage ? -1 : m_layout.dropIndexAt(point.y()));
    return true;
}

bool KvReportPagedView::followDrag(QDragMoveEvent *event)
{
    const KvReportDragData dragData = KvReportDragData::fromMimeData(event->mimeData());
    const bool isTaken = trackDrag(dragData, event->pos());
    event->setAccepted(isTaken);
    if (isTaken)
        event->acceptProposedAction();
    if (dragData.kind() == KvReportDragData::Kind::Nothing) {
        m_scrollTimer.stop();
        return false;
    }
    m_dragPosition = event->pos();
    scrollToDrag();
    m_scrollTimer.start(kScrollInterval, this);
    return true;
}

void KvReportPagedView::scrollToDrag()
{
    const QPointF point = mapToScene(m_dragPosition);
    ensureVisible(QRectF(point.x(), point.y() - kCursorHeight / 2, 1, kCursorHeight), kScrollMargin,
                  kScrollMargin);
}

void KvReportPagedView::timerEvent(QTimerEvent *event)
{
    // A drag that rests near an edge sends no events. The mark follows with the next one.
    if (event->timerId() == m_scrollTimer.timerId())
        scrollToDrag();
    else
        QGraphicsView::timerEvent(event);
}

void KvReportPagedView::dragEnterEvent(QDragEnterEvent *event)
{
    // Also beside the pages, where drags come in: who refuses a drag as it enters is told of none of its
    // moves.
    if (followDrag(event))
        event->acceptProposedAction();
}

void KvReportPagedView::dragMoveEvent(QDragMoveEvent *event)
{
    // Not the base class's: it tracks the items under the drag, which a rebuild deletes.
    followDrag(event);
}

void KvReportPagedView::dragLeaveEvent(QDragLeaveEvent *event)
{
    event->accept();
    leaveDrag();
}

void KvReportPagedView::leaveDrag()
{
    m_scrollTimer.stop();
    setDropIndex(-1);
}

void KvReportPagedView::dropEvent(QDropEvent *event)
{
    m_scrollTimer.stop();
    const KvReportDragData dragData = KvReportDragData::fromMimeData(event->mimeData());
    {
        // The template tells of every step; the pages are laid out once, at the end.
        const QScopedValueRollback<bool> guard(m_updatesSuppressed, true);
        // What the user sees under the mouse, before the mark goes and lets the blocks move up.
        const KvReportProxyWidgetItem *item = m_layout.blockItemAt(mapToScene(event->pos()));
        const bool isTaken = trackDrag(dragData, event->pos());
        event->setAccepted(isTaken);
        if (isTaken)
            event->acceptProposedAction();
        m_nodeToSelect = isTaken && m_model ? drop(dragData, item ? item->node() : nullptr) : nullptr;
        m_layout.setDropIndex(-1);
    }
    // A drag that began here rebuilds the view when it is over.
    if (m_draggedIndex < 0)
        slotWidgetsListChanged();
}

KvReportNode *KvReportPagedView::drop(const KvReportDragData &dragData, KvReportNode *target)
{
    const int index = m_layout.dropIndex();
    switch (dragData.kind()) {
    case KvReportDragData::Kind::NewBlock:
        return m_model->createNode(dragData.typeName(), index);
    case KvReportDragData::Kind::MovedBlock:
        // A block that is dragged from here may have moved or gone since.
        dropMovedBlock(m_draggedIndex < 0 ? dragData.nodeIndex() : m_model->nodes().indexOf(m_draggedNode),
                       index);
        return nullptr;
    case KvReportDragData::Kind::GalleryImage:
        return dropImage(dragData.imagePath(), target, index);
    case KvReportDragData::Kind::Nothing:
        break;
    }
    return nullptr;
}

void KvReportPagedView::dropMovedBlock(int from, int to)
{
    const QVector<KvReportNode *> before = m_model->nodes();
    m_model->moveNode(from, to);
    if (m_model->nodes() == before)
        return;
    m_model->notifyListChanged();
    emit m_model->context()->signalTemplateModified();
}

KvReportNode *KvReportPagedView::dropImage(const QString &path, KvReportNode *target, int index)
{
    QApplication::setOverrideCursor(Qt::WaitCursor);
    const auto restoreCursor = qScopeGuard([]() { QApplication::restoreOverrideCursor(); });
    if (!target) {
        KvReportNode *node = m_model->createNode(QLatin1String(kImageType), index);
        if (node)
            node->config()->fromJson(newImageConfig(path));
        return node;
    }
    // An open options panel writes into the configuration when it closes.
    slotCloseAllEditors();
    setImagePath(target->config(), path);
    // Display widgets read their configuration when they are made.
    target->resetDisplayWidget();
    emit m_model->context()->signalTemplateModified();
    return target;
}

// ---- view ----

void KvReportPagedView::drawBackground(QPainter *painter, const QRectF &rect)
{
    QGraphicsView::drawBackground(painter, rect);
    painter->save();
    painter->setPen(Qt::NoPen);
    painter->setBrush(QColor(0, 0, 0, kShadowAlpha));
    for (const KvReportPage *page : pages()) {
        for (int width = kShadowWidth; width > 0; --width)
            painter->drawRoundedRect(page->pageRect().adjusted(-width, -width + 2, width, width + 2), width,
                                     width);
    }
    painter->restore();
}

void KvReportPagedView::resizeEvent(QResizeEvent *event)
{
    QGraphicsView::resizeEvent(event);
    // A change of the application's style resizes widgets while Qt goes through a list of all that there are:
    // none may be deleted now, as the delete button and the options panel are when the selection ends.
    if (m_selectedItem || m_overlay)
        QMetaObject::invokeMethod(this, "slotFollowViewWidth", Qt::QueuedConnection);
    else
        applyViewWidth(KvPagedLayout::OldItems::Dropped);
}

void KvReportPagedView::slotFollowViewWidth()
{
    applyViewWidth(KvPagedLayout::OldItems::DeletedNow);
}

void KvReportPagedView::showEvent(QShowEvent *event)
{
    QGraphicsView::showEvent(event);
    // A print while the view was hidden has taken the blocks' widgets, and nothing told the view of it.
    if (!applyViewWidth(KvPagedLayout::OldItems::DeletedNow) && !event->spontaneous())
        slotWidgetsListChanged();
}

bool KvReportPagedView::applyViewWidth(KvPagedLayout::OldItems oldItems)
{
    // A hidden view has no say: a template that is only printed keeps the width of its file.
    const int width = viewport()->width() - 2 * KvReportPage::Gap;
    if (!m_model || !isVisible() || width <= 0 || width == m_model->pageWidth())
        return false;
    m_model->setPageWidth(width);
    rebuild(oldItems);
    return true;
}
