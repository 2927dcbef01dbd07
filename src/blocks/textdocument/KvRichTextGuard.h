// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/**
 * Keeps rich text from files from hanging the layout.
 *
 * The time for nested tables doubles with every level, and that for one unbroken word grows with the square
 * of its length, as it does with the depth of other elements. A text of more than eight million pixels is
 * never done, and one number in a damaged file makes such. Texts that people write come near none of this.
 */
namespace KvRichTextGuard {

/** Tables nested deeper than this lose their table, and words longer than this get places to break. */
constexpr int DeepestTable = 8;
constexpr int LongestWord = 20000;
/** Other elements nested deeper than this lose their format. */
constexpr int DeepestElement = 500;
/** Stands for the numbers of more than five digits in tags: wider and higher than any page. */
constexpr int LargestNumber = 32767;

/** \a html as it can be laid out; nearly always \a html itself. All of its text is kept. */
QString tamed(const QString &html);

/** The same for a text without markup, in which only words can be too long. */
QString tamedPlain(const QString &text);

} // namespace KvRichTextGuard
