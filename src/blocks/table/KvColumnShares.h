// SPDX-License-Identifier: MIT
#pragma once

#include <QVector>

/** How the columns of a table share its width. */
namespace KvColumnShares {

/** What the texts of the columns need. */
struct Needs
{
    QVector<int> widths; ///< pixels by column; columns that are missing at the end need nothing
    int yielding = 0;    ///< so many first columns are cut before any other is
};

/** What a yielding column keeps at least, in pixels. */
constexpr int LeastYielded = 48;

/**
 * Widths of \a columns columns that together are \a width pixels.
 *
 * They are equal as long as that is wide enough for every column; the last one takes what the division
 * leaves. A column that needs more gets it from those that need less. Where the width is too small for all
 * of them, the yielding columns share what the others leave, unless that is too little; then narrow columns
 * get what they need and the wide ones share the rest.
 */
QVector<int> widths(int width, int columns, const Needs &needs);

/** The columns' left edges from \a left on, and the right end of the last one; empty without columns. */
QVector<int> edges(int left, int width, int columns, const Needs &needs);

} // namespace KvColumnShares
