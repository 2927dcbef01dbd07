// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtTableReader.h"

#include <QSet>

/**
 * Reads tables with one object per row and one value per column of numbers. A table whose first heading is
 * blank is a results table: its first column counts the rows, and its headings say what is measured.
 */
class ZtWideTableReader : public ZtTableReader
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    using ZtTableReader::ZtTableReader;

protected:
    bool readTable() override;

private:
    /** What the cells of a column hold, found in a first pass. */
    struct Column
    {
        int numbers = 0;
        int texts = 0;
        bool repeats = false;  ///< some text comes twice
        QSet<QByteArray> seen; ///< texts so far, as long as none came twice
        bool isValue = false;
        int valueIndex = -1; ///< the same in all types
        QString valueName;
        ZtUnit unit;
    };

    bool findOptions();
    bool scanColumns();
    void scanCell(std::string_view field, bool isName, Column *column) const;
    bool chooseColumns();
    int detectNameColumn() const;
    int detectTypeColumn() const;
    void chooseValueColumns();
    int firstRepeatingTextColumn() const;
    void nameValues();
    void noteLeftOutColumns();
    bool readRows();
    bool readCells(const ZtCsvRow &row, int type, int object);
    int typeOf(const ZtCsvRow &row);
    bool isResultsTable() const { return headers().first().written.isEmpty(); }

    QVector<Column> m_columns;
    int m_nameColumn = -1;
    int m_typeColumn = -1;
    int m_rowCount = 0;
};
