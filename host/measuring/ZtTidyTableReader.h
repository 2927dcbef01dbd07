// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtTableReader.h"

/** Reads tables with one value per row: columns for the value and its name, and for type, object and unit. */
class ZtTidyTableReader : public ZtTableReader
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    using ZtTableReader::ZtTableReader;

    /** Whether headings are those of such a table. */
    static bool recognizes(const QVector<ZtTableHeader> &headers);

protected:
    bool readTable() override;
    int unitColumn() const override { return m_unitColumn; }

private:
    struct WrittenUnit
    {
        bool isRead = false;
        QByteArray written;
        ZtUnit unit;
    };
    /** What is known about the objects of one type. */
    struct TypeState
    {
        QHash<QByteArray, int> objects;      ///< by their key in the table
        QHash<QByteArray, int> valueIndexes; ///< by the value's name in the table
        QVector<int> occurrences;            ///< of each value, where objects have no key
        QByteArray lastObject; ///< key of the row before: rows of one object often come together
        int lastObjectIndex = -1;
        std::vector<WrittenUnit> units; ///< of each value, as it came last
    };

    bool chooseColumns();
    void noteLeftOutColumns();
    bool readRow(const ZtCsvRow &row);
    /** An object that has no values makes a row that names none. */
    bool isWithoutValue(const ZtCsvRow &row) const;
    bool readValue(const ZtCsvRow &row, int type, int object, int valueIndex);
    bool findUnit(const ZtCsvRow &row, int type, int valueIndex, const ZtUnit **unit);
    bool readUnit(const ZtCsvRow &row, const QString &valueName, ZtUnit *unit);
    bool findValue(const ZtCsvRow &row, int type, int *valueIndex);
    bool findObject(const ZtCsvRow &row, int type, int valueIndex, int *object);
    int addNamedObject(int type, std::string_view key, std::string_view name);
    std::string_view field(const ZtCsvRow &row, int column) const;

    int m_typeColumn = -1;
    int m_objectColumn = -1;
    int m_objectNameColumn = -1; ///< where the objects are told apart by numbers, and named as well
    int m_nameColumn = -1;
    int m_unitColumn = -1;
    int m_valueColumn = -1;
    std::vector<TypeState> m_types;
};
