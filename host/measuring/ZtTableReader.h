// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCsvReader.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtTableHeader.h"
#include "measuring/ZtTableImportOptions.h"
#include "measuring/ZtTableRows.h"
#include "measuring/ZtTableUnits.h"

#include <QByteArray>
#include <QCoreApplication>
#include <QHash>
#include <QVector>

#include <memory>
#include <vector>

class ZtImportedTypeBuilder;

/** Base of the readers of the table layouts: rows in, builders of types, and faults that name their place. */
class ZtTableReader
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    /** All are borrowed. \a decimalComma as in ZtTableNumber. */
    ZtTableReader(ZtTableRows *rows, const ZtTableImportOptions &options, bool decimalComma);
    virtual ~ZtTableReader();

    /** Reads the whole table; false with a fault(). */
    bool read(ZtImportedTable *table);
    const ZtFault &fault() const { return m_fault; }

    /** A field's text for messages: quoted, on one line, not too long. */
    static QString quoted(std::string_view field);
    static QString quoted(const QStringList &texts);

protected:
    virtual bool readTable() = 0;

    bool readHeader();
    /** Goes back to the row after the header. */
    void rewindToFirstRow();
    /** The rows from here to the end take this part of the time that the whole table takes, 0 to 1. */
    void beginPass(double from, double to) { m_rows->beginPass(from, to); }
    /** The next row; false at the end and after a fault, which hasFault() tells apart. */
    bool nextRow(ZtCsvRow *row);
    bool nextRowLikeHeader(ZtCsvRow *row);
    bool hasFault() const { return !m_fault.isNull(); }
    bool fail(int line, int column, const QString &message);
    int headerLine() const { return m_headerLine; }
    /** Finds the column of an option unless that is empty; false with a fault when there is none. */
    bool findColumnOption(const QString &name, int *column);

    /** Index of the builder of a type, which is made on first sight. A blank name stands for objects of no
     * type. */
    int typeIndex(std::string_view name);
    ZtImportedTypeBuilder &builder(int typeIndex) { return *m_builders[static_cast<std::size_t>(typeIndex)]; }
    int typeCount() const { return static_cast<int>(m_builders.size()); }
    /** Adds an object that the table calls \a key: a text is its name, a number comes after the type's name.
     */
    int addObject(int typeIndex, std::string_view key);

    /** The place of a number in the builders. */
    struct Target
    {
        int type = 0;
        int object = 0;
        int valueIndex = 0;
    };
    /** Adds the number of a field; a field without one is skipped. False, with a fault, for anything else. */
    bool addNumber(const ZtCsvRow &row, int column, const Target &target, const ZtUnit &unit);
    /** The column with the units of the numbers, -1 for none. */
    virtual int unitColumn() const { return -1; }

    bool isDecimalComma() const { return m_decimalComma; }
    const ZtTableImportOptions &options() const { return m_options; }
    const QVector<ZtTableHeader> &headers() const { return m_headers; }
    ZtTableUnits &units() { return m_units; }
    void addNote(const QString &note) { m_notes.append(note); }

private:
    bool failNumber(const ZtCsvRow &row, int column, bool isInfinite);
    bool failUnit(const ZtCsvRow &row, int column, const Target &target, const ZtUnit &unit);
    bool checkUnits();
    bool build(ZtImportedTable *table);

    ZtTableRows *m_rows;
    const ZtTableImportOptions &m_options;
    bool m_decimalComma;
    ZtTableUnits m_units;
    QVector<ZtTableHeader> m_headers;
    int m_headerLine = 1;
    QHash<QByteArray, int> m_typeIndexes; ///< by the type's name in the table
    QHash<QString, int> m_typesByName;    ///< by its display name
    std::vector<std::unique_ptr<ZtImportedTypeBuilder>> m_builders;
    QStringList m_notes;
    std::string m_numberText; ///< of the field that is being read
    ZtFault m_fault;
};
