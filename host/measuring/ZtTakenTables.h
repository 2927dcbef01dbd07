// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtSession.h"

#include <memory>
#include <optional>
#include <vector>

/** Types that tables brought, taken out of the kernel with all of their objects: to be put back as they were,
 * or to be freed. */
struct ZT_MEASURING_EXPORT ZtTakenTables
{
    struct Table
    {
        int typeId = 0;
        ZtObjectMap objects; ///< owned
        std::unique_ptr<ZtGsManipulator> manipulator;
        std::optional<ZtSessionTable> rows; ///< what a session file says of the objects, where that is known
    };

    ZtTakenTables() = default;
    ZtTakenTables(const ZtTakenTables &) = delete;
    ZtTakenTables &operator=(const ZtTakenTables &) = delete;
    ~ZtTakenTables();

    /** Frees what nobody wants back, another thread where that takes a while. Null is nothing to free. */
    static void retire(std::unique_ptr<ZtTakenTables> taken);

    std::vector<Table> tables;
};
