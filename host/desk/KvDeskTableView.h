// SPDX-License-Identifier: MIT
#pragma once

#include <QTableView>

/** Table of the program's panels: whole rows, no grid, copied to the clipboard with the shortcut for copying.
 */
class KvDeskTableView : public QTableView
{
    Q_OBJECT
public:
    explicit KvDeskTableView(QWidget *parent = nullptr);

    /** The selected rows as shown, top to bottom: fields with tabulators between them, one line each. */
    QString selectedText() const;

public slots:
    /** Puts selectedText() on the clipboard; without a selection the clipboard stays. */
    void slotCopy();

private:
    QString rowText(int row) const;
};
