// SPDX-License-Identifier: MIT
#include "measuring/ZtTableHeader.h"

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtUnit.h"

#include <algorithm>

namespace {

// Splits "name [unit]" or "name (unit)".
bool splitBrackets(const QString &text, QChar open, QChar close, ZtTableHeader *header)
{
    if (!text.endsWith(close))
        return false;
    const int start = text.lastIndexOf(open);
    const QString name = start < 0 ? QString() : text.left(start).trimmed();
    if (name.isEmpty())
        return false;
    header->name = name;
    header->unitText = text.mid(start + 1, text.size() - start - 2).trimmed();
    return true;
}

bool isUnitSuffix(const QString &suffix)
{
    static const QStringList lengths = {
        QStringLiteral("nm"), QStringLiteral("um"), QStringLiteral("\u00B5m"), QStringLiteral("\u03BCm"),
        QStringLiteral("mm"), QStringLiteral("cm"), QStringLiteral("m"),       QStringLiteral("px")};
    static const QStringList others = {QStringLiteral("deg"), QStringLiteral("pct"), QStringLiteral("g"),
                                       QStringLiteral("kg"),  QStringLiteral("mg"),  QStringLiteral("s"),
                                       QStringLiteral("ms")};
    if (lengths.contains(suffix) || others.contains(suffix))
        return true;
    const bool isSquare = suffix.endsWith(QLatin1Char('2')) || suffix.endsWith(QChar(0x00B2));
    return isSquare && lengths.contains(suffix.chopped(1));
}

// "Force / N" states a unit, "Width / Height" a ratio: longer words have to be known ones.
bool isUnitAfterSlash(const QString &text)
{
    constexpr int longestUnknownWord = 3;
    const bool isWord = std::all_of(text.begin(), text.end(), [](QChar c) { return c.isLetter(); });
    return !text.isEmpty() && (!isWord || text.size() <= longestUnknownWord || isUnitSuffix(text) ||
                               ZtUnit::parse(text).kind() != ZtGsManipulator::NoKind);
}

bool splitSlash(const QString &text, ZtTableHeader *header)
{
    const QString slash = QStringLiteral(" / ");
    const int start = text.lastIndexOf(slash);
    const QString unit = start > 0 ? text.mid(start + slash.size()).trimmed() : QString();
    if (!isUnitAfterSlash(unit))
        return false;
    header->name = text.left(start).trimmed();
    header->unitText = unit;
    return true;
}

QString withBlanks(QString text)
{
    return text.replace(QLatin1Char('_'), QLatin1Char(' ')).simplified();
}

void splitUnderscore(ZtTableHeader *header)
{
    const QString text = header->name;
    const int start = text.lastIndexOf(QLatin1Char('_'));
    const QString before = start < 0 ? QString() : withBlanks(text.left(start));
    if (!before.isEmpty() && header->unitText.isEmpty() && isUnitSuffix(text.mid(start + 1))) {
        header->name = before;
        header->unitText = text.mid(start + 1);
    } else if (!withBlanks(text).isEmpty()) {
        header->name = withBlanks(text);
    }
}

template <typename Predicate>
int findHeader(const QVector<ZtTableHeader> &headers, Predicate predicate)
{
    const auto found = std::find_if(headers.begin(), headers.end(), predicate);
    return found == headers.end() ? -1 : static_cast<int>(found - headers.begin());
}

} // namespace

ZtTableHeader ZtTableHeader::parse(const QString &text)
{
    ZtTableHeader header;
    header.written = text.simplified();
    header.name = header.written;
    if (!splitBrackets(header.written, QLatin1Char('['), QLatin1Char(']'), &header) &&
        !splitBrackets(header.written, QLatin1Char('('), QLatin1Char(')'), &header))
        splitSlash(header.written, &header);
    splitUnderscore(&header);
    return header;
}

QString ZtTableHeader::key() const
{
    QString result = written.toLower();
    result.replace(QLatin1Char(' '), QLatin1Char('_'));
    return result.replace(QLatin1Char('-'), QLatin1Char('_'));
}

int ZtTableHeader::find(const QVector<ZtTableHeader> &headers, const QString &name)
{
    const QString wanted = name.trimmed();
    for (const Qt::CaseSensitivity sensitivity : {Qt::CaseSensitive, Qt::CaseInsensitive}) {
        for (QString ZtTableHeader::*member : {&ZtTableHeader::written, &ZtTableHeader::name}) {
            const int found = findHeader(headers, [&](const ZtTableHeader &header) {
                return (header.*member).compare(wanted, sensitivity) == 0;
            });
            if (found >= 0)
                return found;
        }
    }
    return -1;
}

int ZtTableHeader::findKey(const QVector<ZtTableHeader> &headers, const QStringList &keys, int except)
{
    for (const QString &key : keys) {
        for (int i = 0; i < headers.size(); ++i) {
            if (i != except && headers.at(i).key() == key)
                return i;
        }
    }
    return -1;
}
