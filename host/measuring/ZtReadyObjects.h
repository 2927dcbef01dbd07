// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelData.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtSession.h"

#include <memory>
#include <vector>

class ZtImportedManipulator;
class ZtProgress;
struct ZtImportedTable;

/**
 * The objects of an imported type with their names and hidden values, ready for the kernel: making a million
 * of them takes a while, which another thread can spend, but handing them over does not.
 */
class ZT_MEASURING_EXPORT ZtReadyObjects
{
public:
    /** From any thread. Incomplete, and not to be used, when \a progress is cancelled. */
    explicit ZtReadyObjects(const ZtSessionTable &table, ZtProgress *progress = nullptr);
    ZtReadyObjects(ZtReadyObjects &&other) noexcept;
    ZtReadyObjects &operator=(ZtReadyObjects &&) = delete;
    ~ZtReadyObjects();

    /** The objects of all types of a table. */
    static std::vector<ZtReadyObjects> ofTable(const ZtImportedTable &table, ZtProgress *progress = nullptr);
    /** The objects of all tables of a session. */
    static std::vector<ZtReadyObjects> ofSession(const ZtSession &session, ZtProgress *progress = nullptr);

    /** What a session file says of the objects. */
    const ZtSessionTable &table() const { return m_table; }

    /**
     * Makes the type known to the kernel under the next free id greater than \a afterId, silently, and gives
     * it the objects. GUI thread only, once. \return the id
     */
    int handOver(int afterId);

private:
    void add(ZtSessionRow *row);

    ZtSessionTable m_table;
    std::unique_ptr<ZtImportedManipulator> m_manipulator;
    ZtObjectMap m_objects;
};
