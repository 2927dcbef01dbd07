// SPDX-License-Identifier: MIT
#pragma once

#include <QSet>
#include <QString>

/** The "columns" text of table blocks in files: names joined by semicolons, in no particular order. */
namespace KvColumnsText {

QString join(const QSet<QString> &columns);
/** Empty parts are dropped; an empty text gives no columns. */
QSet<QString> split(const QString &text);

} // namespace KvColumnsText
