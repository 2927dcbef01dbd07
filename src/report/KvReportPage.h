// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsItemGroup>
#include <QPointer>
#include <QRect>

class KvPageCountWidget;
class KvPageSectionWidget;
class KvPageSectionsCfg;
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

    /**
     * Whether a page made now, for the same place in the pages of \a model, would have the same size and
     * sections. Sections in which the user may have typed do not count as the same.
     */
    bool isLikeNew(const KvTemplateModel *model) const;
    /** Shows the sections' present texts, and updates the sections. */
    void refreshSections();
    /** Measures and places header and footer anew, and recomputes the content rectangle. */
    void updateSections();
    void setPageTotal(int total);
    /** From now on header and footer no longer follow the template; for a page that is about to go. */
    void detachSections();

    /** Distance between pages on screen, and of the column from the scene's edges, in pixels. */
    static constexpr int Gap = 20;

private:
    static QRect pageRectOf(const KvTemplateModel &model, int index, bool printMode);

    bool showsHeaderOf(const KvTemplateModel &model) const;
    bool showsFooterOf(const KvTemplateModel &model) const;
    bool showsNumberOf(const KvTemplateModel &model) const;
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
    QPointer<const KvPageSectionsCfg> m_header; ///< what the header widget shows
    QGraphicsLineItem *m_headerLine = nullptr;
    KvReportProxyWidgetItem *m_footerItem = nullptr;
    KvPageSectionWidget *m_footerWidget = nullptr;
    QPointer<const KvPageSectionsCfg> m_footer; ///< what the footer widget shows
    QGraphicsLineItem *m_footerLine = nullptr;
    QRect m_headerRect;
    QRect m_footerRect;
    KvPageCountWidget *m_pageCountWidget = nullptr;
    KvReportProxyWidgetItem *m_pageCountItem = nullptr;
};
