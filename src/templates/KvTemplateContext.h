// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvReportKeywords.h"

#include <QObject>
#include <QPointer>

class KvReportKernelData;
class QJsonObject;

/**
 * What all blocks of one template share: page geometry, keywords and the switch of live data.
 *
 * Widths and heights are device-independent pixels. The margins of every page come from here, computed once
 * for view, printer and blocks alike.
 */
class KvTemplateContext : public QObject
{
    Q_OBJECT
public:
    static constexpr int DefaultPageWidth = 952; ///< 952 : 1346 is the proportion of A4
    static constexpr int DefaultContentHeight = 1346;
    static constexpr float DefaultMarginWidth = 0.12f;

    explicit KvTemplateContext(KvReportKernelData *kernelData, QObject *parent = nullptr);

    virtual bool toJson(QJsonObject &config) const;
    /** Missing keys keep the current values; a page width that is no integer reads as 0. Always true. */
    virtual bool fromJson(const QJsonObject &config);
    virtual void resetDefaults();
    /** Live data is counted by the data adapter: every begin needs one end. */
    virtual void beginLiveUpdates();
    virtual void endLiveUpdates();

    KvReportKernelData *kernelData() const;
    const KvReportKeywords &keywords() const { return m_keywords; }
    bool isLiveUpdates() const { return m_liveUpdates; }

    /**
     * True while the template is being printed. What is printed is painted once and never touched by the
     * user, so blocks may make their pieces with less than the screen needs.
     */
    bool isPrinting() const { return m_printing; }
    void setPrinting(bool printing) { m_printing = printing; }

    int pageWidth() const { return m_pageWidth; }
    void setPageWidth(int width) { m_pageWidth = width; }

    /** Height of a page's content area. */
    int contentHeight() const { return m_contentHeight; }
    void setContentHeight(int height);

    /** Page margin as a fraction of the page width. */
    float marginWidth() const { return m_marginWidth; }
    void setMarginWidth(float fraction) { m_marginWidth = fraction; }

    /** The page width as pages are laid out: 0 at least and no wider than a window can be, whatever a file
     * said. */
    int layoutWidth() const;
    /** Margin at the left and at the right of a page, 0 at least, whatever a file said. */
    int marginPixels() const;
    /** Width between the margins, 0 at least. */
    int usableWidth() const;
    /** Height of a page: 1.4142 times its width, 0 at least. */
    int pageHeight() const;

signals:
    void signalContentHeightChanged();
    void signalTemplateModified();

private:
    QPointer<KvReportKernelData> m_kernelData;
    KvReportKeywords m_keywords;
    bool m_liveUpdates = false;
    bool m_printing = false;
    int m_pageWidth = DefaultPageWidth;
    int m_contentHeight = DefaultContentHeight;
    float m_marginWidth = DefaultMarginWidth;
};
