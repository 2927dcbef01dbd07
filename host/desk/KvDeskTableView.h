// SPDX-License-Identifier: MIT
#pragma once

#include <QTableView>

#include <memory>

class QMimeData;

/** Table of the program's panels: whole rows, no grid, copied to the clipboard with the shortcut for copying.
 */
class KvDeskTableView : public QTableView
{
    Q_OBJECT
public:
    /** What a cell is copied as; cells without it are copied as they are shown. */
    static constexpr int CopyRole = Qt::UserRole + 1;

    explicit KvDeskTableView(QWidget *parent = nullptr);

    /** The selected rows as they are copied, top to bottom: fields with tabulators between them, one line
     * each. */
    QString selectedText() const;
    /** What is copied: selectedText(), below the headings where they are wanted, and the same as an HTML
     * table; null without a selection. */
    std::unique_ptr<QMimeData> selectedData() const;

    /** Whether the headings are copied, too; at first they are not. */
    void setCopiesHeadings(bool copies) { m_copiesHeadings = copies; }
    QAction *copyAction() const { return m_copy; }

public slots:
    /** Puts selectedData() on the clipboard; without a selection the clipboard stays. */
    void slotCopy();

private:
    QVector<int> selectedRows() const;
    QStringList rowTexts(int row) const;
    QStringList headings() const;

    QAction *m_copy;
    bool m_copiesHeadings = false;
};
