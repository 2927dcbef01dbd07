// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/table/KvTableGrid.h"

#include <QFont>
#include <QVector>

/** Everything that the pieces of one table block show; the pieces read it, the block fills it. */
struct KvTableContents
{
    KvTableGrid header;
    KvTableGrid body;
    QFont headerFont;
    QFont bodyFont;
    /** Pixels that each column needs to show its texts whole; empty in tables whose columns are all equal. */
    QVector<int> wantedWidths;
    int yieldingColumns = 0; ///< the first ones, whose texts are cut before those of the others

    int columnCount() const
    {
        return header.columnCount() > body.columnCount() ? header.columnCount() : body.columnCount();
    }
};
