// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QString>
#include <QVector>

/** One cell of a table block. */
struct KvTableCell
{
    QString text;
    QColor color;       ///< of the text; invalid means the theme's
    int columnSpan = 0; ///< columns that the cell covers; 0 marks a position without a cell
};

Q_DECLARE_TYPEINFO(KvTableCell, Q_MOVABLE_TYPE);

/**
 * Cells by row and column. Kept in one array, row after row, because a report holds hundreds of thousands of
 * them; cheapest to fill row by row, with the widest row first.
 */
class KvTableGrid
{
public:
    int rowCount() const { return m_rowCount; }
    int columnCount() const { return m_columnCount; }
    /** Whether a cell covers more than one column. */
    bool hasSpans() const { return m_hasSpans; }

    /** Enters a cell and grows the grid to it. Positions are 0 at least, the span 1 at least. */
    void setCell(int row, int column, const QString &text, const QColor &color, int columnSpan);
    /** The cell at a position, or null where there is none. */
    const KvTableCell *cell(int row, int column) const;
    /** Removes everything but keeps the storage for the next filling. */
    void clear();
    /** Makes room for \a rows rows of \a columns columns. */
    void reserve(int rows, int columns);

private:
    void widen(int columns);

    QVector<KvTableCell> m_cells;
    int m_stride = 0;
    int m_rowCount = 0;
    int m_columnCount = 0;
    bool m_hasSpans = false;
};
