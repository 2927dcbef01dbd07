// SPDX-License-Identifier: MIT
#include "blocks/table/KvTablePageSplit.h"

#include <algorithm>

KvTablePageSplit KvTablePageSplit::compute(int contentHeight, int headerRows, int bodyRows)
{
    KvTablePageSplit split;
    if (contentHeight <= 0)
        return split;
    const int rows = (contentHeight - RowHeight * headerRows - Padding) / RowHeight;
    if (rows <= 0)
        return split;
    split.rowsPerPage = rows;
    split.pieceCount = std::max(1, static_cast<int>((static_cast<long long>(bodyRows) - 1 + rows) / rows));
    return split;
}

int KvTablePageSplit::firstRow(int page) const
{
    return rowsPerPage < 0 ? 0 : page * rowsPerPage;
}

int KvTablePageSplit::rowCount(int page, int bodyRows) const
{
    if (rowsPerPage < 0)
        return bodyRows;
    return std::clamp(bodyRows - firstRow(page), 0, rowsPerPage);
}
