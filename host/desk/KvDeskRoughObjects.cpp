// SPDX-License-Identifier: MIT
#include "KvDeskRoughObjects.h"

#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"

#include <QPainter>
#include <QPainterPath>

#include <array>
#include <cmath>

namespace {

// Lengths in pixels of the view.
constexpr double speckSize = 2.0; ///< what is smaller is a speck
constexpr double markerArm = 4.0;
constexpr double largestPolygon = 400.0; ///< larger circles are drawn as they are in full
constexpr double farAway = 30000.0;      ///< numbers beyond it are no pixels any more
constexpr int mostCorners = 32;

const std::array<QPointF, mostCorners> &circle()
{
    static const std::array<QPointF, mostCorners> corners = [] {
        std::array<QPointF, mostCorners> result;
        for (int i = 0; i < mostCorners; ++i) {
            const double angle = 2.0 * std::acos(-1.0) * i / mostCorners;
            result[static_cast<std::size_t>(i)] = QPointF(std::cos(angle), std::sin(angle));
        }
        return result;
    }();
    return corners;
}

// By which step corners are taken, so that lines are at most a pixel beside the circle.
int cornerStep(double size)
{
    return size < 26.0 ? 4 : size < 104.0 ? 2 : 1;
}

const ZtDrawnObjectData *dataOf(const KvDeskObjectId &object)
{
    return dynamic_cast<const ZtDrawnObjectData *>(
        ZtKernelData::getInstance()->object(object.type, object.id));
}

} // namespace

void KvDeskRoughObjects::restart(const QTransform &toView)
{
    m_toView = toView;
    for (Lines &lines : m_lines) {
        lines.level.resize(0);
        lines.steep.resize(0);
        lines.distant.resize(0);
    }
}

// There is no turning.
QRectF KvDeskRoughObjects::onView(const QRectF &rect) const
{
    return QRectF(rect.x() * m_toView.m11() + m_toView.dx(), rect.y() * m_toView.m22() + m_toView.dy(),
                  rect.width() * m_toView.m11(), rect.height() * m_toView.m22());
}

QPointF KvDeskRoughObjects::onView(const QPointF &point) const
{
    return QPointF(point.x() * m_toView.m11() + m_toView.dx(), point.y() * m_toView.m22() + m_toView.dy());
}

void KvDeskRoughObjects::add(const KvDeskObjectId &object, const QRectF &rect)
{
    const QRectF place = onView(rect);
    const double size = qMax(place.width(), place.height());
    const bool isCounter = object.type == ZtDrawnType::Counter;
    m_color = isCounter ? static_cast<std::size_t>(ZtDrawnObjectPainter::counterColorIndex(object.id)) : 0;
    if (m_color >= m_lines.size())
        m_lines.resize(m_color + 1);
    if (object.type == ZtDrawnType::TextNote)
        return; // its label is all there is to see
    if (size < speckSize && !isCounter)
        addSpeck(place.center());
    else if (object.type == ZtDrawnType::Rectangle)
        addRectangle(place);
    else if (object.type == ZtDrawnType::Circle && size < largestPolygon)
        addEllipse(place);
    else if (const ZtDrawnObjectData *const data = dataOf(object))
        addOutline(*ZtDrawnType::find(object.type), data->points());
}

void KvDeskRoughObjects::addOutline(const ZtDrawnType &type, const QPolygonF &points)
{
    if (type.id == ZtDrawnType::Line || type.id == ZtDrawnType::ScaleBar)
        addLine(onView(points.first()), onView(points.last()));
    else if (type.outline)
        addPath(ZtDrawnManipulator::outlineOf(type, points));
    else
        addMarkers(points);
}

void KvDeskRoughObjects::addLine(const QPointF &from, const QPointF &to)
{
    const double furthest =
        qMax(qMax(std::abs(from.x()), std::abs(from.y())), qMax(std::abs(to.x()), std::abs(to.y())));
    Lines &lines = m_lines[m_color];
    if (furthest > farAway)
        lines.distant.append(QLineF(from, to));
    else if (std::abs(to.y() - from.y()) > std::abs(to.x() - from.x()))
        lines.steep.append(QLine(from.toPoint(), to.toPoint()));
    else
        lines.level.append(QLine(from.toPoint(), to.toPoint()));
}

void KvDeskRoughObjects::addSpeck(const QPointF &place)
{
    addLine(place, place + QPointF(1.0, 0.0));
}

void KvDeskRoughObjects::addRectangle(const QRectF &place)
{
    addLine(place.topLeft(), place.topRight());
    addLine(place.topRight(), place.bottomRight());
    addLine(place.bottomRight(), place.bottomLeft());
    addLine(place.bottomLeft(), place.topLeft());
}

void KvDeskRoughObjects::addEllipse(const QRectF &place)
{
    const QPointF centre = place.center();
    const double a = place.width() / 2.0;
    const double b = place.height() / 2.0;
    const int step = cornerStep(2.0 * qMax(a, b));
    QPointF before = centre + QPointF(a, 0.0);
    for (int i = step; i <= mostCorners; i += step) {
        const QPointF &corner = circle()[static_cast<std::size_t>(i % mostCorners)];
        const QPointF next = centre + QPointF(a * corner.x(), b * corner.y());
        addLine(before, next);
        before = next;
    }
}

void KvDeskRoughObjects::addPath(const QPainterPath &path)
{
    for (const QPolygonF &polygon : path.toSubpathPolygons(m_toView)) {
        for (int i = 1; i < polygon.size(); ++i)
            addLine(polygon.at(i - 1), polygon.at(i));
    }
}

void KvDeskRoughObjects::addMarkers(const QPolygonF &points)
{
    for (const QPointF &point : points) {
        const QPointF place = onView(point);
        addLine(place - QPointF(markerArm, 0.0), place + QPointF(markerArm, 0.0));
        addLine(place - QPointF(0.0, markerArm), place + QPointF(0.0, markerArm));
    }
}

void KvDeskRoughObjects::draw(QPainter *painter) const
{
    QColor dark = ZtDrawnObjectPainter::haloColor();
    dark.setAlpha(255); // mixing colours takes longer
    painter->save();
    drawHalos(painter, dark);
    for (std::size_t i = 0; i < m_lines.size(); ++i) {
        painter->setPen(QPen(ZtDrawnObjectPainter::counterColors().at(static_cast<int>(i)), 0.0));
        drawLines(painter, m_lines[i]);
    }
    painter->restore();
}

void KvDeskRoughObjects::draw(QPainter *painter, const QColor &bright, const QColor &dark) const
{
    painter->save();
    drawHalos(painter, dark);
    painter->setPen(QPen(bright, 0.0));
    for (const Lines &lines : m_lines)
        drawLines(painter, lines);
    painter->restore();
}

void KvDeskRoughObjects::drawHalos(QPainter *painter, const QColor &dark) const
{
    painter->setRenderHint(QPainter::Antialiasing, false);
    // Cosmetic pens of one pixel: no other lines are drawn without being turned into areas first.
    painter->setPen(QPen(dark, 0.0));
    for (const Lines &lines : m_lines)
        drawHalo(painter, lines);
    painter->setWorldTransform(QTransform());
}

// Dark lines lie below level ones and at the right of steep ones, where the bright ones do not hide them.
void KvDeskRoughObjects::drawHalo(QPainter *painter, const Lines &lines)
{
    painter->setWorldTransform(QTransform::fromTranslate(0.0, 1.0));
    painter->drawLines(lines.level);
    painter->drawLines(lines.distant);
    painter->setWorldTransform(QTransform::fromTranslate(1.0, 0.0));
    painter->drawLines(lines.steep);
    painter->drawLines(lines.distant);
}

void KvDeskRoughObjects::drawLines(QPainter *painter, const Lines &lines)
{
    painter->drawLines(lines.level);
    painter->drawLines(lines.steep);
    painter->drawLines(lines.distant);
}

QVector<QLineF> KvDeskRoughObjects::lines() const
{
    QVector<QLineF> result;
    for (const Lines &lines : m_lines) {
        result += lines.distant;
        for (const QLine &line : lines.level + lines.steep)
            result.append(QLineF(line));
    }
    return result;
}
