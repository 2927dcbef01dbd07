// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtTableReader.h"

/**
 * Reads tables whose first line holds the number of rows, the number of values per row, and the names of
 * classes. Every row has that many numbers and the index of its class, from 0.
 */
class ZtClassIndexTableReader : public ZtTableReader
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    using ZtTableReader::ZtTableReader;

    /** Whether a first row can be one of such a table: two whole numbers, then names. */
    static bool recognizes(const ZtCsvRow &firstRow);

protected:
    bool readTable() override;

private:
    bool readFirstRow();
    bool refuseColumnOptions();
    bool readRow(const ZtCsvRow &row);
    bool readClass(const ZtCsvRow &row, int *type);

    int m_firstLine = 1;
    int m_rowCount = 0;
    int m_valueCount = 0;
    QVector<int> m_classTypes; ///< type index of each class, -1 until one of its rows came
    std::vector<std::string> m_classNames;
};
