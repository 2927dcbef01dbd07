// SPDX-License-Identifier: MIT
#include "KvDeskFileKind.h"

#include <QFile>
#include <QFileInfo>
#include <QImageReader>

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

bool startsLikeJson(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) && file.peek(256).trimmed().startsWith('{');
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
        return Session;
    if (tableSuffixes().contains(suffix))
        return Table;
    if (isImageSuffix(suffix) || !QImageReader::imageFormat(path).isEmpty())
        return Image;
    return startsLikeJson(path) ? Session : Table;
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
    return patternsOf(tableSuffixes());
}
