// SPDX-License-Identifier: MIT
#include "report/KvReportPagedView.h"

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "report/KvPageFlow.h"
#include "report/KvPageSectionWidget.h"
#include "report/KvReportNode.h"
#include "report/KvReportPage.h"
#include "report/KvReportProxyWidgetItem.h"
#include "templates/KvTemplateModel.h"

#include <QGraphicsScene>
#include <QResizeEvent>
#include <QScopedValueRollback>
#include <QScrollBar>

#include <algorithm>

namespace {
const Qt::ConnectionType kQueuedUnique = Qt::ConnectionType(Qt::QueuedConnection | Qt::UniqueConnection);
const Qt::ConnectionType kDirectUnique = Qt::ConnectionType(Qt::DirectConnection | Qt::UniqueConnection);
} // namespace

KvReportPagedView::KvReportPagedView(QWidget *parent)
    : QGraphicsView(parent)
    , m_scene(new QGraphicsScene(this))
{
    setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    setFrameShape(QFrame::NoFrame);
    setAcceptDrops(true);
    // Report pages read from left to right whatever the language of the program around them.
    setLayoutDirection(Qt::LeftToRight);
    m_scene->setBackgroundBrush(QColor(QStringLiteral("#313131")));
    setScene(m_scene);
    slotWidgetsListChanged();
}

KvReportPagedView::~KvReportPagedView()
{
    // Before the scene dies as a child: its items let go of pieces that live on.
    clearScene();
}

KvTemplateModel *KvReportPagedView::model() const
{
    return m_model;
}

void KvReportPagedView::setModel(KvTemplateModel *model)
{
    m_model = model;
    if (m_model) {
        connect(m_model, SIGNAL(signalBeforeDeleteNode(KvReportNode*)), this,
                                SLOT(slotBeforeDeleteNode(KvReportNode*)));
        connect(m_model, SIGNAL(signalListChanged()), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(signalHeaderStateChanged(bool)), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(signalFooterStateChanged(bool)), this, SLOT(slotWidgetsListChanged()));
        connect(m_model, SIGNAL(signalPageNumberingStateChanged(bool)), this, SLOT(slotWidgetsListChanged()));
    }
    slotWidgetsListChanged();
}

void KvReportPagedView::clearScene()
{
    m_pages.clear();
    m_pieceItems.clear();
    m_scene->clear();
}

void KvReportPagedView::slotWidgetsListChanged()
{
    // A file that is read announces each of its blocks; the last announcement finds the loading over.
    if (m_model && m_model->isLoading())
        return;
    const int scrollPosition = verticalScrollBar()->value();
    if (!m_model) {
        clearScene();
        return;
    }
    {
        // Blocks answer to the page's content height with size changes, which the rebuild takes in anyway.
        const QScopedValueRollback<bool> guard(m_layoutRunning, true);
        replacePages();
    }
    verticalScrollBar()->setValue(scrollPosition);
}

void KvReportPagedView::replacePages()
{
    // The old items go last: pieces then move straight from their old frame into the new one. Every change of
    // parent makes Qt polish the style sheets of all widgets in a piece, which takes most of the time of a
    // rebuild.
    QList<QGraphicsItem *> oldItems = m_scene->items();
    const auto isChild = [](const QGraphicsItem *item) { return item->parentItem() != nullptr; };
    oldItems.erase(std::remove_if(oldItems.begin(), oldItems.end(), isChild), oldItems.end());
    m_pages.clear();
    m_pieceItems.clear();
    addPages();
    qDeleteAll(oldItems);
}

void KvReportPagedView::addPages()
{
    KvPageFlow flow([this](int page) { return contentRectOf(page); });
    for (KvReportNode *node : m_model->nodes()) {
        connectNode(node);
        KvBaseDisplayWidget *displayWidget = node->displayWidget();
        const int pieces = displayWidget ? displayWidget->subWidgetCount() : 0;
        for (int i = 0; i < pieces; ++i) {
            KvReportProxyWidgetItem *item = KvReportProxyWidgetItem::createForPiece(node, i);
            if (!item)
                continue;
            item->setPos(flow.place(item->pieceHeight()).topLeft);
            m_scene->addItem(item);
            m_pieceItems.append(item);
        }
    }
    finishLayout();
}

void KvReportPagedView::connectNode(KvReportNode *node)
{
    KvBaseDisplayWidget *displayWidget = node->displayWidget();
    if (!displayWidget)
        return;
    KvBaseDisplayWidgetSignals *displaySignals = displayWidget->displaySignals();
    connect(displaySignals, SIGNAL(signalWidgetChanged()), this,
                                   SLOT(slotUpdateSceneWithSizes()), kDirectUnique);
    // Queued: a block may announce new pieces from inside an event of a piece that the rebuild would delete.
    connect(displaySignals, SIGNAL(signalSubWidgetsChanged()), this,
                                   SLOT(slotWidgetsListChanged()), kQueuedUnique);
}

KvReportPage *KvReportPagedView::addPage()
{
    auto *page = new KvReportPage(m_model, m_pages.size(), false);
    m_pages.append(page);
    m_scene->addItem(page);
    for (KvPageSectionWidget *section : {page->headerWidget(), page->footerWidget()}) {
        if (section)
            connect(section->displaySignals(), SIGNAL(signalWidgetChanged()), this,
                                                      SLOT(slotUpdateSceneWithSizes()));
    }
    return page;
}

QRect KvReportPagedView::contentRectOf(int page)
{
    if (page < m_pages.size()) {
        m_pages.at(page)->updateSections();
        return m_pages.at(page)->contentRect();
    }
    return addPage()->contentRect();
}

void KvReportPagedView::finishLayout()
{
    for (KvReportPage *page : qAsConst(m_pages))
        page->setPageTotal(m_pages.size());
    const QRect last = m_pages.last()->pageRect();
    m_scene->setSceneRect(0, 0, last.right() + KvReportPage::Gap, last.bottom() + KvReportPage::Gap);
}

void KvReportPagedView::slotUpdateSceneWithSizes()
{
    // Sections and tables signal back into the pass that measures them.
    if (m_layoutRunning || !m_model || m_model->isLoading() || m_pages.isEmpty())
        return;
    const QScopedValueRollback<bool> guard(m_layoutRunning, true);
    KvPageFlow flow([this](int page) { return contentRectOf(page); });
    for (KvReportProxyWidgetItem *item : qAsConst(m_pieceItems)) {
        item->adjustToPiece();
        item->setPos(flow.place(item->pieceHeight()).topLeft);
    }
    dropPagesFrom(flow.pageCount());
    finishLayout();
}

void KvReportPagedView::dropPagesFrom(int count)
{
    if (m_pages.size() <= count)
        return;
    while (m_pages.size() > count) {
        KvReportPage *page = m_pages.takeLast();
        m_scene->removeItem(page);
        m_droppedPages.emplace_back(page);
    }
    // Not at once: the header in which the user types may be on such a page, and this is called from its
    // typing.
    QMetaObject::invokeMethod(
        this, [this]() { m_droppedPages.clear(); }, Qt::QueuedConnection);
}

void KvReportPagedView::slotBeforeDeleteNode(KvReportNode *aNode)
{
    for (int i = m_pieceItems.size() - 1; i >= 0; --i) {
        if (m_pieceItems.at(i)->node() == aNode)
            delete m_pieceItems.takeAt(i);
    }
}

void KvReportPagedView::resizeEvent(QResizeEvent *event)
{
    QGraphicsView::resizeEvent(event);
    applyViewWidth();
}

void KvReportPagedView::showEvent(QShowEvent *event)
{
    QGraphicsView::showEvent(event);
    // A print while the view was hidden has taken the blocks' widgets, and nothing told the view of it.
    if (!applyViewWidth() && !event->spontaneous())
        slotWidgetsListChanged();
}

bool KvReportPagedView::applyViewWidth()
{
    // A hidden view has no say: a template that is only printed keeps the width of its file.
    const int width = viewport()->width() - 2 * KvReportPage::Gap;
    if (!m_model || !isVisible() || width <= 0 || width == m_model->pageWidth())
        return false;
    m_model->setPageWidth(width);
    slotWidgetsListChanged();
    return true;
}
