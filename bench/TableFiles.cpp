// SPDX-License-Identifier: MIT
#include "TableFiles.h"

#include <QFile>
#include <QStringList>
#include <QTemporaryDir>
#include <QTextStream>
#include <QVector>

#include <string_view>
#include <vector>

namespace {

QByteArray number(int row, int factor)
{
    return QByteArray::number(row * factor % 9973) + '.' + QByteArray::number(100 + row % 900);
}

} // namespace

QByteArray TableFiles::wideTable(int rows)
{
    QByteArray table("name,type,Length [mm],Width [mm],Area [mm2]\n");
    for (int i = 0; i < rows; ++i)
        table += "Grain " + QByteArray::number(i) + ",Grain," + number(i, 7) + ',' + number(i, 13) + ',' +
                 number(i, 29) + '\n';
    return table;
}

QByteArray TableFiles::tidyTable(int rows)
{
    static const char *const names[] = {"Length,mm", "Width,mm", "Area,mm2"};
    QByteArray table("object_type,object_index,value_name,unit,value\n");
    for (int i = 0; i < rows; ++i)
        table += "Grain," + QByteArray::number(i / 3 + 1) + ',' + names[i % 3] + ',' + number(i, 7) + '\n';
    return table;
}

QString TableFiles::write(const QString &name, const QByteArray &bytes)
{
    static const QTemporaryDir dir;
    const QString path = dir.filePath(name);
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qFatal("The file cannot be written");
    return path;
}

std::size_t TableFiles::readAndSplit(const QString &path, char separator)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        qFatal("The file cannot be read");
    const QByteArray bytes = file.readAll();
    const std::string_view text(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    const char ends[] = {separator, '\n'};
    std::size_t count = 0;
    std::vector<std::string_view> row;
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t end = std::min(text.find_first_of(std::string_view(ends, 2), at), text.size());
        row.push_back(text.substr(at, end - at));
        if (end == text.size() || text[end] == '\n') {
            count += row.size();
            row.clear();
        }
        at = end + 1;
    }
    return count;
}

std::size_t TableFiles::readAndSplitTexts(const QString &path, QChar separator)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        qFatal("The file cannot be read");
    QTextStream lines(&file);
    lines.setCodec("UTF-8");
    QVector<QStringList> rows;
    std::size_t count = 0;
    for (QString line; lines.readLineInto(&line);) {
        rows.append(line.split(separator));
        count += static_cast<std::size_t>(rows.last().size());
    }
    return count;
}
