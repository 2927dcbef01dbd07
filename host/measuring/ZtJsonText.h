// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QByteArray>
#include <QString>

#include <string_view>

/** Writes the parts of JSON straight into the bytes of a file: for files with so many parts that objects for
 * all of them would take most of the time. */
namespace ZtJsonText {

/** The shortest digits that read back as the same number, which has to be finite. */
ZT_MEASURING_EXPORT QByteArray number(double value);

/** A quoted text. */
ZT_MEASURING_EXPORT void append(QByteArray *json, const QString &text);
/** A quoted text of printable ASCII characters without quotes and backslashes, such as a number has. */
ZT_MEASURING_EXPORT void appendPlain(QByteArray *json, std::string_view text);

} // namespace ZtJsonText
