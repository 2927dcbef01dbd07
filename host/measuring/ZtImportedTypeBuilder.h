// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtImportedType.h"

#include <QHash>

#include <memory>

struct ZtFault;

/** Line and field of a table, both from 1; 0 for an unknown one. */
struct ZtTablePlace
{
    int line = 0;
    int column = 0;
};

/** Collects the rows and cells of one imported type, in any order, and makes the finished type of them. */
class ZT_MEASURING_EXPORT ZtImportedTypeBuilder
{
public:
    explicit ZtImportedTypeBuilder(const QString &name);

    QString name() const { return m_type->m_name; }
    int rowCount() const { return m_type->m_rowNames.size(); }
    int valueCount() const { return m_type->m_values.size(); }
    const ZtImportedValue &value(int index) const { return m_type->m_values.at(index); }

    /** Position of a value, which is added at the end when it is new; its first number brings its unit. */
    int addValue(const QString &valueName);
    /** Adds a value of a known unit without looking for one of the same name: the caller's names differ. */
    int appendValue(const QString &valueName, const ZtUnit &unit);

    /** Adds a row and returns its number; a null name gives its object the type's name and number. */
    int addRow(const QString &rowName = QString());

    /**
     * Adds a number, which is finite in base units.
     * \param numberText the number as written, in ASCII with a decimal point
     * \param place      where the file has it, for later faults
     * \return false when \a unit does not fit the unit of this value
     */
    bool addCell(int row, int valueIndex, double number, std::string_view numberText, const ZtUnit &unit,
                 const ZtTablePlace &place = ZtTablePlace());

    /** The finished type; null, with message and place in \a fault, when a row has the same value twice. */
    std::shared_ptr<const ZtImportedType> build(ZtFault *fault);

private:
    struct Entry
    {
        int row;
        ZtTablePlace place;
        ZtImportedCell cell;
    };

    int unitIndex(const ZtUnit &unit);
    bool findRepeatedCell(ZtFault *fault) const;
    QString rowDisplayName(int row) const;

    std::shared_ptr<ZtImportedType> m_type;
    QHash<QString, int> m_valueIndexes;
    QVector<bool> m_hasUnit; ///< per value: its unit is decided
    std::vector<Entry> m_entries;
};
