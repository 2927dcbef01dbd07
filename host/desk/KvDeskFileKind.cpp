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
