// SPDX-License-Identifier: MIT
#include "measuring/ZtImportedTypeBuilder.h"

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtFault.h"

#include <QCoreApplication>

#include <algorithm>

namespace {

// Kinds without a unit of their own can only be compared when they are written alike.
bool fits(const ZtUnit &unit, const ZtUnit &first)
{
    return unit.kind() == first.kind() && (unit.kind() != ZtGsManipulator::NoKind || unit == first);
}

} // namespace

ZtImportedTypeBuilder::ZtImportedTypeBuilder(const QString &name)
    : m_type(new ZtImportedType)
{
    m_type->m_name = name;
}

int ZtImportedTypeBuilder::addValue(const QString &valueName)
{
    const auto found = m_valueIndexes.constFind(valueName);
    if (found != m_valueIndexes.constEnd())
        return *found;
    const int index = appendValue(valueName, ZtUnit());
    m_hasUnit[index] = false;
    return index;
}

int ZtImportedTypeBuilder::appendValue(const QString &valueName, const ZtUnit &unit)
{
    const int index = m_type->m_values.size();
    m_type->m_values.append({valueName, unit});
    m_hasUnit.append(true);
    m_valueIndexes.insert(valueName, index);
    return index;
}

int ZtImportedTypeBuilder::addRow(const QString &rowName)
{
    m_type->m_rowNames.append(rowName);
    return rowCount() - 1;
}

int ZtImportedTypeBuilder::unitIndex(const ZtUnit &unit)
{
    const int found = m_type->m_units.indexOf(unit);
    if (found >= 0)
        return found;
    m_type->m_units.append(unit);
    return m_type->m_units.size() - 1;
}

bool ZtImportedTypeBuilder::addCell(int row, int valueIndex, double number, std::string_view numberText,
                                    const ZtUnit &unit, const ZtTablePlace &place)
{
    if (!m_hasUnit.at(valueIndex)) {
        m_type->m_values[valueIndex].unit = unit;
        m_hasUnit[valueIndex] = true;
    }
    if (!fits(unit, value(valueIndex).unit))
        return false;
    ZtImportedCell cell;
    cell.value = unit.toBase(number);
    cell.textStart = static_cast<quint32>(m_type->m_numbers.size());
    cell.textSize = static_cast<quint32>(numberText.size());
    m_type->m_numbers.append(numberText);
    cell.valueIndex = valueIndex;
    cell.unitIndex = unitIndex(unit);
    m_entries.push_back({row, place, std::move(cell)});
    return true;
}

QString ZtImportedTypeBuilder::rowDisplayName(int row) const
{
    const QString own = m_type->m_rowNames.at(row);
    return own.isNull() ? name() + QLatin1Char(' ') + QString::number(row + 1) : own;
}

bool ZtImportedTypeBuilder::findRepeatedCell(ZtFault *fault) const
{
    const auto isSame = [](const Entry &a, const Entry &b) {
        return a.row == b.row && a.cell.valueIndex == b.cell.valueIndex;
    };
    const auto found = std::adjacent_find(m_entries.begin(), m_entries.end(), isSame);
    if (found == m_entries.end())
        return false;
    const Entry &second = *(found + 1);
    fault->line = second.place.line;
    fault->column = second.place.column;
    fault->message =
        QCoreApplication::translate("ZtTableImport", "\"%1\" already has a value \"%2\" in line %3")
            .arg(rowDisplayName(second.row), value(second.cell.valueIndex).name,
                 QString::number(found->place.line));
    return true;
}

std::shared_ptr<const ZtImportedType> ZtImportedTypeBuilder::build(ZtFault *fault)
{
    const auto isBefore = [](const Entry &a, const Entry &b) {
        return a.row != b.row ? a.row < b.row : a.cell.valueIndex < b.cell.valueIndex;
    };
    // Most tables come sorted; the sort would only move their cells about.
    if (!std::is_sorted(m_entries.begin(), m_entries.end(), isBefore))
        std::stable_sort(m_entries.begin(), m_entries.end(), isBefore);
    if (findRepeatedCell(fault))
        return nullptr;

    m_type->m_rowStarts.assign(static_cast<std::size_t>(rowCount()) + 1, m_entries.size());
    m_type->m_cells.reserve(m_entries.size());
    std::size_t row = 0;
    for (Entry &entry : m_entries) {
        for (; row <= static_cast<std::size_t>(entry.row); ++row)
            m_type->m_rowStarts[row] = m_type->m_cells.size();
        m_type->m_cells.push_back(std::move(entry.cell));
    }
    m_entries.clear();
    return std::move(m_type);
}
