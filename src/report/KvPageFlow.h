// SPDX-License-Identifier: MIT
#pragma once

#include <QPoint>
#include <QRect>
#include <QVector>

#include <functional>

/** Where a piece stands: page index and top-left corner in the coordinates of the pages' content rectangles.
 */
struct KvPlacedPiece
{
    int page = 0;
    QPoint topLeft;

    bool operator==(const KvPlacedPiece &other) const
    {
        return page == other.page && topLeft == other.topLeft;
    }
};

/**
 * The one rule by which pieces flow onto pages, used by the view, its size update and the printer.
 *
 * A piece stands below the one before, one pixel apart. When it would not end above the last pixel row of the
 * content rectangle it moves, whole, to the top of a fresh page, also when it stood alone: a piece higher
 * than a page leaves the page it was tried on without it and overflows the next one. Content rectangles are
 * asked for page by page, in order, as pages are reached; the first one at construction.
 */
class KvPageFlow
{
public:
    /** Content rectangle of a page; makes the page if there is none. */
    using PageProvider = std::function<QRect(int page)>;

    explicit KvPageFlow(PageProvider pages);

    /** Places the next piece, \a height pixels high. */
    KvPlacedPiece place(int height);
    /** Places a mark that moves what follows down by \a height and never moves to another page. */
    KvPlacedPiece placeMark(int height);

    /** Number of pages reached; 1 at least. */
    int pageCount() const { return m_page + 1; }

    /** Places a whole list on pages of the same content height. */
    static QVector<KvPlacedPiece> place(const QVector<int> &heights, const PageProvider &pages);

private:
    void startPage(int page);

    PageProvider m_pages;
    int m_page = 0;
    QRect m_content;
    QPoint m_point;
};
