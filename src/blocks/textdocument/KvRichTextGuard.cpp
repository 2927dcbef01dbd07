// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvRichTextGuard.h"

#include <QStringList>

#include <algorithm>

namespace {

constexpr int kBreakEvery = 1000; // characters of an overlong word
constexpr QChar kBreakHere(0x200B);
constexpr int kLongestEntity = 12;

/** A tag, or the text up to the next one. */
struct Token
{
    QStringView text;
    bool isTag = false;

    bool isNamed(const QString &name) const
    {
        return isTag && text.startsWith(name, Qt::CaseInsensitive) &&
               (text.size() == name.size() || !text.at(name.size()).isLetterOrNumber());
    }
};

class Tokens
{
public:
    explicit Tokens(const QString &html)
        : m_rest(html)
    {}

    bool next(Token &token)
    {
        if (m_rest.isEmpty())
            return false;
        token.isTag = m_rest.front() == QLatin1Char('<');
        const auto end =
            token.isTag ? m_rest.indexOf(QLatin1Char('>')) + 1 : m_rest.indexOf(QLatin1Char('<'));
        const auto length = end > 0 ? end : m_rest.size();
        token.text = m_rest.left(length);
        m_rest = m_rest.mid(length);
        return true;
    }

private:
    QStringView m_rest;
};

bool isTableTag(const Token &token)
{
    static const QStringList names{
        QStringLiteral("<table"), QStringLiteral("</table"), QStringLiteral("<tr"), QStringLiteral("</tr"),
        QStringLiteral("<td"),    QStringLiteral("</td"),    QStringLiteral("<th"), QStringLiteral("</th"),
        QStringLiteral("<tbody"), QStringLiteral("</tbody")};
    return std::any_of(names.begin(), names.end(),
                       [&token](const QString &name) { return token.isNamed(name); });
}

/** Follows how deep in tables a text is. */
class TableDepth
{
public:
    int depth() const { return m_depth; }

    /** Depth of the tag itself: that of the table which it opens or closes. */
    int take(const Token &token)
    {
        if (token.isNamed(QStringLiteral("<table")))
            return ++m_depth;
        if (token.isNamed(QStringLiteral("</table")))
            return m_depth > 0 ? m_depth-- : 0;
        return m_depth;
    }

private:
    int m_depth = 0;
};

int longestWord(QStringView text)
{
    int longest = 0;
    int length = 0;
    for (const QChar c : text) {
        length = c.isSpace() ? 0 : length + 1;
        longest = std::max(longest, length);
    }
    return longest;
}

bool needsTaming(const QString &html)
{
    TableDepth depth;
    Tokens tokens(html);
    for (Token token; tokens.next(token);) {
        if (depth.take(token) > KvRichTextGuard::DeepestTable)
            return true;
        if (!token.isTag && longestWord(token.text) > KvRichTextGuard::LongestWord)
            return true;
    }
    return false;
}

void appendBroken(QString &target, QStringView text)
{
    int length = 0;
    int sinceEntity = kLongestEntity;
    for (const QChar c : text) {
        length = c.isSpace() ? 0 : length + 1;
        sinceEntity = c == QLatin1Char('&') ? 0 : sinceEntity + 1;
        target.append(c);
        // Not between the halves of a character, nor inside of an entity.
        if (length >= kBreakEvery && sinceEntity >= kLongestEntity && !c.isHighSurrogate()) {
            target.append(kBreakHere);
            length = 0;
        }
    }
}

} // namespace

namespace KvRichTextGuard {

QString tamed(const QString &html)
{
    if (!needsTaming(html))
        return html;
    QString result;
    result.reserve(html.size());
    TableDepth depth;
    Tokens tokens(html);
    for (Token token; tokens.next(token);) {
        const int tagDepth = depth.take(token);
        if (tagDepth > DeepestTable && isTableTag(token))
            result.append(QLatin1Char(' '));
        else if (!token.isTag && longestWord(token.text) > LongestWord)
            appendBroken(result, token.text);
        else
            result.append(token.text.data(), static_cast<int>(token.text.size()));
    }
    return result;
}

} // namespace KvRichTextGuard
