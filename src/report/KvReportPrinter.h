// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QRect>
#include <QString>
#include <QVector>

#include <memory>
#include <vector>

class KvPrintProgress;
class KvReportPage;
class KvTemplateModel;
class QGraphicsScene;
class QPainter;
class QPdfWriter;

/** Prints a template, filled with the current data, into a PDF file. Lives for one print only. */
class KvReportPrinter : public QObject
{
    Q_OBJECT
public:
    /** \a model is not owned. Printing takes its blocks' widgets into scenes of the printer. */
    explicit KvReportPrinter(KvTemplateModel *model);
    /** Deletes the scenes; the blocks' widgets go on living with their blocks. */
    ~KvReportPrinter() override;

    /** Told page by page; not owned, may be null. */
    void setProgress(KvPrintProgress *progress) { m_progress = progress; }

    /**
     * False when painting into the file could not begin, as when it cannot be opened for writing, when the
     * progress was cancelled, and when the disk is full; a file that was there is as it was then.
     */
    bool print(const QString &fileName);

    int pageCount() const { return m_pages.size(); }

private:
    void layOut();
    void layOutNodes();
    QRect startPage();
    bool printTo(QPdfWriter &writer);
    bool render(QPdfWriter &writer);
    void reportProgress(int done) const;

    KvTemplateModel *m_model;
    KvPrintProgress *m_progress = nullptr;
    std::vector<std::unique_ptr<QGraphicsScene>> m_scenes; ///< one per page
    QVector<KvReportPage *> m_pages;                       ///< each owned by its scene
};
