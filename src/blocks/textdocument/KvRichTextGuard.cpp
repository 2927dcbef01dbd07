// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvRichTextGuard.h"

#include <QRegularExpression>
#include <QStringList>

#include <algorithm>

namespace {

constexpr int kBreakEvery = 1000; // characters of an overlong word
constexpr QChar kBreakHere(0x200B);
constexpr int kLongestEntity = 12;
constexpr int kLongDigits = 6; // of numbers beyond all sizes on a page

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

/** Elements that have to be closed, and so may stand in each other without end. Tables count on their own. */
bool isNestingName(const QString &name)
{
    static const QStringList names{
        QStringLiteral("a"),     QStringLiteral("address"), QStringLiteral("b"),
        QStringLiteral("big"),   QStringLiteral("center"),  QStringLiteral("cite"),
        QStringLiteral("code"),  QStringLiteral("div"),     QStringLiteral("dl"),
        QStringLiteral("em"),    QStringLiteral("font"),    QStringLiteral("i"),
        QStringLiteral("ol"),    QStringLiteral("pre"),     QStringLiteral("s"),
        QStringLiteral("small"), QStringLiteral("span"),    QStringLiteral("strong"),
        QStringLiteral("sub"),   QStringLiteral("sup"),     QStringLiteral("tt"),
        QStringLiteral("u"),     QStringLiteral("ul"),      QStringLiteral("kbd"),
        QStringLiteral("var"),   QStringLiteral("samp"),    QStringLiteral("strike"),
        QStringLiteral("dfn"),   QStringLiteral("h1"),      QStringLiteral("h2"),
        QStringLiteral("h3"),    QStringLiteral("h4"),      QStringLiteral("h5"),
        QStringLiteral("h6"),    QStringLiteral("nobr"),    QStringLiteral("blockquote")};
    return names.contains(name);
}

/** Follows how deep in elements other than tables a text is. */
class ElementDepth
{
public:
    /** Depth of the element that the tag opens or closes; 0 for any other token. */
    int take(const Token &token)
    {
        if (!token.isTag)
            return 0;
        const bool isEnd = token.text.startsWith(QLatin1String("</"));
        if (!isNestingName(nameFrom(token.text.mid(isEnd ? 2 : 1))))
            return 0;
        if (!isEnd)
            return ++m_depth;
        return m_depth > 0 ? m_depth-- : 0;
    }

private:
    static QString nameFrom(QStringView text)
    {
        const auto end =
            std::find_if_not(text.begin(), text.end(), [](QChar c) { return c.isLetterOrNumber(); });
        return text.left(end - text.begin()).toString().toLower();
    }

    int m_depth = 0;
};

/** Whether a token is a tag, and no "<" between words, with a number of more digits than sizes have. */
bool hasLongNumber(const Token &token)
{
    if (!token.isTag || token.text.size() < 2 || !token.text.at(1).isLetter())
        return false;
    int digits = 0;
    return std::any_of(token.text.begin(), token.text.end(), [&digits](QChar c) {
        digits = c.isDigit() ? digits + 1 : 0;
        return digits >= kLongDigits;
    });
}

/** Appends a tag with its sizes kept in range. */
void appendWithShortNumbers(QString &target, const QString &tag)
{
    // Addresses are passed over, as they hold a picture's data, and colours are no sizes.
    static const QRegularExpression numbers(
        QStringLiteral("\\b(?:src|href)\\s*=\\s*(?:\"[^\"]*\"|'[^']*'|[^\\s>]*)|(?<![\\w#.])(\\d{6,})"),
        QRegularExpression::CaseInsensitiveOption);
    int from = 0;
    for (auto matches = numbers.globalMatch(tag); matches.hasNext();) {
        const QRegularExpressionMatch match = matches.next();
        if (match.capturedLength(1) == 0)
            continue;
        target.append(tag.midRef(from, match.capturedStart(1) - from));
        target.append(QString::number(KvRichTextGuard::LargestNumber));
        from = match.capturedEnd(1);
    }
    target.append(tag.midRef(from));
}

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

bool isOverlong(const Token &token)
{
    return !token.isTag && longestWord(token.text) > KvRichTextGuard::LongestWord;
}

/** Finds the tags that lie too deep in others. */
class Depths
{
public:
    /** Whether \a token is a tag to leave out. */
    bool isTooDeep(const Token &token)
    {
        const int tableDepth = m_tables.take(token);
        const int elementDepth = m_elements.take(token);
        return (tableDepth > KvRichTextGuard::DeepestTable && isTableTag(token)) ||
               elementDepth > KvRichTextGuard::DeepestElement;
    }

private:
    TableDepth m_tables;
    ElementDepth m_elements;
};

bool needsTaming(const QString &html)
{
    Depths depths;
    Tokens tokens(html);
    for (Token token; tokens.next(token);) {
        if (depths.isTooDeep(token) || isOverlong(token) || hasLongNumber(token))
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
    Depths depths;
    Tokens tokens(html);
    for (Token token; tokens.next(token);) {
        if (depths.isTooDeep(token))
            result.append(QLatin1Char(' '));
        else if (isOverlong(token))
            appendBroken(result, token.text);
        else if (hasLongNumber(token))
            appendWithShortNumbers(result, token.text.toString());
        else
            result.append(token.text.data(), static_cast<int>(token.text.size()));
    }
    return result;
}

QString tamedPlain(const QString &text)
{
    if (longestWord(text) <= LongestWord)
        return text;
    QString result;
    appendBroken(result, text);
    return result;
}

} // namespace KvRichTextGuard
