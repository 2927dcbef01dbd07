// SPDX-License-Identifier: MIT
#include "measuring/ZtCsvReader.h"

#include "measuring/ZtProgress.h"

#include <QCoreApplication>

#include <algorithm>

namespace {

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(ZtCsvReader)
};

bool isBlank(char c)
{
    return c == ' ' || c == '\t';
}

std::string_view withoutBlanksAtEnd(std::string_view text)
{
    while (!text.empty() && isBlank(text.back()))
        text.remove_suffix(1);
    return text;
}

std::string withSingleQuotes(std::string_view text)
{
    std::string result;
    result.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        result.push_back(text[i]);
        if (text[i] == '"')
            ++i;
    }
    return result;
}

// A line break of two characters counts at its second one.
int lineBreaks(std::string_view text)
{
    int count = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool isPairStart = text[i] == '\r' && i + 1 < text.size() && text[i + 1] == '\n';
        if (text[i] == '\n' || (text[i] == '\r' && !isPairStart))
            ++count;
    }
    return count;
}

} // namespace

ZtCsvReader::ZtCsvReader(std::string_view text, char separator)
    : m_text(text)
    , m_separator(separator)
{}

void ZtCsvReader::beginPass(double from, double to)
{
    ZtProgress::setPart(m_progress, from, to);
}

void ZtCsvReader::rewind()
{
    m_position = 0;
    m_line = 1;
    m_fault = ZtFault();
}

bool ZtCsvReader::next(ZtCsvRow *row)
{
    while (m_fault.isNull() && m_position < m_text.size()) {
        const std::size_t start = m_position;
        if (!goOn() || !readRow(row))
            return false;
        const bool isEmpty = std::all_of(row->fields.begin(), row->fields.end(),
                                         [](std::string_view field) { return field.empty(); });
        // A pair of quotes is an empty text that somebody meant.
        if (!isEmpty || m_text.substr(start, m_position - start).find('"') != std::string_view::npos)
            return true;
    }
    return false;
}

bool ZtCsvReader::goOn()
{
    if (!m_progress || --m_rowsUntilLook > 0)
        return true;
    m_rowsUntilLook = ZtProgress::stride;
    m_progress->setDone(static_cast<double>(m_position) / static_cast<double>(m_text.size()));
    return !m_progress->isCancelled() || fail(m_line, 0, Text::tr("Reading was cancelled"));
}

bool ZtCsvReader::readRow(ZtCsvRow *row)
{
    row->line = m_line;
    row->fields.clear();
    row->unescaped.clear();
    while (true) {
        if (!readField(row))
            return false;
        if (m_position < m_text.size() && m_text[m_position] == m_separator) {
            ++m_position;
            continue;
        }
        skipLineEnd();
        return true;
    }
}

bool ZtCsvReader::readField(ZtCsvRow *row)
{
    skipBlanks();
    if (m_position < m_text.size() && m_text[m_position] == '"')
        return readQuotedField(row);
    readPlainField(row);
    return true;
}

void ZtCsvReader::readPlainField(ZtCsvRow *row)
{
    const std::size_t start = m_position;
    // Looking for three characters at once takes the standard library longer: fields are short.
    const char *const end = m_text.data() + m_text.size();
    const char *at = m_text.data() + start;
    while (at != end && *at != m_separator && *at != '\n' && *at != '\r')
        ++at;
    m_position = static_cast<std::size_t>(at - m_text.data());
    row->fields.push_back(withoutBlanksAtEnd(m_text.substr(start, m_position - start)));
}

bool ZtCsvReader::readQuotedField(ZtCsvRow *row)
{
    const int firstLine = m_line;
    const std::size_t start = m_position + 1;
    std::size_t quote = m_text.find('"', start);
    bool hasDoubled = false;
    while (quote != std::string_view::npos && quote + 1 < m_text.size() && m_text[quote + 1] == '"') {
        hasDoubled = true;
        quote = m_text.find('"', quote + 2);
    }
    if (quote == std::string_view::npos)
        return fail(firstLine, row->fields.size() + 1, Text::tr("A quoted text does not end"));
    const std::string_view inside = m_text.substr(start, quote - start);
    m_line += lineBreaks(inside);
    if (hasDoubled)
        row->unescaped.push_back(withSingleQuotes(inside));
    row->fields.push_back(hasDoubled ? std::string_view(row->unescaped.back()) : inside);
    m_position = quote + 1;
    skipBlanks();
    if (!isFieldEnd())
        return fail(m_line, row->fields.size(), Text::tr("There is text after a closing quote"));
    return true;
}

void ZtCsvReader::skipBlanks()
{
    while (m_position < m_text.size() && isBlank(m_text[m_position]) && m_text[m_position] != m_separator)
        ++m_position;
}

bool ZtCsvReader::isFieldEnd() const
{
    if (m_position >= m_text.size())
        return true;
    const char c = m_text[m_position];
    return c == m_separator || c == '\n' || c == '\r';
}

bool ZtCsvReader::skipLineEnd()
{
    if (m_position >= m_text.size())
        return false;
    if (m_text[m_position] == '\r' && m_position + 1 < m_text.size() && m_text[m_position + 1] == '\n')
        ++m_position;
    ++m_position;
    ++m_line;
    return true;
}

bool ZtCsvReader::fail(int line, std::size_t field, const QString &message)
{
    m_fault.line = line;
    m_fault.column = static_cast<int>(field);
    m_fault.message = message;
    return false;
}
