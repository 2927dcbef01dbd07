// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

#include <memory>

class KvBlockTypeList;
class KvReportKernelData;
class KvTemplateModel;
class QWidget;

/** Counters for the pie, of one count and one share each, beside the synthetic host's objects; replaces what
 * a former call made. */
void fillSyntheticCounters(int count);

/** Announces that objects of the synthetic host were edited, \a count of them, each once. */
void announceChanges(int count);

/** Waits for the first painting of a scroll area below a widget. */
class PaintWatch : public QObject
{
    Q_OBJECT
public:
    explicit PaintWatch(QWidget *root);

    /** Runs the event loop until something was painted since reset(), at most some seconds; false when
     * nothing was. */
    bool waitForPainting();
    void reset() { m_isPainted = false; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QWidget *m_root;
    bool m_isPainted = false;
};

/** One statistics block on the screen, live over the synthetic host's records. */
class LiveBlock
{
public:
    enum class Place { Window, Page };

    /** \a blockName is the type's name in templates. In the window it has to be one of the window's four. */
    LiveBlock(const QString &blockName, Place place);
    ~LiveBlock();

    /** Takes paintings of before off the event loop. */
    void settle();
    /** From the announcement of the same records to the block on the screen. False when it was not painted.
     */
    bool refresh();
    /** The same, but asks the host for all records first. */
    bool update();
    /** From the first of \a changes announced changes to the block on the screen; mostly a wait. */
    bool burst(int changes);

    /** How often the records were taken in so far. */
    int updateCount() const { return m_updates; }

private:
    void takeUpdate();
    void showInWindow(const QString &blockName);
    void showOnPage(const QString &blockName);

    std::unique_ptr<KvReportKernelData> m_kernelData;
    std::unique_ptr<KvBlockTypeList> m_blocks;
    std::unique_ptr<KvTemplateModel> m_model;
    std::unique_ptr<QWidget> m_widget; ///< the statistics window or the view of the pages
    std::unique_ptr<PaintWatch> m_watch;
    int m_updates = 0;
};
