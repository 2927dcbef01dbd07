// SPDX-License-Identifier: MIT
#pragma once

#include <QVector>

#include <memory>

class KvBlockTypeList;
class KvReportKernelData;
class KvReportPagedView;
class KvTemplateModel;
class QTextEdit;

/** A template of text blocks with header, footer and page numbers, on the pages of a shown view. */
class EditedReport
{
public:
    /** \a blocks of \a paragraphs lines each; 8 blocks of 5 fill about a page. */
    EditedReport(int blocks, int paragraphs);
    ~EditedReport();

    KvTemplateModel &model() { return *m_model; }
    KvReportPagedView &view() { return *m_view; }
    int pageCount() const;

    /** Types a character into the first block, or a new line, takes it back at the next call, and paints. */
    void type();
    void typeLine();
    /** Moves the mark of a drop between the first and the second block of the page, and paints. */
    void moveMark();

private:
    void change(const char *text);
    QTextEdit *firstText() const;

    std::unique_ptr<KvReportKernelData> m_kernelData;
    std::unique_ptr<KvBlockTypeList> m_blocks;
    std::unique_ptr<KvTemplateModel> m_model;
    std::unique_ptr<KvReportPagedView> m_view;
    bool m_isOdd = false;
};

/** Flows \a pieces pieces of mixed heights onto pages; returns the number of pages. */
int flowPieces(int pieces);
