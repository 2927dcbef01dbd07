// SPDX-License-Identifier: MIT
#include "measuring/ZtTidyTableReader.h"

#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtTableNumber.h"

namespace {

const QStringList typeKeys = {QStringLiteral("object_type"), QStringLiteral("type"), QStringLiteral("class"),
                              QStringLiteral("species")};
const QStringList objectKeys = {QStringLiteral("object_index"),
                                QStringLiteral("index"),
                                QStringLiteral("object"),
                                QStringLiteral("object_name"),
                                QStringLiteral("name"),
                                QStringLiteral("label"),
                                QStringLiteral("id")};
const QStringList numberKeys = {QStringLiteral("object_index"), QStringLiteral("index")};
const QStringList objectNameKeys = {QStringLiteral("object_name")};
const QStringList valueNameKeys = {QStringLiteral("value_name"), QStringLiteral("measurement"),
                                   QStringLiteral("variable"), QStringLiteral("parameter")};
const QStringList unitKeys = {QStringLiteral("unit"), QStringLiteral("units")};
const QStringList valueKeys = {QStringLiteral("value")};

QByteArray toBytes(std::string_view text)
{
    return QByteArray(text.data(), static_cast<int>(text.size()));
}

// Shares the row's memory: for look-ups only.
QByteArray lookUpKey(std::string_view text)
{
    return QByteArray::fromRawData(text.data(), static_cast<int>(text.size()));
}

} // namespace

bool ZtTidyTableReader::recognizes(const QVector<ZtTableHeader> &headers)
{
    return ZtTableHeader::findKey(headers, valueKeys) >= 0 &&
           ZtTableHeader::findKey(headers, valueNameKeys) >= 0;
}

bool ZtTidyTableReader::readTable()
{
    if (!readHeader() || !chooseColumns())
        return false;
    ZtCsvRow row;
    while (nextRowLikeHeader(&row)) {
        if (!readRow(row))
            return false;
    }
    return !hasFault();
}

bool ZtTidyTableReader::chooseColumns()
{
    if (!findColumnOption(options().typeColumn, &m_typeColumn) ||
        !findColumnOption(options().nameColumn, &m_objectColumn))
        return false;
    if (options().nameColumn.isEmpty())
        m_objectColumn = ZtTableHeader::findKey(headers(), objectKeys, m_typeColumn);
    if (options().typeColumn.isEmpty())
        m_typeColumn = ZtTableHeader::findKey(headers(), typeKeys, m_objectColumn);
    // Where numbers tell the objects apart, a further column may name them.
    if (m_objectColumn >= 0 && numberKeys.contains(headers().at(m_objectColumn).key()))
        m_objectNameColumn = ZtTableHeader::findKey(headers(), objectNameKeys, m_typeColumn);
    m_nameColumn = ZtTableHeader::findKey(headers(), valueNameKeys);
    m_unitColumn = ZtTableHeader::findKey(headers(), unitKeys);
    m_valueColumn = ZtTableHeader::findKey(headers(), valueKeys);
    noteLeftOutColumns();
    return true;
}

void ZtTidyTableReader::noteLeftOutColumns()
{
    QStringList leftOut;
    const QVector<int> used = {m_typeColumn, m_objectColumn, m_objectNameColumn,
                               m_nameColumn, m_unitColumn,   m_valueColumn};
    for (int i = 0; i < headers().size(); ++i) {
        if (!used.contains(i))
            leftOut.append(headers().at(i).written);
    }
    if (leftOut.size() == 1)
        addNote(tr("Column %1 is not part of a list of values and was left out").arg(quoted(leftOut)));
    else if (leftOut.size() > 1)
        addNote(tr("Columns %1 are not part of a list of values and were left out").arg(quoted(leftOut)));
}

std::string_view ZtTidyTableReader::field(const ZtCsvRow &row, int column) const
{
    return column < 0 ? std::string_view()
                      : ZtTableNumber::trimmed(row.fields[static_cast<std::size_t>(column)]);
}

bool ZtTidyTableReader::readRow(const ZtCsvRow &row)
{
    const int type = typeIndex(field(row, m_typeColumn));
    m_types.resize(static_cast<std::size_t>(typeCount()));
    int valueIndex = 0;
    int object = 0;
    if (m_objectColumn >= 0 && isWithoutValue(row))
        return findObject(row, type, valueIndex, &object);
    return findValue(row, type, &valueIndex) && findObject(row, type, valueIndex, &object) &&
           readValue(row, type, object, valueIndex);
}

bool ZtTidyTableReader::isWithoutValue(const ZtCsvRow &row) const
{
    return field(row, m_nameColumn).empty() && field(row, m_valueColumn).empty();
}

bool ZtTidyTableReader::findValue(const ZtCsvRow &row, int type, int *valueIndex)
{
    const std::string_view name = field(row, m_nameColumn);
    TypeState &state = m_types[static_cast<std::size_t>(type)];
    const auto found = state.valueIndexes.constFind(lookUpKey(name));
    if (found != state.valueIndexes.constEnd()) {
        *valueIndex = *found;
        return true;
    }
    const QString valueName = QString::fromUtf8(lookUpKey(name)).simplified();
    if (valueName.isEmpty())
        return fail(row.line, m_nameColumn + 1, tr("The value has no name"));
    *valueIndex = builder(type).addValue(valueName);
    state.valueIndexes.insert(toBytes(name), *valueIndex);
    state.occurrences.resize(builder(type).valueCount());
    return true;
}

// Without a column for objects, the n-th value of a name belongs to the n-th object of its type.
bool ZtTidyTableReader::findObject(const ZtCsvRow &row, int type, int valueIndex, int *object)
{
    TypeState &state = m_types[static_cast<std::size_t>(type)];
    if (m_objectColumn < 0) {
        *object = state.occurrences[valueIndex]++;
        if (*object == builder(type).rowCount())
            builder(type).addRow();
        return true;
    }
    const std::string_view key = field(row, m_objectColumn);
    *object = state.lastObjectIndex;
    if (state.lastObjectIndex >= 0 && state.lastObject == lookUpKey(key))
        return true;
    if (ZtTableNumber::read(key, false).kind == ZtTableNumber::Missing)
        return fail(row.line, m_objectColumn + 1, tr("The row does not say which object it belongs to"));
    const auto found = state.objects.constFind(lookUpKey(key));
    if (found != state.objects.constEnd()) {
        *object = *found;
    } else {
        *object = addNamedObject(type, key, field(row, m_objectNameColumn));
        state.objects.insert(toBytes(key), *object);
    }
    state.lastObject = toBytes(key);
    state.lastObjectIndex = *object;
    return true;
}

int ZtTidyTableReader::addNamedObject(int type, std::string_view key, std::string_view name)
{
    const QString text = QString::fromUtf8(name.data(), static_cast<int>(name.size())).simplified();
    if (text.isEmpty())
        return addObject(type, key);
    ZtImportedTypeBuilder &objects = builder(type);
    const QString standard = objects.name() + QLatin1Char(' ') + QString::number(objects.rowCount() + 1);
    return objects.addRow(text == standard ? QString() : text);
}

bool ZtTidyTableReader::readValue(const ZtCsvRow &row, int type, int object, int valueIndex)
{
    const ZtUnit *unit = nullptr;
    return findUnit(row, type, valueIndex, &unit) &&
           addNumber(row, m_valueColumn, {type, object, valueIndex}, *unit);
}

bool ZtTidyTableReader::findUnit(const ZtCsvRow &row, int type, int valueIndex, const ZtUnit **unit)
{
    std::vector<WrittenUnit> &units = m_types[static_cast<std::size_t>(type)].units;
    units.resize(static_cast<std::size_t>(builder(type).valueCount()));
    WrittenUnit &last = units[static_cast<std::size_t>(valueIndex)];
    *unit = &last.unit;
    const std::string_view written = field(row, m_unitColumn);
    if (last.isRead && last.written == lookUpKey(written))
        return true;
    if (!readUnit(row, builder(type).value(valueIndex).name, &last.unit))
        return false;
    last.isRead = true;
    last.written = toBytes(written);
    return true;
}

bool ZtTidyTableReader::readUnit(const ZtCsvRow &row, const QString &valueName, ZtUnit *unit)
{
    const std::string_view written = field(row, m_unitColumn);
    const ZtTableNumber::Kind kind = ZtTableNumber::read(written, isDecimalComma()).kind;
    if (kind == ZtTableNumber::Number)
        return fail(row.line, m_unitColumn + 1, tr("%1 is not a unit").arg(quoted(written)));
    const bool isStated = kind != ZtTableNumber::Missing;
    *unit =
        units().unitOf(valueName, isStated ? QString::fromUtf8(toBytes(written)).simplified() : QString());
    return true;
}
