// SPDX-License-Identifier: MIT
#include "measuring/ZtLabelLayout.h"

#include <QHash>
#include <QLineF>

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr double offset = 6.0;     ///< between a label and what it belongs to
constexpr double rowHeight = 32.0; ///< boxes are looked for in rows of the page
constexpr double handleSide = 3.0;
constexpr double smallObject = 120.0;

/// Boxes on the page, found by the rows of the page that they touch.
class Boxes
{
public:
    int countTouching(const QRectF &box) const
    {
        int count = 0;
        for (int row = first(box); row <= last(box); ++row) {
            const auto inRow = m_rows.constFind(row);
            if (inRow != m_rows.constEnd())
                count +=
                    static_cast<int>(std::count_if(inRow->begin(), inRow->end(), [&box](const QRectF &other) {
                        return other.intersects(box);
                    }));
        }
        return count;
    }

    void add(const QRectF &box)
    {
        for (int row = first(box); row <= last(box); ++row)
            m_rows[row].append(box);
    }

private:
    static int first(const QRectF &box) { return static_cast<int>(std::floor(box.top() / rowHeight)); }
    static int last(const QRectF &box) { return static_cast<int>(std::floor(box.bottom() / rowHeight)); }

    QHash<int, QVector<QRectF>> m_rows;
};

// What is better not covered: points of objects, and objects that are small.
Boxes busyPlaces(const QVector<ZtLabelRequest> &requests, const QRectF &page)
{
    Boxes busy;
    for (const ZtLabelRequest &request : requests) {
        for (const QPointF &handle : request.handles) {
            if (page.contains(handle))
                busy.add(QRectF(handle, handle).adjusted(-handleSide, -handleSide, handleSide, handleSide));
        }
        const QRectF &object = request.object;
        if (object.width() < smallObject && object.height() < smallObject && page.contains(object.center()))
            busy.add(object);
    }
    return busy;
}

// Beside the point where the label belongs, then beside the object as a whole.
QVector<QPointF> candidates(const ZtLabelRequest &request)
{
    const double width = request.size.width();
    const double height = request.size.height();
    const QRectF &object = request.object;
    const double centre = object.center().x() - width / 2.0;
    const double middle = object.center().y() - height / 2.0;
    const QVector<QPointF> around{QPointF(centre, object.top() - offset - height),
                                  QPointF(centre, object.bottom() + offset),
                                  QPointF(object.right() + offset, middle),
                                  QPointF(object.left() - offset - width, middle), QPointF(centre, middle)};
    if (request.handles.isEmpty())
        return around;
    const QPointF anchor = request.handles.first();
    const double left = anchor.x() - offset - width;
    const double right = anchor.x() + offset;
    const double above = anchor.y() - offset - height;
    const double below = anchor.y() + offset;
    const QVector<QPointF> beside{QPointF(right, above), QPointF(left, above), QPointF(right, below),
                                  QPointF(left, below)};
    return request.isAround ? around + beside : beside + around;
}

bool coversHandle(const QRectF &box, const QPolygonF &handles)
{
    constexpr double room = ZtLabelLayout::handleRoom;
    const QRectF wide = box.adjusted(-room, -room, room, room);
    return std::any_of(handles.begin(), handles.end(),
                       [&wide](const QPointF &handle) { return wide.contains(handle); });
}

bool crosses(const QLineF &line, const QRectF &box)
{
    if (box.contains(line.p1()) || box.contains(line.p2()))
        return true;
    return line.intersects(QLineF(box.topLeft(), box.bottomRight()), nullptr) ==
               QLineF::BoundedIntersection ||
           line.intersects(QLineF(box.bottomLeft(), box.topRight()), nullptr) == QLineF::BoundedIntersection;
}

bool coversOutline(const QRectF &box, const QPolygonF &outline)
{
    for (int i = 1; i < outline.size(); ++i) {
        if (crosses(QLineF(outline.at(i - 1), outline.at(i)), box))
            return true;
    }
    return false;
}

// Bounds of points and of level lines are empty, yet there is something to see.
bool isSeen(const QRectF &object, const QRectF &page)
{
    return object.left() <= page.right() && object.right() >= page.left() && object.top() <= page.bottom() &&
           object.bottom() >= page.top();
}

// The first of the places that cover least.
QRectF findPlace(const ZtLabelRequest &request, const QRectF &page, const Boxes &taken, const Boxes &busy)
{
    QRectF best;
    int leastCovered = std::numeric_limits<int>::max();
    for (const QPointF &corner : candidates(request)) {
        const QRectF box = ZtLabelLayout::movedInto(QRectF(corner, request.size), page);
        if (coversHandle(box, request.handles) || taken.countTouching(box) > 0)
            continue;
        const int covered = busy.countTouching(box) + (coversOutline(box, request.outline) ? 1 : 0);
        if (covered == 0)
            return box;
        if (covered < leastCovered) {
            leastCovered = covered;
            best = box;
        }
    }
    return best;
}

} // namespace

QVector<QRectF> ZtLabelLayout::place(const QVector<ZtLabelRequest> &requests, const QRectF &page)
{
    const Boxes busy = busyPlaces(requests, page);
    Boxes taken;
    QVector<QRectF> boxes;
    boxes.reserve(requests.size());
    for (const ZtLabelRequest &request : requests) {
        const bool isWanted = !request.size.isEmpty() && isSeen(request.object, page);
        const QRectF box = isWanted ? findPlace(request, page, taken, busy) : QRectF();
        if (!box.isNull())
            taken.add(box);
        boxes.append(box);
    }
    return boxes;
}

QRectF ZtLabelLayout::movedInto(QRectF box, const QRectF &page)
{
    box.moveRight(qMin(box.right(), page.right()));
    box.moveBottom(qMin(box.bottom(), page.bottom()));
    box.moveLeft(qMax(box.left(), page.left()));
    box.moveTop(qMax(box.top(), page.top()));
    return box;
}
