// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QString>

/** Tables and sessions of any size to read and write, and the least that reading such a file can take. */
namespace TableFiles {

/** One object per row, with a name and three values. */
QByteArray wideTable(int rows);
/** One value per row, three of each object. */
QByteArray tidyTable(int rows);

/** Writes a file of a folder that goes with the program; returns its path. */
QString write(const QString &name, const QByteArray &bytes);

/** Reads a file and cuts it into its lines and fields, as pieces of its bytes; returns how many fields. */
std::size_t readAndSplit(const QString &path, char separator);

/** The same with a text of its own for each field, as a program would that looks at the fields later. */
std::size_t readAndSplitTexts(const QString &path, QChar separator);

} // namespace TableFiles
