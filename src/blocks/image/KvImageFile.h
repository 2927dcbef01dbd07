// SPDX-License-Identifier: MIT
#pragma once

#include <QPixmap>
#include <QString>

/** Reads pictures for reports. What cannot be read is null and reported to the status log. */
namespace KvImageFile {

/** The picture in a file; only in one proper, as reading from a device may never end. No path, no picture. */
QPixmap load(const QString &path);
/** The picture in \a bytes, which once came from \a path; no bytes, no picture. */
QPixmap decode(const QByteArray &bytes, const QString &path);

} // namespace KvImageFile
