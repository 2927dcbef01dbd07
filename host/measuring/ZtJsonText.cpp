// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonText.h"

#include <array>
#include <charconv>

QByteArray ZtJsonText::number(double value)
{
    std::array<char, 32> digits{};
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), value).ptr;
    return QByteArray(digits.data(), static_cast<int>(end - digits.data()));
}

void ZtJsonText::append(QByteArray *json, const QString &text)
{
    static const char hex[] = "0123456789abcdef";
    *json += '"';
    const QByteArray bytes = text.toUtf8();
    for (const char c : bytes) {
        const auto code = static_cast<unsigned char>(c);
        if (code < 0x20) {
            *json += "\\u00";
            *json += hex[code / 16];
            *json += hex[code % 16];
            continue;
        }
        if (c == '"' || c == '\\')
            *json += '\\';
        *json += c;
    }
    *json += '"';
}

void ZtJsonText::appendPlain(QByteArray *json, std::string_view text)
{
    *json += '"';
    json->append(text.data(), static_cast<int>(text.size()));
    *json += '"';
}
