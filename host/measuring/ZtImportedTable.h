// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtImportedType.h"

#include <memory>

/** A table that was read completely: its objects by type, in the order in which the types first came. */
struct ZtImportedTable
{
    QVector<std::shared_ptr<const ZtImportedType>> types;
    QStringList notes; ///< what was left out of the table, one sentence each

    int objectCount() const
    {
        int count = 0;
        for (const auto &type : types)
            count += type->rowCount();
        return count;
    }
};
