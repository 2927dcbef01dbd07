// SPDX-License-Identifier: MIT
#include "report/KvPagedLayout.h"

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "report/KvPageFlow.h"
#include "report/KvPageSectionWidget.h"
#include "report/KvReportNode.h"
#include "report/KvReportPage.h"
#include "report/KvReportProxyWidgetItem.h"
#include "templates/KvTemplateModel.h"

#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QPen>
#include <QSet>

#include <algorithm>
#include <utility>

namespace {

const Qt::ConnectionType kQueuedUnique = Qt::ConnectionType(Qt::QueuedConnection | Qt::UniqueConnection);
const Qt::ConnectionType kDirectUnique = Qt::ConnectionType(Qt::DirectConnection | Qt::UniqueConnection);

constexpr int kMarkHeight = 40;
constexpr int kMarkInset = 40; // narrower than the page by this
constexpr qreal kMarkAlpha = 0.3;

/** Place and size, as an item is hit; its bounding rectangle in the scene. */
QRectF rectOf(const KvReportProxyWidgetItem *item)
{
    return QRectF(item->scenePos(), item->size());
}

/** Lets items cover each other in their order, which new ones among older ones would not do by themselves. */
template <typename List>
void stackInOrder(const List &items)
{
    for (int i = items.size() - 1; i > 0; --i)
        items.at(i - 1)->stackBefore(items.at(i));
}

} // namespace

KvPagedLayout::KvPagedLayout(QGraphicsScene *scene, QObject *listener)
    : m_scene(scene)
    , m_listener(listener)
{}

KvPagedLayout::~KvPagedLayout()
{
    // Before the scene dies: its items let go of pieces that live on.
    clear();
}

void KvPagedLayout::clear()
{
    m_pages.clear();
    m_nodes.clear();
    m_pieceItems.clear();
    m_mark = nullptr;
    m_droppedItems.clear();
    m_scene->clear();
}

void KvPagedLayout::rebuild(KvTemplateModel *model, const KvReportNode *leftOut, OldItems fate)
{
    m_model = model;
    const QVector<KvReportPage *> oldPages = std::exchange(m_pages, {});
    const QList<KvReportProxyWidgetItem *> oldItems = std::exchange(m_pieceItems, {});
    if (fate == OldItems::DeletedNow)
        offerAgain(oldPages, oldItems);
    m_nodes.clear();
    delete std::exchange(m_mark, nullptr);
    // Blocks that split themselves have to know a page's content before they are asked for their pieces.
    addPage();
    for (KvReportNode *node : m_model->nodes()) {
        if (node != leftOut)
            addItemsOf(node);
    }
    place(Measuring::Nothing);
    stackInOrder(m_pages);
    stackInOrder(m_pieceItems);
    m_oldPages.clear();
    m_oldItems.clear();
    // The old items go last: pieces then move straight from their old frame into the new one.
    removeSurplus(oldPages, m_pages, fate);
    removeSurplus(oldItems, m_pieceItems, fate);
    if (fate == OldItems::DeletedNow)
        m_droppedItems.clear();
}

void KvPagedLayout::offerAgain(const QVector<KvReportPage *> &pages,
                               const QList<KvReportProxyWidgetItem *> &items)
{
    // Every change of parent makes Qt polish the style sheets of all widgets in a piece. In a report of
    // hundreds of pages, of which one more record changes the last, that would be most of a rebuild.
    m_oldPages = pages;
    for (KvReportProxyWidgetItem *item : items) {
        const QWidget *piece = item->piece();
        // The scene may give the focus back to an item that had it, though nothing is selected any more.
        if (piece && !item->hadFocus())
            m_oldItems.insert(piece, item);
    }
}

KvReportProxyWidgetItem *KvPagedLayout::takeOldItem(const KvReportNode *node, const QWidget *piece)
{
    KvReportProxyWidgetItem *item = m_oldItems.take(piece);
    // The piece may be another one since, at the address of one that died.
    if (!item || item->node() != node || item->piece() != piece ||
        item->displayWidget() != item->node()->displayWidget())
        return nullptr;
    item->adjustToPiece();
    return item;
}

void KvPagedLayout::addItemsOf(KvReportNode *node)
{
    connectNode(node);
    m_nodes.append(node);
    KvBaseDisplayWidget *displayWidget = node->displayWidget();
    const int pieces = displayWidget ? displayWidget->subWidgetCount() : 0;
    for (int i = 0; i < pieces; ++i) {
        QWidget *piece = displayWidget->subWidgetAt(i);
        if (!piece)
            continue;
        KvReportProxyWidgetItem *item = takeOldItem(node, piece);
        m_pieceItems.append(item ? item : KvReportProxyWidgetItem::createForPiece(node, *piece));
    }
}

void KvPagedLayout::connectNode(KvReportNode *node)
{
    KvBaseDisplayWidget *displayWidget = node->displayWidget();
    if (!displayWidget)
        return;
    KvBaseDisplayWidgetSignals *displaySignals = displayWidget->displaySignals();
    QObject::connect(displaySignals, SIGNAL(signalWidgetChanged()), m_listener,
                                            SLOT(slotUpdateSceneWithSizes()), kDirectUnique);
    // Queued: a block may announce new pieces from inside an event of a piece that the rebuild would delete.
    QObject::connect(displaySignals, SIGNAL(signalSubWidgetsChanged()), m_listener,
                                            SLOT(slotWidgetsListChanged()), kQueuedUnique);
    QObject::connect(displaySignals, SIGNAL(signalFocusBackToPageView()), m_listener,
                                            SLOT(slotFocusBackToPageView()), kDirectUnique);
}

KvReportPage *KvPagedLayout::addPage()
{
    const int index = m_pages.size();
    KvReportPage *page = m_oldPages.value(index);
    if (page && page->isLikeNew(m_model))
        page->refreshSections();
    else
        page = makePage(index);
    m_pages.append(page);
    return page;
}

KvReportPage *KvPagedLayout::makePage(int index)
{
    auto *page = new KvReportPage(m_model, index, false);
    m_scene->addItem(page);
    for (KvPageSectionWidget *section : {page->headerWidget(), page->footerWidget()}) {
        if (!section)
            continue;
        QObject::connect(section->displaySignals(), SIGNAL(signalWidgetChanged()), m_listener,
                                                           SLOT(slotUpdateSceneWithSizes()));
        QObject::connect(section->displaySignals(), SIGNAL(signalFocusBackToPageView()), m_listener,
                                                           SLOT(slotFocusBackToPageView()));
    }
    return page;
}

QRect KvPagedLayout::contentRectOf(int page)
{
    return page < m_pages.size() ? m_pages.at(page)->contentRect() : addPage()->contentRect();
}

void KvPagedLayout::updateSizes()
{
    place(Measuring::All);
}

void KvPagedLayout::place(Measuring measuring)
{
    KvPageFlow flow([this, measuring](int page) {
        if (measuring == Measuring::All && page < m_pages.size())
            m_pages.at(page)->updateSections();
        return contentRectOf(page);
    });
    bool isMarked = false;
    const auto placeMarkBefore = [&](int index) {
        if (index != m_dropIndex)
            return;
        showMarkAt(flow.placeMark(kMarkHeight).topLeft);
        isMarked = true;
    };
    int nextItem = 0;
    for (int i = 0; i < m_nodes.size(); ++i) {
        placeMarkBefore(i);
        for (; nextItem < m_pieceItems.size() && m_pieceItems.at(nextItem)->node() == m_nodes.at(i);
             ++nextItem) {
            KvReportProxyWidgetItem *item = m_pieceItems.at(nextItem);
            if (measuring == Measuring::All)
                item->adjustToPiece();
            item->setPos(flow.place(item->pieceHeight()).topLeft);
            if (!item->scene())
                m_scene->addItem(item);
        }
    }
    placeMarkBefore(m_nodes.size());
    if (!isMarked) {
        delete m_mark;
        m_mark = nullptr;
    }
    dropPagesFrom(flow.pageCount());
    finish();
}

void KvPagedLayout::showMarkAt(const QPoint &topLeft)
{
    if (!m_mark) {
        const QColor accent(QStringLiteral("#00659D"));
        QColor translucent = accent;
        translucent.setAlphaF(kMarkAlpha);
        m_mark = m_scene->addRect(QRectF(), QPen(accent), QBrush(translucent));
    }
    m_mark->setRect(0, 0, m_pages.first()->pageRect().width() - kMarkInset, kMarkHeight);
    m_mark->setPos(topLeft);
}

void KvPagedLayout::dropPagesFrom(int count)
{
    while (m_pages.size() > count)
        drop(m_pages.takeLast());
}

template <typename List>
void KvPagedLayout::removeSurplus(const List &old, const List &kept, OldItems fate)
{
    const QSet<QGraphicsItem *> keptItems(kept.begin(), kept.end());
    for (auto *item : old) {
        if (keptItems.contains(item))
            continue;
        if (fate == OldItems::DeletedNow)
            delete item;
        else
            drop(item);
    }
}

void KvPagedLayout::drop(KvReportPage *page)
{
    page->detachSections();
    drop(static_cast<QGraphicsItem *>(page));
}

void KvPagedLayout::drop(QGraphicsItem *item)
{
    // Not off the scene: a widget that leaves it stays in its chain of Tab stops unless it is the first one
    // there. It becomes the first when those before it die, and the scene does not hear of its death outside.
    item->setVisible(false);
    m_droppedItems.emplace_back(item);
}

void KvPagedLayout::deleteDroppedItems()
{
    m_droppedItems.clear();
}

void KvPagedLayout::finish()
{
    for (KvReportPage *page : qAsConst(m_pages))
        page->setPageTotal(m_pages.size());
    const QRect last = m_pages.last()->pageRect();
    m_scene->setSceneRect(0, 0, last.right() + KvReportPage::Gap, last.bottom() + KvReportPage::Gap);
}

void KvPagedLayout::removeNode(const KvReportNode *node)
{
    m_nodes.removeAll(node);
    for (int i = m_pieceItems.size() - 1; i >= 0; --i) {
        if (m_pieceItems.at(i)->node() == node)
            delete m_pieceItems.takeAt(i);
    }
}

KvReportPage *KvPagedLayout::pageAt(const QPointF &point) const
{
    const auto found = std::find_if(m_pages.begin(), m_pages.end(),
                                    [&point](const KvReportPage *page) { return page->contains(point); });
    return found == m_pages.end() ? nullptr : *found;
}

KvReportProxyWidgetItem *KvPagedLayout::blockItemAt(const QPointF &point) const
{
    const auto found =
        std::find_if(m_pieceItems.begin(), m_pieceItems.end(),
                     [&point](const KvReportProxyWidgetItem *item) { return rectOf(item).contains(point); });
    return found == m_pieceItems.end() ? nullptr : *found;
}

KvReportProxyWidgetItem *KvPagedLayout::itemAt(const QPointF &point) const
{
    // In the order in which they cover each other: sections are painted below blocks.
    if (KvReportProxyWidgetItem *item = blockItemAt(point))
        return item;
    const KvReportPage *page = pageAt(point);
    return page ? page->sectionItemAt(point) : nullptr;
}

KvReportProxyWidgetItem *KvPagedLayout::firstItemOf(const KvReportNode *node) const
{
    const auto found =
        std::find_if(m_pieceItems.begin(), m_pieceItems.end(),
                     [node](const KvReportProxyWidgetItem *item) { return item->node() == node; });
    return found == m_pieceItems.end() ? nullptr : *found;
}

void KvPagedLayout::setDropIndex(int index)
{
    if (index == m_dropIndex)
        return;
    m_dropIndex = index;
    if (m_model && !m_pages.isEmpty())
        place(Measuring::Nothing);
}

QRectF KvPagedLayout::markRect() const
{
    return m_mark ? m_mark->rect().translated(m_mark->pos()) : QRectF();
}

int KvPagedLayout::dropIndexAt(qreal y) const
{
    const auto isBelow = [y](const KvReportProxyWidgetItem *item) {
        const QRectF rect = rectOf(item);
        return rect.top() + rect.height() * 0.5 > y;
    };
    const auto found = std::find_if(m_pieceItems.begin(), m_pieceItems.end(), isBelow);
    return static_cast<int>(found - m_pieceItems.begin());
}
