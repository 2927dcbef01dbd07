// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/** Names in session files, shared by reader and writer. */
namespace ZtSessionFormat {

inline const QString formatName = QStringLiteral("statreport-session");
constexpr int version = 2;      ///< that is written
constexpr int firstVersion = 1; ///< that is read; gives square pixels by micrometresPerPixel alone

inline const QString format = QStringLiteral("format");
inline const QString versionKey = QStringLiteral("version");
inline const QString image = QStringLiteral("image");
inline const QString calibration = QStringLiteral("calibration");
inline const QString micrometresPerPixel = QStringLiteral("micrometresPerPixel");
inline const QString objects = QStringLiteral("objects");
inline const QString tables = QStringLiteral("tables");

inline const QString type = QStringLiteral("type");
inline const QString id = QStringLiteral("id");
inline const QString name = QStringLiteral("name");
inline const QString text = QStringLiteral("text");
inline const QString points = QStringLiteral("points");
inline const QString hidden = QStringLiteral("hidden");

inline const QString values = QStringLiteral("values");
inline const QString unit = QStringLiteral("unit");
inline const QString rows = QStringLiteral("rows");

// A row is [id, name or null, cells] or [id, name or null, cells, hidden values]. Its cells are a list with
// one entry per value, or, where most values are missing, an object with the values' positions as keys. An
// entry is null, a number's text, or [number's text, unit] where the unit is not that of the value.
enum RowEntry { RowId, RowName, RowCells, RowHidden, RowMaximum };

} // namespace ZtSessionFormat
