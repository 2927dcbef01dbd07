// SPDX-License-Identifier: MIT
#include "report/KvReportPage.h"

#include "report/KvFooterWidget.h"
#include "report/KvHeaderWidget.h"
#include "report/KvPageCountWidget.h"
#include "report/KvReportProxyWidgetItem.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateModel.h"

#include <QPen>

namespace {

constexpr qreal kPageZ = -1;
constexpr qreal kSheetZ = -2;
constexpr qreal kSectionZ = 2;
constexpr qreal kPageNumberZ = 3;
constexpr qreal kSeparatorZ = 5;
constexpr int kContentInset = 20; // pixels at the page's top and bottom
constexpr int kPageNumberRight = 40;
constexpr int kPageNumberBottom = 30;
// The content height told to blocks is lower than the rectangle: a piece of just that height still fits with
// its gap.
constexpr int kContentReserve = 2;

QPen separatorPen()
{
    QPen pen(QColor(QStringLiteral("#00659D")), 1.0, Qt::CustomDashLine, Qt::SquareCap, Qt::BevelJoin);
    pen.setDashPattern({5, 2});
    return pen;
}

/** Whether the widget of a section is there and the user cannot have done anything to it. */
bool isUntouched(const KvReportProxyWidgetItem &item)
{
    const auto *text = qobject_cast<const KvPageSectionWidget *>(item.widget());
    return item.displayWidget() && !item.hadFocus() && !(text && text->isEditing());
}

} // namespace

KvReportPage::KvReportPage(KvTemplateModel *model, int index, bool printMode)
    : m_model(model)
    , m_index(index)
    , m_printMode(printMode)
    , m_pageRect(pageRectOf(*model, index, printMode))
    , m_contentRect(m_pageRect.adjusted(0, kContentInset, 0, -kContentInset))
{
    setHandlesChildEvents(false);
    setZValue(kPageZ);
    if (!m_printMode)
        addSheet();
    if (m_model->isHeaderEnabled())
        addHeader();
    if (m_model->isFooterEnabled())
        addFooter();
    if (m_model->isPageNumberingEnabled())
        addPageNumber();
    tellContentHeight();
}

KvReportPage::~KvReportPage() = default;

QRect KvReportPage::pageRectOf(const KvTemplateModel &model, int index, bool printMode)
{
    const QSize size(model.context()->layoutWidth(), model.context()->pageHeight());
    if (printMode)
        return QRect(QPoint(0, 0), size);
    return QRect(QPoint(Gap, (size.height() + Gap) * index + Gap), size);
}

bool KvReportPage::contains(const QPointF &point) const
{
    return QRectF(m_pageRect).contains(point);
}

KvPageSectionWidget *KvReportPage::headerWidget() const
{
    return m_headerWidget;
}

KvPageSectionWidget *KvReportPage::footerWidget() const
{
    return m_footerWidget;
}

KvReportProxyWidgetItem *KvReportPage::sectionItemAt(const QPointF &point) const
{
    // The topmost one first.
    for (KvReportProxyWidgetItem *item : {m_pageCountItem, m_headerItem, m_footerItem}) {
        if (item && QRectF(item->scenePos(), item->size()).contains(point))
            return item;
    }
    return nullptr;
}

void KvReportPage::addSheet()
{
    auto *sheet = new QGraphicsRectItem(m_pageRect);
    sheet->setPen(QPen(Qt::white));
    sheet->setBrush(QBrush(Qt::white, Qt::SolidPattern));
    sheet->setZValue(kSheetZ);
    addToGroup(sheet);
}

KvReportProxyWidgetItem *KvReportPage::addSection(KvPageSectionWidget *widget)
{
    widget->setStyleSheet(QStringLiteral("QWidget { background-color: white; }"));
    widget->fitToWidth(m_contentRect.width());
    auto *item = new KvReportProxyWidgetItem;
    item->setDisplayWidget(widget);
    item->setWidget(widget);
    item->setZValue(kSectionZ);
    addToGroup(item);
    return item;
}

QGraphicsLineItem *KvReportPage::addSeparator()
{
    auto *line = new QGraphicsLineItem(0, 0, m_pageRect.width(), 0);
    line->setPen(separatorPen());
    line->setZValue(kSeparatorZ);
    addToGroup(line);
    return line;
}

void KvReportPage::addHeader()
{
    m_headerWidget = m_model->createHeaderWidget();
    m_header = m_model->header();
    m_headerItem = addSection(m_headerWidget);
    if (!m_printMode)
        m_headerLine = addSeparator();
    placeHeader();
}

void KvReportPage::addFooter()
{
    m_footerWidget = m_model->createFooterWidget();
    m_footer = m_model->footer();
    m_footerItem = addSection(m_footerWidget);
    if (!m_printMode)
        m_footerLine = addSeparator();
    placeFooter();
}

void KvReportPage::addPageNumber()
{
    m_pageCountWidget = m_model->createPageCountWidget(m_index);
    m_pageCountItem = new KvReportProxyWidgetItem;
    m_pageCountItem->setDisplayWidget(m_pageCountWidget);
    m_pageCountItem->setWidget(m_pageCountWidget);
    m_pageCountItem->setZValue(kPageNumberZ);
    addToGroup(m_pageCountItem);
    placePageNumber();
}

void KvReportPage::placeHeader()
{
    m_headerRect = QRect(m_contentRect.topLeft(), m_headerItem->size().toSize());
    m_headerItem->setPos(m_contentRect.topLeft());
    m_contentRect.setTop(m_contentRect.top() + m_headerRect.height());
    if (m_headerLine)
        m_headerLine->setPos(m_contentRect.topLeft());
}

void KvReportPage::placeFooter()
{
    const QSize size = m_footerItem->size().toSize();
    m_contentRect.setBottom(m_contentRect.bottom() - size.height());
    m_footerRect = QRect(m_contentRect.bottomLeft(), size);
    m_footerItem->setPos(m_footerRect.topLeft());
    if (m_footerLine)
        m_footerLine->setPos(m_footerRect.topLeft());
}

void KvReportPage::placePageNumber()
{
    const QSizeF size = m_pageCountItem->size();
    m_pageCountItem->setPos(m_pageRect.right() - (size.width() + kPageNumberRight),
                            m_pageRect.bottom() - (size.height() + kPageNumberBottom));
}

bool KvReportPage::showsHeaderOf(const KvTemplateModel &model) const
{
    if (!m_headerItem)
        return !model.isHeaderEnabled();
    return model.isHeaderEnabled() && m_header == model.header() && isUntouched(*m_headerItem);
}

bool KvReportPage::showsFooterOf(const KvTemplateModel &model) const
{
    if (!m_footerItem)
        return !model.isFooterEnabled();
    return model.isFooterEnabled() && m_footer == model.footer() && isUntouched(*m_footerItem);
}

bool KvReportPage::showsNumberOf(const KvTemplateModel &model) const
{
    if (!m_pageCountItem)
        return !model.isPageNumberingEnabled();
    return model.isPageNumberingEnabled() && isUntouched(*m_pageCountItem);
}

bool KvReportPage::isLikeNew(const KvTemplateModel *model) const
{
    return model == m_model && m_pageRect == pageRectOf(*model, m_index, m_printMode) &&
           showsHeaderOf(*model) && showsFooterOf(*model) && showsNumberOf(*model);
}

void KvReportPage::refreshSections()
{
    for (KvPageSectionWidget *widget : {headerWidget(), footerWidget()}) {
        if (widget)
            widget->slotTemplateModified();
    }
    updateSections();
}

void KvReportPage::updateSections()
{
    m_contentRect = m_pageRect.adjusted(0, kContentInset, 0, -kContentInset);
    if (m_headerItem) {
        m_headerWidget->fitToWidth(m_contentRect.width());
        m_headerItem->resize(m_headerWidget->size());
        placeHeader();
    }
    if (m_footerItem) {
        m_footerWidget->fitToWidth(m_contentRect.width());
        m_footerItem->resize(m_footerWidget->size());
        placeFooter();
    }
    tellContentHeight();
}

void KvReportPage::tellContentHeight()
{
    m_model->context()->setContentHeight(m_contentRect.height() - kContentReserve);
}

void KvReportPage::setPageTotal(int total)
{
    if (!m_pageCountWidget)
        return;
    m_pageCountWidget->setTotal(total);
    m_pageCountWidget->adjustSize();
    m_pageCountItem->resize(m_pageCountWidget->size());
    placePageNumber();
}

void KvReportPage::detachSections()
{
    for (KvPageSectionWidget *widget : {headerWidget(), footerWidget()}) {
        if (widget)
            QObject::disconnect(m_model->context(), nullptr, widget, nullptr);
    }
}
