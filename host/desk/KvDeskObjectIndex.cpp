// SPDX-License-Identifier: MIT
#include "KvDeskObjectIndex.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr int smallestLevel = 4; ///< cells of 16 image pixels

QRectF grown(const QRectF &rect, double by)
{
    return rect.adjusted(-by, -by, by, by);
}

// Whether a rectangle reaches the border of another that contains it.
bool reachesBorder(const QRectF &inner, const QRectF &outer)
{
    return inner.left() <= outer.left() || inner.top() <= outer.top() || inner.right() >= outer.right() ||
           inner.bottom() >= outer.bottom();
}

} // namespace

bool KvDeskObjectIndex::touch(const QRectF &a, const QRectF &b)
{
    return a.left() <= b.right() && a.right() >= b.left() && a.top() <= b.bottom() && a.bottom() >= b.top();
}

QRectF KvDeskObjectIndex::united(const QRectF &a, const QRectF &b)
{
    // Bounds of points and level lines are empty for QRectF, and null, yet there is something.
    if (a == QRectF())
        return b;
    if (b == QRectF())
        return a;
    return QRectF(QPointF(qMin(a.left(), b.left()), qMin(a.top(), b.top())),
                  QPointF(qMax(a.right(), b.right()), qMax(a.bottom(), b.bottom())));
}

int KvDeskObjectIndex::levelOf(const QRectF &rect)
{
    const double size = qMax(rect.width(), rect.height());
    return size <= cellSize(smallestLevel) ? smallestLevel : static_cast<int>(std::ceil(std::log2(size)));
}

double KvDeskObjectIndex::cellSize(int level)
{
    return std::ldexp(1.0, level);
}

KvDeskObjectIndex::Cell KvDeskObjectIndex::cellOf(const QPointF &point, int level)
{
    const double size = cellSize(level);
    return {static_cast<int>(std::floor(point.x() / size)), static_cast<int>(std::floor(point.y() / size))};
}

void KvDeskObjectIndex::set(const KvDeskObjectId &object, const QRectF &rect)
{
    remove(object);
    m_rects.insert(object, rect);
    const int level = levelOf(rect);
    m_grids[level][cellOf(rect.center(), level)].append({object, rect});
    if (m_areBoundsKnown)
        m_bounds = united(m_bounds, rect);
}

void KvDeskObjectIndex::remove(const KvDeskObjectId &object)
{
    const auto found = m_rects.constFind(object);
    if (found == m_rects.constEnd())
        return;
    const QRectF rect = *found;
    m_rects.erase(found);
    take(object, rect);
    m_areBoundsKnown = m_areBoundsKnown && !reachesBorder(rect, m_bounds);
}

void KvDeskObjectIndex::take(const KvDeskObjectId &object, const QRectF &rect)
{
    const int level = levelOf(rect);
    const auto grid = m_grids.find(level);
    const auto cell = grid->find(cellOf(rect.center(), level));
    const int last = cell->size() - 1;
    const auto isIt = [&object](const Entry &entry) { return entry.object == object; };
    std::swap(*std::find_if(cell->begin(), cell->end(), isIt), (*cell)[last]);
    cell->removeLast();
    if (cell->isEmpty())
        grid->erase(cell);
    if (grid->isEmpty())
        m_grids.erase(grid);
}

void KvDeskObjectIndex::clear()
{
    *this = KvDeskObjectIndex();
}

QRectF KvDeskObjectIndex::bounds() const
{
    if (m_areBoundsKnown)
        return m_bounds;
    m_bounds = QRectF();
    for (const QRectF &rect : m_rects)
        m_bounds = united(m_bounds, rect);
    m_areBoundsKnown = true;
    return m_bounds;
}

bool KvDeskObjectIndex::visitCell(const QVector<Entry> &cell, const QRectF &area, const Visitor &visitor)
{
    return std::all_of(cell.begin(), cell.end(),
                       [&](const Entry &entry) { return !touch(entry.rect, area) || visitor(entry); });
}

bool KvDeskObjectIndex::visitGrid(const Grid &grid, int level, const QRectF &area, const Visitor &visitor)
{
    // The centre of what touches the area lies at most half a cell beside it.
    const double size = cellSize(level);
    const QRectF reach = grown(area, 0.5 * size);
    const double cells = (reach.width() / size + 2.0) * (reach.height() / size + 2.0);
    if (cells > grid.size())
        return std::all_of(grid.begin(), grid.end(),
                           [&](const QVector<Entry> &cell) { return visitCell(cell, area, visitor); });
    const Cell first = cellOf(reach.topLeft(), level);
    const Cell last = cellOf(reach.bottomRight(), level);
    for (int row = first.row; row <= last.row; ++row) {
        for (int column = first.column; column <= last.column; ++column) {
            if (!visitCell(grid.value({column, row}), area, visitor))
                return false;
        }
    }
    return true;
}

void KvDeskObjectIndex::visit(const QRectF &area, const Visitor &visitor) const
{
    for (auto grid = m_grids.constBegin(); grid != m_grids.constEnd(); ++grid) {
        if (!visitGrid(*grid, grid.key(), area, visitor))
            return;
    }
}

QVector<KvDeskObjectId> KvDeskObjectIndex::objectsIn(const QRectF &area, int limit) const
{
    QVector<KvDeskObjectId> found;
    visit(area, [&](const Entry &entry) {
        found.append(entry.object);
        return found.size() < limit;
    });
    std::sort(found.begin(), found.end());
    return found;
}
