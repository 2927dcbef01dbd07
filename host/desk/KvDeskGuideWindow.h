// SPDX-License-Identifier: MIT
#pragma once

#include <QMainWindow>

class KvDeskGuideText;
class QAction;
class QKeySequence;
class QLabel;
class QLineEdit;
class QListWidget;
class QSplitter;
class QToolBar;

/** Shows the user guide with its contents, and finds words in it. Escape closes it. */
class KvDeskGuideWindow : public QMainWindow
{
    Q_OBJECT
public:
    /** \a path is that of a Markdown file. */
    explicit KvDeskGuideWindow(const QString &path, QWidget *parent = nullptr);

    KvDeskGuideText *text() const { return m_text; }
    QListWidget *contents() const { return m_contents; }
    QLineEdit *findField() const { return m_findField; }
    QLabel *findResult() const { return m_findResult; } ///< empty unless a text was not found

protected:
    void closeEvent(QCloseEvent *event) override;

private slots:
    void slotShowHeading();
    void slotMarkHeading(int aIndex);
    void slotUpdateSteps();
    void slotFocusFind();
    void slotFindTyped();
    void slotFindNext();
    void slotFindPrevious();
    void slotEscape();

private:
    void createContents();
    void createToolBar();
    void createFind(QToolBar *bar);
    QAction *addTo(QToolBar *bar, const char *icon, const QString &name, const QList<QKeySequence> &keys);
    void connectSignals();
    void updateFind();
    void showFindResult(bool isFound);
    void restoreWindow();
    void saveWindow() const;

    KvDeskGuideText *m_text;
    QListWidget *m_contents;
    QSplitter *m_splitter;
    QLineEdit *m_findField = nullptr;
    QLabel *m_findResult = nullptr;
    QAction *m_back = nullptr;
    QAction *m_forward = nullptr;
    QAction *m_findPrevious = nullptr;
    QAction *m_findNext = nullptr;
    QAction *m_askWhatToFind = nullptr; ///< has the keys of finding as long as there is nothing to find
    QAction *m_zoomOut = nullptr;
    QAction *m_zoomIn = nullptr;
    QAction *m_zoomNormal = nullptr;
};
