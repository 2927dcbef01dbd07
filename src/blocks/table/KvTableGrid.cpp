// SPDX-License-Identifier: MIT
#include "blocks/table/KvTableGrid.h"

#include <algorithm>

void KvTableGrid::setCell(int row, int column, const QString &text, const QColor &color, int columnSpan)
{
    if (row < 0 || column < 0)
        return;
    if (column >= m_stride)
        widen(column + 1);
    if (row >= m_rowCount) {
        m_rowCount = row + 1;
        m_cells.resize(m_rowCount * m_stride);
    }
    m_columnCount = std::max(m_columnCount, column + 1);
    KvTableCell &cell = m_cells[row * m_stride + column];
    cell.text = text;
    cell.color = color;
    cell.columnSpan = std::max(columnSpan, 1);
    m_hasSpans = m_hasSpans || columnSpan > 1;
}

const KvTableCell *KvTableGrid::cell(int row, int column) const
{
    if (row < 0 || row >= m_rowCount || column < 0 || column >= m_columnCount)
        return nullptr;
    const KvTableCell &cell = m_cells.at(row * m_stride + column);
    return cell.columnSpan > 0 ? &cell : nullptr;
}

void KvTableGrid::clear()
{
    m_cells.resize(0);
    m_stride = 0;
    m_rowCount = 0;
    m_columnCount = 0;
    m_hasSpans = false;
}

void KvTableGrid::reserve(int rows, int columns)
{
    if (columns > m_stride)
        widen(columns);
    m_cells.reserve(rows * m_stride);
}

void KvTableGrid::widen(int columns)
{
    QVector<KvTableCell> cells;
    if (m_rowCount > 0) {
        cells.resize(m_rowCount * columns);
        for (int row = 0; row < m_rowCount; ++row) {
            for (int column = 0; column < m_stride; ++column)
                cells[row * columns + column] = m_cells.at(row * m_stride + column);
        }
        m_cells = cells;
    }
    m_stride = columns;
}
