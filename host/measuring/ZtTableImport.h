// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtTableImportOptions.h"

#include <memory>
#include <vector>

class QByteArray;
class QIODevice;
class ZtImportedManipulator;
class ZtProgress;
class ZtReadyObjects;

/**
 * Reads tables of measurements: one value per row, one object per row, or results as ImageJ writes them, as
 * separated values; and, as JSON, lists of such rows and what ZtTableExport writes.
 *
 * Layout, separator, decimal mark and encoding are found out. A table is taken as a whole: at the first fault
 * nothing of it is.
 */
class ZT_MEASURING_EXPORT ZtTableImport
{
public:
    /** First id of the object types that tables bring; built-in types have smaller ones. */
    static constexpr int firstTypeId = 0x20000;

    /**
     * Each reads a whole table; false with the first fault found. From any thread. \a fileName is only for
     * the fault; a \a progress that is cancelled is a fault, too.
     */
    static bool readFile(const QString &path, const ZtTableImportOptions &options, ZtImportedTable *table,
                         ZtFault *fault, ZtProgress *progress = nullptr);
    static bool readDevice(QIODevice *device, const QString &fileName, const ZtTableImportOptions &options,
                           ZtImportedTable *table, ZtFault *fault, ZtProgress *progress = nullptr);
    static bool parse(const QByteArray &bytes, const QString &fileName, const ZtTableImportOptions &options,
                      ZtImportedTable *table, ZtFault *fault, ZtProgress *progress = nullptr);

    /**
     * Makes every type of a table, with its objects, known to ZtKernelData under the next free ids from
     * firstTypeId. Objects count from 1 in the order of their rows. Announces one creation per type that has
     * objects. \return the ids of the new types
     */
    static QVector<int> apply(const ZtImportedTable &table);
    /** The same with objects that were made already. */
    static QVector<int> apply(std::vector<ZtReadyObjects> *ready, int afterId = 0);

    /**
     * Makes one type known without any objects, silently.
     * \param manipulator has no type id yet
     * \param afterId     the new id is greater than this one
     * \return its id
     */
    static int registerType(std::unique_ptr<ZtImportedManipulator> manipulator, int afterId = 0);
};
