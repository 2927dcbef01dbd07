// SPDX-License-Identifier: MIT
#include "blocks/table/KvColumnShares.h"

#include <algorithm>
#include <numeric>

namespace {

QVector<int> equalWidths(int width, int columns)
{
    QVector<int> result(columns, width / columns);
    result.last() = width - (columns - 1) * (width / columns);
    return result;
}

qint64 sum(const QVector<int> &numbers)
{
    return std::accumulate(numbers.cbegin(), numbers.cend(), qint64(0));
}

// The columns' indices, the neediest or the most modest first.
QVector<int> columnsByNeed(const QVector<int> &needs, bool neediestFirst)
{
    QVector<int> order(needs.size());
    std::iota(order.begin(), order.end(), 0);
    std::stable_sort(order.begin(), order.end(), [&needs, neediestFirst](int a, int b) {
        return neediestFirst ? needs.at(a) > needs.at(b) : needs.at(a) < needs.at(b);
    });
    return order;
}

// What is left when a column's turn comes is shared equally by it and those after it: more than that for the
// neediest while there is enough, no more than that once there is not.
QVector<int> widthsByNeed(int width, const QVector<int> &needs)
{
    const bool isEnough = sum(needs) <= width;
    QVector<int> result(needs.size());
    int rest = width;
    int left = needs.size();
    for (const int column : columnsByNeed(needs, isEnough)) {
        const int share = rest / left;
        const int need = needs.at(column);
        result[column] = left == 1 ? rest : isEnough ? std::max(need, share) : std::min(need, share);
        rest -= result.at(column);
        --left;
    }
    return result;
}

} // namespace

QVector<int> KvColumnShares::widths(int width, int columns, const Needs &needs)
{
    if (columns <= 0)
        return {};
    const int room = std::max(width, 0);
    QVector<int> wanted = needs.widths;
    wanted.resize(columns);
    if (*std::max_element(wanted.cbegin(), wanted.cend()) <= room / columns)
        return equalWidths(room, columns);

    const int yielding = std::clamp(needs.yielding, 0, columns);
    const qint64 others = sum(wanted.mid(yielding));
    const bool isTooNarrow = sum(wanted) > room;
    if (!isTooNarrow || yielding == 0 || room - others < qint64(yielding) * LeastYielded)
        return widthsByNeed(room, wanted);
    return widthsByNeed(room - static_cast<int>(others), wanted.mid(0, yielding)) + wanted.mid(yielding);
}

QVector<int> KvColumnShares::edges(int left, int width, int columns, const Needs &needs)
{
    if (columns <= 0)
        return {};
    QVector<int> result{left};
    result.reserve(columns + 1);
    for (const int columnWidth : widths(width, columns, needs))
        result.append(result.last() + columnWidth);
    return result;
}
