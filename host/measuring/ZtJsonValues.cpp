// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonValues.h"

#include "measuring/ZtCsvReader.h"
#include "measuring/ZtJsonMembers.h"
#include "measuring/ZtSessionFormat.h"

namespace {

enum Column { TypeColumn, IndexColumn, NameColumn, ValueNameColumn, UnitColumn, ValueColumn };

// Names of the columns for the reader, which are those of the same table as separated values.
constexpr const char *columnNames[] = {"object_type", "object_index", "object_name",
                                       "value_name",  "unit",         "value"};
constexpr const char *memberNames[] = {"type", "index", "name", "name", "unit", "value"};

} // namespace

ZtJsonValues::ZtJsonValues(const ZtJsonReader &json, ZtProgress *progress)
    : ZtJsonRows(json, progress)
{
    columns().assign(std::begin(columnNames), std::end(columnNames));
}

QString ZtJsonValues::formatOf(ZtJsonReader json)
{
    const ZtJsonMembers members(&json, {&ZtSessionFormat::format});
    const bool isText = members.goTo(ZtSessionFormat::format) && json.kind() == ZtJsonReader::Text;
    return isText ? json.text() : QString();
}

bool ZtJsonValues::prepare()
{
    if (!findMembers(QString(), {"format", "version", "objects"}, &m_positions) ||
        !checkVersion(m_positions[1]))
        return false;
    const QString place = QStringLiteral("objects");
    if (m_positions[2] == 0)
        return fail(place, reason(QT_TRANSLATE_NOOP("ZtSession", "This must be a list")));
    json().seek(m_positions[2]);
    return setList(place);
}

bool ZtJsonValues::checkVersion(std::size_t position)
{
    const QString place = QStringLiteral("version");
    json().seek(position);
    if (position == 0 || json().kind() != ZtJsonReader::Number)
        return fail(place, reason(QT_TRANSLATE_NOOP("ZtSession", "This must be a number")));
    const double found = json().number();
    return found == version ||
           fail(place,
                tr("The table is of version %1; this program reads version %2").arg(found).arg(version));
}

bool ZtJsonValues::nextRecord(ZtCsvRow *row)
{
    if (m_value >= 0 && json().nextItem()) {
        ++m_value;
        return readValue(row);
    }
    if (m_value >= 0)
        leaveObject();
    if (!nextItem() || !readObject())
        return false;
    const bool hasValue = json().nextItem();
    m_value = 0;
    if (hasValue)
        return readValue(row);
    row->line = line();
    row->fields = {m_type, m_key, m_name, {}, {}, {}};
    leaveObject();
    return true;
}

void ZtJsonValues::leaveObject()
{
    json().seek(m_objectEnd);
    m_value = -1;
}

// Leaves the reader inside the list of values.
bool ZtJsonValues::readObject()
{
    m_texts.clear();
    m_type = m_key = m_name = std::string_view();
    const QString place = placeOf(-1);
    if (!findMembers(place, {"type", "index", "name", "values"}, &m_positions))
        return false;
    m_objectEnd = json().position();
    if (!readMember(TypeColumn, m_positions[TypeColumn], &m_texts, &m_type) ||
        !readMember(IndexColumn, m_positions[IndexColumn], &m_texts, &m_key) ||
        !readMember(NameColumn, m_positions[NameColumn], &m_texts, &m_name))
        return false;
    nameObject();
    return enterValues(m_positions[3]);
}

// Objects of several tables may have the same type and number: what has a name is told apart by its place.
void ZtJsonValues::nameObject()
{
    if (!m_name.empty())
        m_key = m_texts.emplace_back('#' + std::to_string(item()));
    else if (m_key.empty())
        m_key = m_texts.emplace_back(std::to_string(item() + 1));
}

bool ZtJsonValues::enterValues(std::size_t position)
{
    if (position != 0)
        json().seek(position);
    if (position == 0 || json().kind() != ZtJsonReader::List)
        return fail(placeOf(-1) + QStringLiteral(".values"),
                    reason(QT_TRANSLATE_NOOP("ZtSession", "This must be a list")));
    json().enter();
    return true;
}

bool ZtJsonValues::readMember(int column, std::size_t position, std::deque<std::string> *texts,
                              std::string_view *field)
{
    if (position == 0)
        return true;
    json().seek(position);
    const ZtJsonReader::Kind kind = json().kind();
    const bool isNested = kind == ZtJsonReader::List || kind == ZtJsonReader::Object;
    return readField(isNested ? placeOf(column) : QString(), texts, field);
}

bool ZtJsonValues::readValue(ZtCsvRow *row)
{
    row->line = line();
    row->fields = {m_type, m_key, m_name, {}, {}, {}};
    if (json().kind() != ZtJsonReader::Object)
        return fail(placeOf(-1), reason(QT_TRANSLATE_NOOP("ZtSession", "This must be an object")));
    if (!findMembers(placeOf(-1), {"name", "unit", "value"}, &m_positions))
        return false;
    const std::size_t end = json().position();
    for (int column = ValueNameColumn; column <= ValueColumn; ++column) {
        const auto member = static_cast<std::size_t>(column - ValueNameColumn);
        if (!readMember(column, m_positions[member], &row->unescaped,
                        &row->fields[static_cast<std::size_t>(column)]))
            return false;
    }
    json().seek(end);
    return true;
}

QString ZtJsonValues::placeOf(int column) const
{
    QString place = QStringLiteral("objects[%1]").arg(item());
    if (m_value >= 0 && (column < 0 || column >= ValueNameColumn))
        place += QStringLiteral(".values[%1]").arg(m_value);
    return column < 0 ? place : place + QLatin1Char('.') + QLatin1String(memberNames[column]);
}
