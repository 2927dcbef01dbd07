// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonReader.h"

#include "measuring/ZtFault.h"

#include <QCoreApplication>

#include <algorithm>
#include <charconv>

namespace {

bool isBlank(char c)
{
    return c == ' ' || c == '\n' || c == '\t' || c == '\r';
}

unsigned readHex(const char *digits)
{
    unsigned code = 0;
    std::from_chars(digits, digits + 4, code, 16);
    return code;
}

void appendUtf8(std::string *text, unsigned code)
{
    const auto following = [code](int shift) { return static_cast<char>(0x80 | ((code >> shift) & 0x3F)); };
    if (code < 0x80) {
        *text += static_cast<char>(code);
    } else if (code < 0x800) {
        *text += {static_cast<char>(0xC0 | (code >> 6)), following(0)};
    } else if (code < 0x10000) {
        *text += {static_cast<char>(0xE0 | (code >> 12)), following(6), following(0)};
    } else {
        *text += {static_cast<char>(0xF0 | (code >> 18)), following(12), following(6), following(0)};
    }
}

// Reads what follows the "u" of an escape, two of them for a surrogate pair; returns how many bytes that is.
std::size_t decodeUnicode(const char *digits, std::string *text)
{
    const unsigned first = readHex(digits);
    if (first < 0xD800 || first > 0xDFFF) {
        appendUtf8(text, first);
        return 4;
    }
    // Backslash and "u" stand between them.
    const unsigned second = readHex(digits + 6);
    appendUtf8(text, 0x10000 + ((first - 0xD800) << 10) + (second - 0xDC00));
    return 10;
}

char decodeLetter(char letter)
{
    switch (letter) {
    case 'b':
        return '\b';
    case 'f':
        return '\f';
    case 'n':
        return '\n';
    case 'r':
        return '\r';
    case 't':
        return '\t';
    default:
        return letter;
    }
}

void decode(std::string_view escaped, std::string *text)
{
    text->clear();
    for (std::size_t at = 0; at < escaped.size();) {
        if (escaped[at] != '\\') {
            *text += escaped[at++];
            continue;
        }
        const char letter = escaped[at + 1];
        at += 2;
        if (letter == 'u')
            at += decodeUnicode(escaped.data() + at, text);
        else
            *text += decodeLetter(letter);
    }
}

} // namespace

ZtJsonReader::ZtJsonReader(std::string_view bytes)
    : m_bytes(bytes)
{
    m_error.error = QJsonParseError::NoError;
    m_error.offset = 0;
}

bool ZtJsonReader::check(ZtProgress *progress)
{
    ZtJsonSyntax syntax(m_bytes, progress);
    const bool isJson = syntax.check();
    m_error = syntax.error();
    m_at = syntax.begin();
    m_largeParts = syntax.takeLargeParts();
    return isJson;
}

ZtFault ZtJsonReader::fault() const
{
    ZtFault fault;
    if (m_error.error == QJsonParseError::NoError)
        return fault;
    fault.line = lineOf(m_error.offset);
    fault.message = m_error.error == QJsonParseError::DeepNesting
                        ? QCoreApplication::translate("ZtSession", "The file is nested too deeply")
                        : QCoreApplication::translate("ZtSession", "The file is not valid JSON (%1)")
                              .arg(m_error.errorString());
    return fault;
}

int ZtJsonReader::lineOf(int offset) const
{
    const std::string_view before = m_bytes.substr(0, static_cast<std::size_t>(offset));
    return static_cast<int>(std::count(before.begin(), before.end(), '\n')) + 1;
}

void ZtJsonReader::skipBlanks()
{
    while (isBlank(m_bytes[m_at]))
        ++m_at;
}

ZtJsonReader::Kind ZtJsonReader::kind() const
{
    switch (m_bytes[m_at]) {
    case 'n':
        return Null;
    case 't':
    case 'f':
        return Boolean;
    case '"':
        return Text;
    case '[':
        return List;
    case '{':
        return Object;
    default:
        return Number;
    }
}

double ZtJsonReader::number()
{
    double value = 0.0;
    const char *const begin = m_bytes.data() + m_at;
    const auto result = std::from_chars(begin, m_bytes.data() + m_bytes.size(), value);
    m_at += static_cast<std::size_t>(result.ptr - begin);
    return value;
}

bool ZtJsonReader::boolean()
{
    const bool value = m_bytes[m_at] == 't';
    skip();
    return value;
}

QString ZtJsonReader::text()
{
    std::string buffer;
    const std::string_view found = utf8(&buffer);
    return QString::fromUtf8(found.data(), static_cast<int>(found.size()));
}

std::string_view ZtJsonReader::utf8(std::string *buffer)
{
    const std::size_t begin = m_at + 1;
    const char *at = m_bytes.data() + begin;
    while (*at != '"' && *at != '\\')
        ++at;
    const bool isEscaped = *at == '\\';
    if (isEscaped)
        skipText();
    else
        m_at = static_cast<std::size_t>(at - m_bytes.data()) + 1;
    const std::string_view written = m_bytes.substr(begin, m_at - 1 - begin);
    if (!isEscaped)
        return written;
    decode(written, buffer);
    return *buffer;
}

void ZtJsonReader::skipText()
{
    for (++m_at; m_bytes[m_at] != '"'; ++m_at) {
        if (m_bytes[m_at] == '\\')
            ++m_at;
    }
    ++m_at;
}

void ZtJsonReader::skip()
{
    switch (kind()) {
    case Text:
        skipText();
        break;
    case List:
    case Object:
        skipNested();
        break;
    default:
        while (!isBlank(m_bytes[m_at]) &&
               std::string_view(",]}").find(m_bytes[m_at]) == std::string_view::npos)
            ++m_at;
    }
}

void ZtJsonReader::skipNested()
{
    const auto isBefore = [](const ZtJsonSyntax::Part &part, std::size_t at) { return part.begin < at; };
    const auto large = std::lower_bound(m_largeParts.begin(), m_largeParts.end(), m_at, isBefore);
    if (large != m_largeParts.end() && large->begin == m_at) {
        m_at = large->end;
        return;
    }
    int level = 0;
    do {
        const char c = m_bytes[m_at];
        if (c == '"') {
            skipText();
            continue;
        }
        if (c == '[' || c == '{')
            ++level;
        else if (c == ']' || c == '}')
            --level;
        ++m_at;
    } while (level > 0);
}

void ZtJsonReader::enter()
{
    ++m_at;
}

bool ZtJsonReader::next(char end)
{
    skipBlanks();
    if (m_bytes[m_at] == end) {
        ++m_at;
        return false;
    }
    // There is none before the first.
    if (m_bytes[m_at] == ',') {
        ++m_at;
        skipBlanks();
    }
    return true;
}

bool ZtJsonReader::nextItem()
{
    return next(']');
}

bool ZtJsonReader::nextMember(std::string_view *key, std::string *buffer)
{
    if (!next('}'))
        return false;
    *key = utf8(buffer);
    skipBlanks();
    ++m_at;
    skipBlanks();
    return true;
}

int ZtJsonReader::countItems()
{
    int count = 0;
    for (enter(); nextItem(); ++count)
        skip();
    return count;
}
