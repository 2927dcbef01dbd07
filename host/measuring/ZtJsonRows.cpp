// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonRows.h"

#include "measuring/ZtCsvReader.h"
#include "measuring/ZtJsonRecords.h"
#include "measuring/ZtJsonValues.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtSessionFormat.h"

#include <algorithm>

namespace {

// How much of the time of a table passes until it is known that it is JSON, and what its columns are.
constexpr double firstShare = 0.1;
constexpr double checkShare = 0.3;
constexpr double columnsShare = 0.4;
constexpr double lastShare = 0.9;

// Keys of foreign files may be of any length.
constexpr int longestPlace = 40;

} // namespace

ZtJsonRows::ZtJsonRows(const ZtJsonReader &json, ZtProgress *progress)
    : m_json(json)
    , m_progress(progress)
{}

bool ZtJsonRows::recognizes(std::string_view text)
{
    const std::size_t first = text.find_first_not_of(" \t\r\n");
    return first != std::string_view::npos && (text[first] == '[' || text[first] == '{');
}

std::unique_ptr<ZtJsonRows> ZtJsonRows::open(std::string_view text, ZtProgress *progress, ZtFault *fault)
{
    ZtJsonReader json(text);
    ZtProgress::setPart(progress, firstShare, checkShare);
    if (!json.check(progress)) {
        *fault = ZtProgress::isCancelled(progress) ? ZtFault() : json.fault();
        if (fault->isNull())
            fault->message = tr("Reading was cancelled");
        return nullptr;
    }
    ZtProgress::setPart(progress, checkShare, columnsShare);
    std::unique_ptr<ZtJsonRows> rows = make(&json, progress, fault);
    if (!rows || rows->prepare())
        return rows;
    *fault = rows->fault();
    return nullptr;
}

std::unique_ptr<ZtJsonRows> ZtJsonRows::make(ZtJsonReader *json, ZtProgress *progress, ZtFault *fault)
{
    if (json->kind() == ZtJsonReader::List)
        return std::make_unique<ZtJsonRecords>(*json, progress);
    const QString format = ZtJsonValues::formatOf(*json);
    if (format == QLatin1String(ZtJsonValues::formatName))
        return std::make_unique<ZtJsonValues>(*json, progress);
    fault->message = format == ZtSessionFormat::formatName
                         ? tr("This file is a session, not a table; open it")
                         : tr("The file is neither a list of records nor an export of values");
    return nullptr;
}

void ZtJsonRows::beginPass(double from, double to)
{
    const auto share = [](double of) {
        return columnsShare + (of - firstShare) / (lastShare - firstShare) * (lastShare - columnsShare);
    };
    ZtProgress::setPart(m_progress, share(from), share(to));
}

bool ZtJsonRows::setList(const QString &place)
{
    if (m_json.kind() != ZtJsonReader::List)
        return fail(place, reason(QT_TRANSLATE_NOOP("ZtSession", "This must be a list")));
    m_list = m_json.position();
    rewind();
    return true;
}

void ZtJsonRows::rewind()
{
    m_json.seek(m_list);
    m_json.enter();
    m_linePosition = 0;
    m_line = 1;
    m_item = -1;
    m_isHeaderRead = false;
    m_isAtEnd = false;
    rewindRecords();
}

bool ZtJsonRows::next(ZtCsvRow *row)
{
    row->fields.clear();
    row->unescaped.clear();
    if (!m_fault.isNull())
        return false;
    if (m_isHeaderRead)
        return nextRecord(row);
    m_isHeaderRead = true;
    row->line = 0;
    row->fields.assign(m_columns.begin(), m_columns.end());
    return true;
}

bool ZtJsonRows::nextItem()
{
    m_isAtEnd = !m_json.nextItem();
    if (m_isAtEnd)
        return false;
    ++m_item;
    if (m_progress && m_item % ZtProgress::stride == 0) {
        m_progress->setDone(static_cast<double>(m_json.position()) / static_cast<double>(m_json.size()));
        if (m_progress->isCancelled()) {
            m_fault.message = tr("Reading was cancelled");
            return false;
        }
    }
    if (m_json.kind() == ZtJsonReader::Object)
        return true;
    return fail(placeOf(-1), reason(QT_TRANSLATE_NOOP("ZtSession", "This must be an object")));
}

int ZtJsonRows::line()
{
    const std::string_view passed = m_json.bytesFrom(m_linePosition);
    m_line += static_cast<int>(std::count(passed.begin(), passed.end(), '\n'));
    m_linePosition = m_json.position();
    return m_line;
}

bool ZtJsonRows::fail(const QString &place, const QString &message)
{
    m_fault.line = m_json.lineOf(static_cast<int>(m_json.position()));
    m_fault.place = place;
    m_fault.message = message;
    return false;
}

bool ZtJsonRows::failTwice(const QString &place)
{
    return fail(place, tr("This name comes twice"));
}

ZtFault ZtJsonRows::located(ZtFault fault) const
{
    if (fault.column > 0 && m_isHeaderRead && !m_isAtEnd)
        fault.place = placeOf(fault.column - 1);
    fault.column = 0;
    return fault;
}

bool ZtJsonRows::findMembers(const QString &place, std::initializer_list<std::string_view> keys,
                             std::vector<std::size_t> *positions)
{
    positions->assign(keys.size(), 0);
    std::string_view key;
    std::string buffer;
    for (m_json.enter(); m_json.nextMember(&key, &buffer); m_json.skip()) {
        const auto found = std::find(keys.begin(), keys.end(), key);
        if (found == keys.end())
            continue;
        std::size_t &position = (*positions)[static_cast<std::size_t>(found - keys.begin())];
        if (position != 0)
            return failTwice(place.isEmpty() ? toPlace(key) : place + QLatin1Char('.') + toPlace(key));
        position = m_json.position();
    }
    return true;
}

bool ZtJsonRows::readField(const QString &place, std::deque<std::string> *texts, std::string_view *field)
{
    const ZtJsonReader::Kind kind = m_json.kind();
    if (kind == ZtJsonReader::List || kind == ZtJsonReader::Object)
        return fail(place, tr("This must be a text, a number or null"));
    if (kind == ZtJsonReader::Text) {
        std::string buffer;
        *field = m_json.utf8(&buffer);
        if (field->data() == buffer.data())
            *field = texts->emplace_back(std::move(buffer));
        return true;
    }
    const std::size_t begin = m_json.position();
    m_json.skip();
    *field = kind == ZtJsonReader::Null ? std::string_view() : m_json.bytesFrom(begin);
    return true;
}

QString ZtJsonRows::reason(const char *text)
{
    return QCoreApplication::translate("ZtSession", text);
}

QString ZtJsonRows::toPlace(std::string_view key)
{
    // Four times as many bytes are enough for the longest place in any script.
    const std::string_view start = key.substr(0, longestPlace * 4);
    return QString::fromUtf8(start.data(), static_cast<int>(start.size())).left(longestPlace);
}
