// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QRectF>
#include <QVector>

#include <functional>
#include <limits>

/**
 * Finds objects by where they lie, without looking at all of them.
 *
 * Every object is in one cell of a grid whose cells are at least as large as the object; there is one such
 * grid for every power of two. So a search looks into few cells of each grid, whatever sizes objects have.
 */
class KvDeskObjectIndex
{
public:
    /** An object and the rectangle in which it lies. */
    struct Entry
    {
        KvDeskObjectId object;
        QRectF rect;
    };

    /** Adds an object or moves it. The rectangle may be empty, as that of a point or a level line is. */
    void set(const KvDeskObjectId &object, const QRectF &rect);
    void remove(const KvDeskObjectId &object);
    void clear();

    int size() const { return m_rects.size(); }
    bool contains(const KvDeskObjectId &object) const { return m_rects.contains(object); }
    QRectF rect(const KvDeskObjectId &object) const { return m_rects.value(object); }
    /** The smallest rectangle around all objects; a null one without any. */
    QRectF bounds() const;

    /** The objects whose rectangles touch \a area, in the order in which they are drawn. Once \a limit of
     * them are found, the search may end. */
    QVector<KvDeskObjectId> objectsIn(const QRectF &area, int limit = std::numeric_limits<int>::max()) const;

    /** Shows the same to \a visitor, in any order, which is quicker where there are many; until it returns
     * false. */
    void visit(const QRectF &area, const std::function<bool(const Entry &)> &visitor) const;

    /** Whether two rectangles have a point in common; borders belong to them. */
    static bool touch(const QRectF &a, const QRectF &b);
    /** The smallest rectangle around both, of which either may be empty, or null for nothing at all. */
    static QRectF united(const QRectF &a, const QRectF &b);

private:
    struct Cell
    {
        int column;
        int row;
        bool operator==(const Cell &other) const { return column == other.column && row == other.row; }
        friend uint qHash(const Cell &cell, uint seed = 0)
        {
            return ::qHash((static_cast<quint64>(static_cast<quint32>(cell.column)) << 32) |
                               static_cast<quint32>(cell.row),
                           seed);
        }
    };
    using Grid = QHash<Cell, QVector<Entry>>;

    static int levelOf(const QRectF &rect);
    static double cellSize(int level);
    static Cell cellOf(const QPointF &point, int level);
    void take(const KvDeskObjectId &object, const QRectF &rect);
    using Visitor = std::function<bool(const Entry &)>;

    static bool visitCell(const QVector<Entry> &cell, const QRectF &area, const Visitor &visitor);
    static bool visitGrid(const Grid &grid, int level, const QRectF &area, const Visitor &visitor);

    QHash<KvDeskObjectId, QRectF> m_rects;
    QHash<int, Grid> m_grids; ///< by level
    mutable QRectF m_bounds;
    mutable bool m_areBoundsKnown = true;
};
