// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/**
 * Keeps rich text from files from hanging the layout.
 *
 * The time for nested tables doubles with every level, and that for one unbroken word grows with the square
 * of its length. Texts that people write come near neither.
 */
namespace KvRichTextGuard {

/** Tables nested deeper than this lose their table, and words longer than this get places to break. */
constexpr int DeepestTable = 8;
constexpr int LongestWord = 20000;

/** \a html as it can be laid out; nearly always \a html itself. All of its text is kept. */
QString tamed(const QString &html);

} // namespace KvRichTextGuard
