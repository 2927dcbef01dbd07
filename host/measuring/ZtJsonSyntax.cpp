// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonSyntax.h"

#include "measuring/ZtProgress.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <limits>

namespace {

constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
constexpr std::size_t lookDistance = 64 * 1024;

// Shorter numbers without an exponent are neither too large nor too small for a double.
constexpr std::size_t longestPlainNumber = 300;

constexpr bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}

// Characters that stand for themselves and take one byte.
constexpr std::array<bool, 256> makePlain()
{
    std::array<bool, 256> plain{};
    for (std::size_t c = 0x20; c < 0x80; ++c)
        plain[c] = c != '"' && c != '\\';
    return plain;
}

constexpr std::array<bool, 256> plainCharacters = makePlain();

bool isPlain(char c)
{
    return plainCharacters[static_cast<unsigned char>(c)];
}

int hexDigit(char c)
{
    if (isDigit(c))
        return c - '0';
    const char lower = static_cast<char>(c | 0x20);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

/// The first byte of a character of several bytes, what follows it, and the least that needs so many bytes.
struct Utf8Length
{
    unsigned mask;
    unsigned mark;
    std::size_t following;
    unsigned least;
};

constexpr Utf8Length utf8Lengths[] = {
    {0xE0, 0xC0, 1, 0x80}, {0xF0, 0xE0, 2, 0x800}, {0xF8, 0xF0, 3, 0x10000}};

bool isSurrogate(unsigned code)
{
    return code >= 0xD800 && code <= 0xDFFF;
}

} // namespace

ZtJsonSyntax::ZtJsonSyntax(std::string_view bytes, ZtProgress *progress)
    : m_bytes(bytes)
    , m_progress(progress)
{
    m_error.error = QJsonParseError::NoError;
    m_error.offset = 0;
}

bool ZtJsonSyntax::check()
{
    if (m_bytes.substr(0, byteOrderMark.size()) == byteOrderMark)
        m_at = byteOrderMark.size();
    skipBlanks();
    m_begin = m_at;
    if (current() != '[' && current() != '{')
        return fail(QJsonParseError::IllegalValue);
    if (!checkValue(1))
        return false;
    skipBlanks();
    if (m_at < m_bytes.size())
        return fail(QJsonParseError::GarbageAtEnd);
    std::sort(m_largeParts.begin(), m_largeParts.end(),
              [](const Part &a, const Part &b) { return a.begin < b.begin; });
    return true;
}

bool ZtJsonSyntax::fail(QJsonParseError::ParseError error)
{
    m_error.error = error;
    m_error.offset = static_cast<int>(std::min<std::size_t>(m_at, std::numeric_limits<int>::max()));
    return false;
}

bool ZtJsonSyntax::goOn()
{
    if (m_at < m_nextLook || !m_progress)
        return true;
    m_nextLook = m_at + lookDistance;
    m_progress->setDone(static_cast<double>(m_at) / static_cast<double>(m_bytes.size()));
    return !m_progress->isCancelled();
}

void ZtJsonSyntax::skipBlanks()
{
    while (m_at < m_bytes.size() &&
           (m_bytes[m_at] == ' ' || m_bytes[m_at] == '\n' || m_bytes[m_at] == '\t' || m_bytes[m_at] == '\r'))
        ++m_at;
}

bool ZtJsonSyntax::take(char wanted)
{
    skipBlanks();
    if (current() != wanted)
        return false;
    ++m_at;
    return true;
}

bool ZtJsonSyntax::enter(int level)
{
    if (level > mostLevels)
        return fail(QJsonParseError::DeepNesting);
    ++m_at;
    return true;
}

bool ZtJsonSyntax::leave(std::size_t begin)
{
    if (m_at - begin >= largeSize)
        m_largeParts.push_back({begin, m_at});
    return true;
}

bool ZtJsonSyntax::checkValue(int level)
{
    skipBlanks();
    switch (current()) {
    case '"':
        return checkText();
    case '[':
        return checkList(level);
    case '{':
        return checkObject(level);
    case 't':
        return checkWord("true");
    case 'f':
        return checkWord("false");
    case 'n':
        return checkWord("null");
    case ',':
        return fail(QJsonParseError::IllegalValue);
    case ']':
    case '}':
        return fail(QJsonParseError::MissingObject);
    default:
        return checkNumber();
    }
}

bool ZtJsonSyntax::checkList(int level)
{
    const std::size_t begin = m_at;
    if (!enter(level))
        return false;
    if (take(']'))
        return leave(begin);
    do {
        skipBlanks();
        if (m_at == m_bytes.size())
            return fail(QJsonParseError::UnterminatedArray);
        if (!goOn() || !checkValue(level + 1))
            return false;
    } while (take(','));
    if (take(']'))
        return leave(begin);
    const bool isCut = m_at == m_bytes.size();
    return fail(isCut ? QJsonParseError::UnterminatedArray : QJsonParseError::MissingValueSeparator);
}

bool ZtJsonSyntax::checkObject(int level)
{
    const std::size_t begin = m_at;
    if (!enter(level))
        return false;
    if (take('}'))
        return leave(begin);
    do {
        if (!goOn() || !checkMember(level))
            return false;
    } while (take(','));
    return take('}') ? leave(begin) : fail(QJsonParseError::UnterminatedObject);
}

bool ZtJsonSyntax::checkMember(int level)
{
    skipBlanks();
    if (current() == '}')
        return fail(QJsonParseError::MissingObject);
    if (current() != '"')
        return fail(QJsonParseError::UnterminatedObject);
    if (!checkText())
        return false;
    return take(':') ? checkValue(level + 1) : fail(QJsonParseError::MissingNameSeparator);
}

bool ZtJsonSyntax::checkText()
{
    ++m_at;
    for (;;) {
        const char *const end = m_bytes.data() + m_bytes.size();
        const char *at = m_bytes.data() + m_at;
        while (at != end && isPlain(*at))
            ++at;
        m_at = static_cast<std::size_t>(at - m_bytes.data());
        if (at == end || static_cast<unsigned char>(*at) < 0x20)
            return fail(QJsonParseError::UnterminatedString);
        if (*at == '"')
            break;
        if (*at == '\\' ? !checkEscape() : !checkCharacter())
            return false;
    }
    ++m_at;
    return true;
}

bool ZtJsonSyntax::checkEscape()
{
    ++m_at;
    const char c = current();
    if (c == 'u')
        return checkUnicodeEscape();
    if (c == '\0' || std::string_view("\"\\/bfnrt").find(c) == std::string_view::npos)
        return fail(QJsonParseError::IllegalEscapeSequence);
    ++m_at;
    return true;
}

// A character beyond the first 65536 is two escapes, which make no sense alone.
bool ZtJsonSyntax::checkUnicodeEscape()
{
    unsigned first = 0;
    if (!readHex(&first))
        return false;
    if (!isSurrogate(first))
        return true;
    unsigned second = 0;
    if (first >= 0xDC00 || m_bytes.substr(m_at, 2) != "\\u")
        return fail(QJsonParseError::IllegalEscapeSequence);
    ++m_at;
    if (!readHex(&second))
        return false;
    const bool isPair = second >= 0xDC00 && second <= 0xDFFF;
    return isPair || fail(QJsonParseError::IllegalEscapeSequence);
}

bool ZtJsonSyntax::readHex(unsigned *code)
{
    ++m_at;
    for (int i = 0; i < 4; ++i, ++m_at) {
        const int digit = hexDigit(current());
        if (digit < 0)
            return fail(QJsonParseError::IllegalEscapeSequence);
        *code = *code * 16 + static_cast<unsigned>(digit);
    }
    return true;
}

bool ZtJsonSyntax::checkCharacter()
{
    const auto first = static_cast<unsigned char>(current());
    for (const Utf8Length &length : utf8Lengths) {
        if ((first & length.mask) != length.mark)
            continue;
        unsigned code = first & ~length.mask;
        bool isWhole = m_bytes.size() - m_at > length.following;
        for (std::size_t i = 1; isWhole && i <= length.following; ++i) {
            const auto byte = static_cast<unsigned char>(m_bytes[m_at + i]);
            isWhole = (byte & 0xC0) == 0x80;
            code = (code << 6) | (byte & 0x3F);
        }
        if (!isWhole || code < length.least || code > 0x10FFFF || isSurrogate(code))
            break;
        m_at += length.following + 1;
        return true;
    }
    return fail(QJsonParseError::IllegalUTF8String);
}

bool ZtJsonSyntax::skipDigits()
{
    const std::size_t begin = m_at;
    while (isDigit(current()))
        ++m_at;
    return m_at > begin;
}

bool ZtJsonSyntax::checkNumber()
{
    const std::size_t begin = m_at;
    if (current() == '-')
        ++m_at;
    if (current() == '0')
        ++m_at;
    else if (!skipDigits())
        return fail(QJsonParseError::IllegalNumber);
    if (current() == '.') {
        ++m_at;
        if (!skipDigits())
            return fail(QJsonParseError::IllegalNumber);
    }
    const bool hasExponent = current() == 'e' || current() == 'E';
    if (hasExponent) {
        ++m_at;
        if (current() == '+' || current() == '-')
            ++m_at;
        if (!skipDigits())
            return fail(QJsonParseError::IllegalNumber);
    }
    if (m_at == m_bytes.size())
        return fail(QJsonParseError::TerminationByNumber);
    const bool isSimple = !hasExponent && m_at - begin <= longestPlainNumber;
    return isSimple || isHeld(begin) || fail(QJsonParseError::IllegalNumber);
}

bool ZtJsonSyntax::isHeld(std::size_t begin) const
{
    double value = 0.0;
    return std::from_chars(m_bytes.data() + begin, m_bytes.data() + m_at, value).ec == std::errc();
}

bool ZtJsonSyntax::checkWord(std::string_view word)
{
    if (m_bytes.substr(m_at, word.size()) != word)
        return fail(QJsonParseError::IllegalValue);
    m_at += word.size();
    return true;
}
