// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtUnit.h"

#include <QString>
#include <QStringList>
#include <QVector>

#include <vector>

/** A value that the objects of an imported type may have. */
struct ZtImportedValue
{
    QString name;
    ZtUnit unit; ///< the unit in which the table gives it first; all of its cells are of this kind
};

/** One number of a table. */
struct ZtImportedCell
{
    double value = 0.0; ///< in base units
    QString text;       ///< number as written in the table, blank, unit
    int valueIndex = 0; ///< position in ZtImportedType::values()
    int unitIndex =
        0; ///< position in the type's units; a table may give one value in mm here and in cm there
};

/**
 * The objects of one type that a table described, row by row, without change after it was built.
 *
 * Rows hold only the cells that have a number, so a table with many value names costs no more than its
 * numbers.
 */
class ZT_MEASURING_EXPORT ZtImportedType
{
public:
    /** The cells of a row in the order of their values. */
    struct Row
    {
        const ZtImportedCell *begin() const { return first; }
        const ZtImportedCell *end() const { return last; }
        const ZtImportedCell *first;
        const ZtImportedCell *last;
    };

    QString name() const { return m_name; }
    const QVector<ZtImportedValue> &values() const { return m_values; }
    QStringList valueNames() const;
    /** Position of a value, or -1. */
    int valueIndex(const QString &valueName) const;

    int rowCount() const { return m_rowNames.size(); }
    /** The name that the table gives a row's object; null where it gives none. */
    QString rowName(int row) const { return m_rowNames.at(row); }
    Row row(int row) const;
    /** A row's cell for a value, or null when it has none. */
    const ZtImportedCell *cell(int row, int valueIndex) const;

    /** The unit in which a cell was written. */
    const ZtUnit &unit(const ZtImportedCell &cell) const { return m_units.at(cell.unitIndex); }
    /** The number of a cell as written, without its unit. */
    QString numberText(const ZtImportedCell &cell) const;

private:
    friend class ZtImportedTypeBuilder;
    ZtImportedType() = default;

    QString m_name;
    QVector<ZtImportedValue> m_values;
    QVector<ZtUnit> m_units;
    QVector<QString> m_rowNames;
    std::vector<std::size_t> m_rowStarts; ///< one more than rows: where each row's cells begin
    std::vector<ZtImportedCell> m_cells;
};
