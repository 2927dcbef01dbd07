// SPDX-License-Identifier: MIT
#include "measuring/ZtWideTableReader.h"

#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtTableNumber.h"

namespace {

const QStringList &nameKeys()
{
    static const QStringList keys = {QStringLiteral("name"),         QStringLiteral("label"),
                                     QStringLiteral("id"),           QStringLiteral("object_name"),
                                     QStringLiteral("object_index"), QStringLiteral("object"),
                                     QStringLiteral("index")};
    return keys;
}

const QStringList &typeKeys()
{
    static const QStringList keys = {QStringLiteral("object_type"), QStringLiteral("type"),
                                     QStringLiteral("class"), QStringLiteral("species")};
    return keys;
}

} // namespace

bool ZtWideTableReader::readTable()
{
    if (!readHeader() || !findOptions() || !scanColumns() || !chooseColumns())
        return false;
    nameValues();
    noteLeftOutColumns();
    return readRows();
}

bool ZtWideTableReader::scanColumns()
{
    beginPass(0.1, 0.4);
    m_columns.resize(headers().size());
    ZtCsvRow row;
    while (nextRowLikeHeader(&row)) {
        ++m_rowCount;
        for (int i = 0; i < m_columns.size(); ++i)
            scanCell(row.fields[static_cast<std::size_t>(i)], i == m_nameColumn, &m_columns[i]);
    }
    return !hasFault();
}

void ZtWideTableReader::scanCell(std::string_view field, bool isName, Column *column) const
{
    switch (ZtTableNumber::read(field, isDecimalComma()).kind) {
    case ZtTableNumber::Missing:
        return;
    case ZtTableNumber::Number:
    case ZtTableNumber::Infinite:
        ++column->numbers;
        return;
    case ZtTableNumber::Text:
        break;
    }
    ++column->texts;
    // Whether names come twice is of no interest, and to find out takes long.
    if (column->repeats || isName)
        return;
    const QByteArray text(field.data(), static_cast<int>(field.size()));
    column->repeats = column->seen.contains(text);
    column->seen.insert(text);
    if (column->repeats)
        column->seen.clear();
}

// The headings alone say which column has the names.
bool ZtWideTableReader::findOptions()
{
    if (!findColumnOption(options().typeColumn, &m_typeColumn) ||
        !findColumnOption(options().nameColumn, &m_nameColumn))
        return false;
    if (options().nameColumn.isEmpty())
        m_nameColumn = detectNameColumn();
    return true;
}

bool ZtWideTableReader::chooseColumns()
{
    if (options().typeColumn.isEmpty())
        m_typeColumn = detectTypeColumn();
    chooseValueColumns();
    for (const Column &column : qAsConst(m_columns)) {
        if (column.isValue)
            return true;
    }
    return m_rowCount == 0 || fail(headerLine(), 0, tr("There is no column of numbers"));
}

int ZtWideTableReader::detectNameColumn() const
{
    const QStringList keys = isResultsTable() ? QStringList(QStringLiteral("label")) : nameKeys();
    const int column = ZtTableHeader::findKey(headers(), keys, m_typeColumn);
    return column < 0 && isResultsTable() && m_typeColumn != 0 ? 0 : column;
}

int ZtWideTableReader::detectTypeColumn() const
{
    for (const QString &key : typeKeys()) {
        const int column = ZtTableHeader::findKey(headers(), {key}, m_nameColumn);
        if (column >= 0 && m_columns.at(column).texts > m_columns.at(column).numbers)
            return column;
    }
    return firstRepeatingTextColumn();
}

int ZtWideTableReader::firstRepeatingTextColumn() const
{
    for (int i = 0; i < m_columns.size(); ++i) {
        const Column &column = m_columns.at(i);
        if (i != m_nameColumn && column.repeats && column.texts > column.numbers)
            return i;
    }
    return -1;
}

// A column is a value when at least half of its filled cells are numbers; the rest of them are then faults.
void ZtWideTableReader::chooseValueColumns()
{
    for (int i = 0; i < m_columns.size(); ++i) {
        Column &column = m_columns[i];
        const bool isNumber = m_nameColumn >= 0 && headers().at(i).key() == QLatin1String("object_index");
        const bool hasOtherRole =
            i == m_nameColumn || i == m_typeColumn || isNumber || (i == 0 && isResultsTable());
        column.isValue = !hasOtherRole && column.numbers > 0 && column.numbers >= column.texts;
    }
}

void ZtWideTableReader::nameValues()
{
    QSet<QString> taken;
    int valueIndex = 0;
    for (int i = 0; i < m_columns.size(); ++i) {
        Column &column = m_columns[i];
        if (!column.isValue)
            continue;
        const ZtTableHeader &header = headers().at(i);
        const QString name = header.name.isEmpty() ? tr("Column %1").arg(i + 1) : header.name;
        column.valueName = name;
        for (int n = 2; taken.contains(column.valueName); ++n)
            column.valueName = QStringLiteral("%1 (%2)").arg(name).arg(n);
        taken.insert(column.valueName);
        column.valueIndex = valueIndex++;
        column.unit = isResultsTable()
                          ? units().resultsUnitOf(column.valueName, header.unitText, header.written)
                          : units().unitOf(column.valueName, header.unitText, header.written);
    }
}

void ZtWideTableReader::noteLeftOutColumns()
{
    QStringList names;
    for (int i = 0; i < m_columns.size(); ++i) {
        const Column &column = m_columns.at(i);
        if (column.isValue || i == m_nameColumn || i == m_typeColumn || column.texts == 0)
            continue;
        names.append(headers().at(i).written);
    }
    if (names.size() == 1)
        addNote(tr("Column %1 holds text and was left out").arg(quoted(names)));
    else if (names.size() > 1)
        addNote(tr("Columns %1 hold text and were left out").arg(quoted(names)));
}

int ZtWideTableReader::typeOf(const ZtCsvRow &row)
{
    const int known = typeCount();
    const int type =
        typeIndex(m_typeColumn < 0 ? std::string_view() : row.fields[static_cast<std::size_t>(m_typeColumn)]);
    if (type == known) {
        for (const Column &column : qAsConst(m_columns)) {
            if (column.isValue)
                builder(type).appendValue(column.valueName, column.unit);
        }
    }
    return type;
}

bool ZtWideTableReader::readRows()
{
    rewindToFirstRow();
    beginPass(0.4, 0.9);
    ZtCsvRow row;
    while (nextRowLikeHeader(&row)) {
        const int type = typeOf(row);
        const int object = addObject(
            type, m_nameColumn < 0 ? std::string_view() : row.fields[static_cast<std::size_t>(m_nameColumn)]);
        if (!readCells(row, type, object))
            return false;
    }
    return !hasFault();
}

bool ZtWideTableReader::readCells(const ZtCsvRow &row, int type, int object)
{
    for (int i = 0; i < m_columns.size(); ++i) {
        const Column &column = m_columns.at(i);
        if (column.isValue && !addNumber(row, i, {type, object, column.valueIndex}, column.unit))
            return false;
    }
    return true;
}
