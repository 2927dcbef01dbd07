// SPDX-License-Identifier: MIT
#pragma once

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QMap>
#include <QRegularExpression>
#include <QString>
#include <QStringList>

/** Reading of the repository's own files. Paths are relative to its root. */
namespace SourceTree {

/** Texts of files by path. */
using Files = QMap<QString, QString>;

/** All files below \a folders ("" is the root) whose names fit \a nameFilters; hidden ones and build folders
 * are not. */
inline Files read(const QString &root, const QStringList &folders, const QStringList &nameFilters)
{
    Files files;
    const QDir rootDir(root);
    for (const QString &folder : folders) {
        QDirIterator it(rootDir.filePath(folder), nameFilters, QDir::Files, QDirIterator::Subdirectories);
        while (it.hasNext()) {
            const QString path = rootDir.relativeFilePath(it.next());
            if (path.startsWith(QLatin1String("build")) || path.startsWith(QLatin1Char('.')) ||
                path.contains(QLatin1String("/.")))
                continue;
            QFile file(it.filePath());
            if (file.open(QIODevice::ReadOnly))
                files.insert(path, QString::fromUtf8(file.readAll()));
        }
    }
    return files;
}

/** A C++ text without its comments; the lines stay where they are. */
inline QString withoutComments(const QString &text)
{
    enum { Code, Line, Block, Text } state = Code;
    QString result;
    result.reserve(text.size());
    for (int i = 0; i < text.size(); ++i) {
        const QChar c = text.at(i);
        const QChar next = i + 1 < text.size() ? text.at(i + 1) : QChar();
        if (state == Code && c == QLatin1Char('/') &&
            (next == QLatin1Char('/') || next == QLatin1Char('*'))) {
            state = next == QLatin1Char('/') ? Line : Block;
            ++i;
        } else if (state == Block && c == QLatin1Char('*') && next == QLatin1Char('/')) {
            state = Code;
            result.append(QLatin1Char(' '));
            ++i;
        } else if (c == QLatin1Char('\n')) {
            state = state == Block ? Block : Code;
            result.append(c);
        } else if (state == Text && c == QLatin1Char('\\')) {
            result.append(c);
            result.append(next);
            ++i;
        } else if (state == Code || state == Text) {
            if (c == QLatin1Char('"'))
                state = state == Code ? Text : Code;
            result.append(c);
        }
    }
    return result;
}

inline QString fileName(const QString &path)
{
    return path.section(QLatin1Char('/'), -1);
}

inline QString folder(const QString &path)
{
    return path.section(QLatin1Char('/'), 0, -2);
}

} // namespace SourceTree
