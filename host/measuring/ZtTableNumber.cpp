// SPDX-License-Identifier: MIT
#include "measuring/ZtTableNumber.h"

#include <QByteArray>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <string>

namespace {

bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}

char lower(char c)
{
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

// \a word is lower case.
bool equals(std::string_view text, std::string_view word)
{
    return text.size() == word.size() &&
           std::equal(text.begin(), text.end(), word.begin(), [](char a, char b) { return lower(a) == b; });
}

template <std::size_t Count>
bool isOneOf(std::string_view text, const std::string_view (&words)[Count])
{
    return std::any_of(std::begin(words), std::end(words),
                       [text](std::string_view word) { return equals(text, word); });
}

bool isMissing(std::string_view text)
{
    static constexpr std::string_view words[] = {"na", "n/a", "nan", "null", "-"};
    return text.empty() || isOneOf(text, words);
}

bool isInfinite(std::string_view unsignedText)
{
    static constexpr std::string_view words[] = {"inf", "infinity"};
    return isOneOf(unsignedText, words);
}

std::string_view withoutSign(std::string_view text)
{
    if (!text.empty() && (text.front() == '+' || text.front() == '-'))
        text.remove_prefix(1);
    return text;
}

// Too large for a double is a fault of the table; too small is nearly 0.
ZtTableNumber::Kind readOutOfRange(std::string_view text, double *value)
{
    *value = QByteArray(text.data(), static_cast<int>(text.size())).toDouble();
    return std::isfinite(*value) ? ZtTableNumber::Number : ZtTableNumber::Infinite;
}

// Reads all of an unsigned number with a decimal point.
ZtTableNumber::Kind readUnsigned(std::string_view text, double *value)
{
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), *value);
    if (end != text.data() + text.size())
        return ZtTableNumber::Text;
    if (error == std::errc::result_out_of_range)
        return readOutOfRange(text, value);
    return error == std::errc() && std::isfinite(*value) ? ZtTableNumber::Number : ZtTableNumber::Text;
}

ZtTableNumber::Kind readUnsignedWithComma(std::string_view text, double *value)
{
    if (text.find('.') != std::string_view::npos)
        return ZtTableNumber::Text;
    std::string withPoint(text);
    std::replace(withPoint.begin(), withPoint.end(), ',', '.');
    return readUnsigned(withPoint, value);
}

} // namespace

std::string_view ZtTableNumber::trimmed(std::string_view text)
{
    // Most fields have none.
    if (!text.empty() && text.front() > ' ' && text.back() > ' ')
        return text;
    const std::string_view blanks = " \t\r\n";
    const std::size_t first = text.find_first_not_of(blanks);
    if (first == std::string_view::npos)
        return std::string_view();
    return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

ZtTableNumber ZtTableNumber::read(std::string_view field, bool decimalComma)
{
    const std::string_view text = trimmed(field);
    ZtTableNumber result;
    const bool startsAsNumber = !text.empty() && isDigit(text.front());
    if (!startsAsNumber && isMissing(text))
        return result;
    const std::string_view digits = withoutSign(text);
    const char mark = decimalComma ? ',' : '.';
    if (digits.empty() || !(isDigit(digits.front()) || digits.front() == mark)) {
        result.kind = isInfinite(digits) ? Infinite : Text;
        return result;
    }
    result.kind =
        decimalComma ? readUnsignedWithComma(digits, &result.value) : readUnsigned(digits, &result.value);
    if (result.kind == Number && text.front() == '-')
        result.value = -result.value;
    return result;
}

std::string_view ZtTableNumber::textOf(std::string_view field, bool decimalComma, std::string *buffer)
{
    const std::string_view text = trimmed(field);
    if (!decimalComma)
        return text;
    buffer->assign(text);
    std::replace(buffer->begin(), buffer->end(), ',', '.');
    return *buffer;
}
