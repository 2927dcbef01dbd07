// SPDX-License-Identifier: MIT
#pragma once

#include <QTemporaryDir>

#include <memory>

class KvBlockTypeList;
class KvReportKernelData;
class KvReportPagedView;
class KvReportTemplatesEditor;
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

/** Milliseconds from nothing to a painted editor window with a new template; the first call is the one that
 * counts. */
double openEditor();

/** The editor with a template file of many text blocks. */
class EditorFile
{
public:
    explicit EditorFile(int blocks);
    ~EditorFile();

    /** Loads the file, lays it out and paints. */
    void load();

private:
    std::unique_ptr<KvReportKernelData> m_kernelData;
    std::unique_ptr<KvReportTemplatesEditor> m_editor;
    QTemporaryDir m_folder;
};

/** Flows \a pieces pieces of mixed heights onto pages; returns the number of pages. */
int flowPieces(int pieces);
