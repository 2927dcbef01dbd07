// SPDX-License-Identifier: MIT
#include "measuring/ZtClassIndexTableReader.h"

#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtTableNumber.h"

#include <charconv>

namespace {

// A whole number from 0, as an int can hold it.
bool readCount(std::string_view field, int *count)
{
    const std::string_view text = ZtTableNumber::trimmed(field);
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), *count);
    return error == std::errc() && end == text.data() + text.size() && *count >= 0;
}

} // namespace

bool ZtClassIndexTableReader::recognizes(const ZtCsvRow &firstRow)
{
    int count = 0;
    if (firstRow.fields.size() < 3 || !readCount(firstRow.fields[0], &count) ||
        !readCount(firstRow.fields[1], &count))
        return false;
    for (std::size_t i = 2; i < firstRow.fields.size(); ++i) {
        if (ZtTableNumber::read(firstRow.fields[i], false).kind != ZtTableNumber::Text)
            return false;
    }
    return true;
}

bool ZtClassIndexTableReader::readTable()
{
    if (!readFirstRow() || !refuseColumnOptions())
        return false;
    ZtCsvRow row;
    int rows = 0;
    while (nextRow(&row)) {
        ++rows;
        if (!readRow(row))
            return false;
    }
    if (hasFault() || rows == m_rowCount)
        return !hasFault();
    return fail(m_firstLine, 1,
                tr("The table has %n row(s), its first line announces %1", "", rows).arg(m_rowCount));
}

bool ZtClassIndexTableReader::readFirstRow()
{
    ZtCsvRow row;
    if (!nextRow(&row))
        return false;
    m_firstLine = row.line;
    readCount(row.fields[0], &m_rowCount);
    readCount(row.fields[1], &m_valueCount);
    m_classNames.assign(row.fields.begin() + 2, row.fields.end());
    m_classTypes.fill(-1, static_cast<int>(m_classNames.size()));
    if (m_valueCount > 0)
        return true;
    return fail(row.line, 2, tr("The first line announces rows without values"));
}

bool ZtClassIndexTableReader::refuseColumnOptions()
{
    for (const QString &name : {options().typeColumn, options().nameColumn}) {
        if (!name.isEmpty())
            return fail(0, 0,
                        tr("There is no column %1; the columns of this table have no names")
                            .arg(quoted(name.toStdString())));
    }
    return true;
}

bool ZtClassIndexTableReader::readClass(const ZtCsvRow &row, int *type)
{
    int index = 0;
    const bool isCount = readCount(row.fields.back(), &index);
    if (!isCount || index >= m_classTypes.size())
        return fail(row.line, m_valueCount + 1,
                    tr("%1 is not the index of a class; they go from 0 to %2")
                        .arg(quoted(row.fields.back()))
                        .arg(m_classTypes.size() - 1));
    if (m_classTypes.at(index) < 0) {
        const int known = typeCount();
        m_classTypes[index] = typeIndex(m_classNames[static_cast<std::size_t>(index)]);
        for (int i = 0; m_classTypes.at(index) == known && i < m_valueCount; ++i) {
            const QString name = tr("Value %1").arg(i + 1);
            builder(known).appendValue(name, units().unitOf(name, QString()));
        }
    }
    *type = m_classTypes.at(index);
    return true;
}

bool ZtClassIndexTableReader::readRow(const ZtCsvRow &row)
{
    const std::size_t fieldCount = static_cast<std::size_t>(m_valueCount) + 1;
    if (row.fields.size() != fieldCount)
        return fail(row.line, static_cast<int>(qMin(row.fields.size(), fieldCount)) + 1,
                    tr("The row has %n field(s) instead of %1", "", static_cast<int>(row.fields.size()))
                        .arg(fieldCount));
    int type = 0;
    if (!readClass(row, &type))
        return false;
    const int object = builder(type).addRow();
    for (int i = 0; i < m_valueCount; ++i) {
        if (!addNumber(row, i, {type, object, i}, builder(type).value(i).unit))
            return false;
    }
    return true;
}
