// SPDX-License-Identifier: MIT
#include "measuring/ZtTakenTables.h"

#include "kernel/ZtKernelObjectData.h"
#include "measuring/ZtWorkerThread.h"

#include <algorithm>

namespace {

bool isLarge(const ZtTakenTables &taken)
{
    constexpr int many = 10000;
    return std::any_of(taken.tables.begin(), taken.tables.end(),
                       [](const ZtTakenTables::Table &table) { return table.objects.size() >= many; });
}

} // namespace

ZtTakenTables::~ZtTakenTables()
{
    for (const Table &table : tables)
        qDeleteAll(table.objects);
}

void ZtTakenTables::retire(std::unique_ptr<ZtTakenTables> taken)
{
    if (!taken || !isLarge(*taken))
        return;
    // Work can be copied, so it cannot own what cannot.
    const auto shared = std::make_shared<std::unique_ptr<ZtTakenTables>>(std::move(taken));
    ZtWorkerThread::retire(ZtWorkerThread::begin([shared]() { shared->reset(); }));
}
