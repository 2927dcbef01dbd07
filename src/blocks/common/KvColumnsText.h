// SPDX-License-Identifier: MIT
#pragma once

#include <QSet>
#include <QStringList>
#include <QVector>

/** The columns that the user chose for a table; in files a text of names joined by semicolons, in no
 * particular order. */
namespace KvColumnsText {

QString join(const QSet<QString> &columns);
/** Empty parts are dropped; an empty text gives no columns. */
QSet<QString> split(const QString &text);
/** Indexes into \a names of those that are in \a columns, in the order of \a names. */
QVector<int> indexes(const QStringList &names, const QSet<QString> &columns);

} // namespace KvColumnsText
