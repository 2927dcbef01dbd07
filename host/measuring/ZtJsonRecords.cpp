// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonRecords.h"

#include "measuring/ZtCsvReader.h"

namespace {

// A row has a field for each column, whether its record has the key or not. Fields per byte of the file;
// where nearly every record has keys of its own, there would soon be more of them than any memory can hold.
constexpr std::size_t mostFieldsPerByte = 32;

} // namespace

ZtJsonRecords::ZtJsonRecords(const ZtJsonReader &json, ZtProgress *progress)
    : ZtJsonRows(json, progress)
{}

bool ZtJsonRecords::prepare()
{
    if (!setList(QString()) || !collectColumns())
        return false;
    const std::size_t records = static_cast<std::size_t>(item() + 1);
    if (records == 0)
        return fail(QString(), tr("The file is empty"));
    if (columns().empty())
        return fail(QString(), tr("There is no column of numbers"));
    if (records * columns().size() > json().size() * mostFieldsPerByte)
        return fail(QString(), tr("The records have too many different names"));
    rewind();
    return true;
}

bool ZtJsonRecords::collectColumns()
{
    std::string_view key;
    std::string buffer;
    while (nextItem()) {
        int column = -1;
        for (json().enter(); json().nextMember(&key, &buffer); json().skip()) {
            const int known = columnOf(key, column);
            column = known >= 0 ? known : addColumn(key);
            int &last = m_lastItems[static_cast<std::size_t>(column)];
            if (last == item())
                return failTwice(placeOf(column));
            last = item();
        }
    }
    return fault().isNull();
}

int ZtJsonRecords::columnOf(std::string_view key, int before) const
{
    const std::size_t following = static_cast<std::size_t>(before + 1);
    if (following < columns().size() && columns()[following] == key)
        return before + 1;
    return m_indexes.value(QByteArray::fromRawData(key.data(), static_cast<int>(key.size())), -1);
}

int ZtJsonRecords::addColumn(std::string_view key)
{
    const int column = static_cast<int>(columns().size());
    m_indexes.insert(QByteArray(key.data(), static_cast<int>(key.size())), column);
    columns().emplace_back(key);
    m_lastItems.push_back(-1);
    return column;
}

bool ZtJsonRecords::nextRecord(ZtCsvRow *row)
{
    if (!nextItem())
        return false;
    row->line = line();
    row->fields.resize(columns().size());
    std::string_view key;
    std::string buffer;
    int column = -1;
    for (json().enter(); json().nextMember(&key, &buffer);) {
        column = columnOf(key, column);
        const ZtJsonReader::Kind kind = json().kind();
        const bool isNested = kind == ZtJsonReader::List || kind == ZtJsonReader::Object;
        if (!readField(isNested ? placeOf(column) : QString(), &row->unescaped,
                       &row->fields[static_cast<std::size_t>(column)]))
            return false;
    }
    return true;
}

QString ZtJsonRecords::placeOf(int column) const
{
    const QString record = QStringLiteral("[%1]").arg(item());
    return column < 0 ? record
                      : record + QLatin1Char('.') + toPlace(columns()[static_cast<std::size_t>(column)]);
}
