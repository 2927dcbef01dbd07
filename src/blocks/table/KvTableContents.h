// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/table/KvTableGrid.h"

#include <QFont>

/** Everything that the pieces of one table block show; the pieces read it, the block fills it. */
struct KvTableContents
{
    KvTableGrid header;
    KvTableGrid body;
    QFont headerFont;
    QFont bodyFont;

    int columnCount() const
    {
        return header.columnCount() > body.columnCount() ? header.columnCount() : body.columnCount();
    }
};
