// SPDX-License-Identifier: MIT
#pragma once

/** How a table is cut into page pieces. Heights are in pixels; plain arithmetic without widgets. */
struct KvTablePageSplit
{
    static constexpr int RowHeight = 32;
    static constexpr int Padding = 10; ///< what a piece is higher than its rows, at most

    int rowsPerPage = -1; ///< body rows of a piece; negative means all
    int pieceCount = 1;

    /**
     * \param contentHeight height that a page grants; 0 or less means no limit
     *
     * A page too low for one body row holds them all in one piece: dividing by the zero or negative number of
     * rows that the height yields would have no meaning.
     */
    static KvTablePageSplit compute(int contentHeight, int headerRows, int bodyRows);

    /** Index of the first body row of piece \a page. */
    int firstRow(int page) const;
    /** Number of body rows that piece \a page shows. */
    int rowCount(int page, int bodyRows) const;
};
