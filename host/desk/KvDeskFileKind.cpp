// SPDX-License-Identifier: MIT
#include "KvDeskFileKind.h"

#include <QFile>
#include <QFileInfo>
#include <QImageReader>
#include <QRegularExpression>

#include <algorithm>

namespace {

const QStringList &tableSuffixes()
{
    static const QStringList suffixes{QStringLiteral("csv"), QStringLiteral("tsv"), QStringLiteral("tab"),
                                      QStringLiteral("txt"), QStringLiteral("xls")};
    return suffixes;
}

bool isImageSuffix(const QString &suffix)
{
    return QImageReader::supportedImageFormats().contains(suffix.toLatin1());
}

// What JSON begins with, without what may stand before it; empty for anything else.
QByteArray startOfJson(const QString &path)
{
    constexpr int enough = 4096;
    QFile file(path);
    QByteArray start = file.open(QIODevice::ReadOnly) ? file.read(enough) : QByteArray();
    if (start.startsWith("\xEF\xBB\xBF"))
        start.remove(0, 3);
    start = start.trimmed();
    return start.startsWith('{') || start.startsWith('[') ? start : QByteArray();
}

// Tables are lists of records, or say at once what they are.
bool isTableJson(const QByteArray &start)
{
    static const QRegularExpression table(QStringLiteral(R"(^\[\s*\{|"format"\s*:\s*"statreport-values")"));
    return table.match(QString::fromUtf8(start)).hasMatch();
}

// Tables are text; programs, archives and documents soon have a byte that no text has.
bool startsLikeText(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return false;
    const QByteArray start = file.read(4096);
    const bool isUtf16 = start.startsWith("\xFF\xFE") || start.startsWith("\xFE\xFF");
    const bool isText = std::none_of(start.begin(), start.end(),
                                     [](char c) { return (c >= 0 && c < '\t') || (c > '\r' && c < ' '); });
    return !start.isEmpty() && (isUtf16 || isText);
}

QStringList patternsOf(const QStringList &suffixes)
{
    QStringList patterns;
    for (const QString &suffix : suffixes)
        patterns.append(QStringLiteral("*.") + suffix);
    return patterns;
}

} // namespace

KvDeskFileKind::Kind KvDeskFileKind::of(const QString &path)
{
    const QString suffix = QFileInfo(path).suffix().toLower();
    if (suffix == QLatin1String("json"))
        return isTableJson(startOfJson(path)) ? Table : Session;
    if (tableSuffixes().contains(suffix))
        return Table;
    if (isImageSuffix(suffix) || !QImageReader::imageFormat(path).isEmpty())
        return Image;
    const QByteArray json = startOfJson(path);
    return json.isEmpty() || isTableJson(json) ? Table : Session;
}

bool KvDeskFileKind::isKnown(const QString &path)
{
    if (!QFileInfo(path).isFile())
        return false;
    const bool isTable = of(path) == Table && !tableSuffixes().contains(QFileInfo(path).suffix().toLower());
    return !isTable || startsLikeText(path);
}

QStringList KvDeskFileKind::imagePatterns()
{
    QStringList suffixes;
    for (const QByteArray &format : QImageReader::supportedImageFormats())
        suffixes.append(QString::fromLatin1(format));
    return patternsOf(suffixes);
}

QStringList KvDeskFileKind::tablePatterns()
{
    return patternsOf(tableSuffixes() + QStringList(QStringLiteral("json")));
}
