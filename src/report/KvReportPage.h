// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsItemGroup>
#include <QPointer>
#include <QRect>

class KvPageCountWidget;
class KvPageSectionWidget;
class KvReportProxyWidgetItem;
class KvTemplateModel;

/**
 * One page of a report: its white sheet, header, footer and page number, and the content rectangle that they
 * leave.
 *
 * On screen the pages stand in one column; in print mode each is at the origin of a scene of its own, without
 * sheet and separator lines.
 */
class KvReportPage : public QGraphicsItemGroup
{
public:
    /** \a model is not owned. \a index counts from 0. */
    KvReportPage(KvTemplateModel *model, int index, bool printMode);
    ~KvReportPage() override;

    int index() const { return m_index; }
    const QRect &pageRect() const { return m_pageRect; }
    /** Where blocks stand; as wide as the page, since margins belong to the blocks' frames. */
    const QRect &contentRect() const { return m_contentRect; }
    bool contains(const QPointF &point) const override;

    KvPageSectionWidget *headerWidget() const;
    KvPageSectionWidget *footerWidget() const;
    /** The header, footer or page number under a point of the scene, or null. */
    KvReportProxyWidgetItem *sectionItemAt(const QPointF &point) const;

    /** Measures and places header and footer anew, and recomputes the content rectangle. */
    void updateSections();
    void setPageTotal(int total);
    /** From now on header and footer no longer follow the template; for a page that is about to go. */
    void detachSections();

    /** Distance between pages on screen, and of the column from the scene's edges, in pixels. */
    static constexpr int Gap = 20;

private:
    static QRect pageRectOf(const KvTemplateModel &model, int index, bool printMode);

    void addSheet();
    void addHeader();
    void addFooter();
    void addPageNumber();
    KvReportProxyWidgetItem *addSection(KvPageSectionWidget *widget);
    QGraphicsLineItem *addSeparator();
    void placeHeader();
    void placeFooter();
    void placePageNumber();
    void tellContentHeight();

    KvTemplateModel *m_model;
    int m_index;
    bool m_printMode;
    QRect m_pageRect;
    QRect m_contentRect;
    KvReportProxyWidgetItem *m_headerItem = nullptr;
    KvPageSectionWidget *m_headerWidget = nullptr;
    QGraphicsLineItem *m_headerLine = nullptr;
    KvReportProxyWidgetItem *m_footerItem = nullptr;
    KvPageSectionWidget *m_footerWidget = nullptr;
    QGraphicsLineItem *m_footerLine = nullptr;
    QRect m_headerRect;
    QRect m_footerRect;
    KvPageCountWidget *m_pageCountWidget = nullptr;
    KvReportProxyWidgetItem *m_pageCountItem = nullptr;
};
