// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtUnit.h"

#include <QString>
#include <QStringList>
#include <QVector>

#include <string>
#include <string_view>
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
    double value = 0.0;    ///< in base units
    quint32 textStart = 0; ///< where the number as written begins among the type's texts
    quint32 textSize = 0;
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
    /** The number of a cell as written with a decimal point, without its unit. */
    std::string_view number(const ZtImportedCell &cell) const
    {
        return std::string_view(m_numbers).substr(cell.textStart, cell.textSize);
    }
    QString numberText(const ZtImportedCell &cell) const;
    /** Number as written, blank, unit. Made once: reports ask again and again, but not for all cells. GUI
     * thread only. */
    QString text(const ZtImportedCell &cell) const;

private:
    friend class ZtImportedTypeBuilder;
    ZtImportedType() = default;

    QString m_name;
    QVector<ZtImportedValue> m_values;
    QVector<ZtUnit> m_units;
    QVector<QString> m_rowNames;
    std::vector<std::size_t> m_rowStarts; ///< one more than rows: where each row's cells begin
    std::vector<ZtImportedCell> m_cells;
    std::string m_numbers; ///< as written, one after another: a text for each would take most of the time
    mutable std::vector<QString> m_texts; ///< of the cells that were asked for; empty before the first one
};
