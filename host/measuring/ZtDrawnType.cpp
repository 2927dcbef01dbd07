// SPDX-License-Identifier: MIT
#include "measuring/ZtDrawnType.h"

#include "measuring/ZtGeometry.h"

#include <QCoreApplication>

#include <algorithm>
#include <cmath>

namespace {

const char translationContext[] = "ZtDrawnType";

// Every function below is called with at least the type's minimum of points.

double width(const QPolygonF &p)
{
    return std::abs(p.at(1).x() - p.at(0).x());
}

double height(const QPolygonF &p)
{
    return std::abs(p.at(1).y() - p.at(0).y());
}

double rectangleArea(const QPolygonF &p)
{
    return width(p) * height(p);
}

double arcAngle(const QPolygonF &p)
{
    return std::abs(ZtGeometry::arcThrough(p.at(0), p.at(1), p.at(2)).sweep);
}

double arcLength(const QPolygonF &p)
{
    return ZtGeometry::arcLength(p.at(0), p.at(1), p.at(2));
}

double parallelDistance(const QPolygonF &p)
{
    return ZtGeometry::distanceToLine(p.at(2), p.at(0), p.at(1));
}

double radius(const QPolygonF &p)
{
    return ZtGeometry::distance(p.at(0), p.at(1));
}

double diameter(const QPolygonF &p)
{
    return 2.0 * radius(p);
}

double circleArea(const QPolygonF &p)
{
    return std::acos(-1.0) * radius(p) * radius(p);
}

double pointCount(const QPolygonF &p)
{
    return p.size();
}

QPainterPath rectangleOutline(const QPolygonF &p)
{
    QPainterPath path;
    path.addRect(QRectF(p.at(0), p.at(1)).normalized());
    return path;
}

QPainterPath polylineOutline(const QPolygonF &p)
{
    QPainterPath path;
    path.addPolygon(p);
    return path;
}

QPainterPath polygonOutline(const QPolygonF &p)
{
    QPainterPath path = polylineOutline(p);
    path.closeSubpath();
    return path;
}

QPainterPath arcOutline(const QPolygonF &p)
{
    const ZtArc arc = ZtGeometry::arcThrough(p.at(0), p.at(1), p.at(2));
    if (arc.radius == 0.0)
        return polylineOutline(p);
    QPainterPath path(p.at(0));
    const QPointF corner(arc.radius, arc.radius);
    // QPainterPath counts its angles the other way round.
    path.arcTo(QRectF(arc.centre - corner, arc.centre + corner), -arc.startAngle, -arc.sweep);
    return path;
}

QPainterPath circleOutline(const QPolygonF &p)
{
    QPainterPath path;
    path.addEllipse(p.at(0), radius(p), radius(p));
    return path;
}

// Base line, parallel of the same length through the third point, and the perpendicular between them.
QPainterPath parallelOutline(const QPolygonF &p)
{
    const QPointF along = p.at(1) - p.at(0);
    const double square = QPointF::dotProduct(along, along);
    const double share = square > 0.0 ? QPointF::dotProduct(p.at(2) - p.at(0), along) / square : 0.0;
    const QPointF foot = p.at(0) + along * share;
    const QPointF shift = p.at(2) - foot;
    QPainterPath path;
    path.addPolygon(QVector<QPointF>{p.at(0), p.at(1)});
    path.addPolygon(QVector<QPointF>{p.at(0) + shift, p.at(1) + shift});
    path.addPolygon(QVector<QPointF>{foot, p.at(2)});
    return path;
}

std::vector<ZtDrawnType> makeTypes()
{
    constexpr auto length = ZtGsManipulator::Length;
    constexpr auto area = ZtGsManipulator::Area;
    constexpr int unlimited = ZtDrawnType::unlimitedPoints;
    return {
        {ZtDrawnType::Rectangle,
         "rectangle",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Rectangle"),
         2,
         2,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Width"), length, width},
          {QT_TRANSLATE_NOOP("ZtDrawnType", "Height"), length, height},
          {QT_TRANSLATE_NOOP("ZtDrawnType", "Area"), area, rectangleArea}},
         rectangleOutline},
        {ZtDrawnType::Line,
         "line",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Line"),
         2,
         2,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Length"), length, ZtGeometry::pathLength}},
         polylineOutline},
        {ZtDrawnType::Arc,
         "arc",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Arc"),
         3,
         3,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Angle"), ZtGsManipulator::Angle, arcAngle},
          {QT_TRANSLATE_NOOP("ZtDrawnType", "Arc length"), length, arcLength}},
         arcOutline},
        {ZtDrawnType::Polygon,
         "polygon",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Polygon"),
         3,
         unlimited,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Area"), area, ZtGeometry::area},
          {QT_TRANSLATE_NOOP("ZtDrawnType", "Perimeter"), length, ZtGeometry::perimeter}},
         polygonOutline},
        {ZtDrawnType::Polyline,
         "polyline",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Polyline"),
         2,
         unlimited,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Length"), length, ZtGeometry::pathLength}},
         polylineOutline},
        {ZtDrawnType::ParallelDistance,
         "parallelDistance",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Parallel distance"),
         3,
         3,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Distance"), length, parallelDistance}},
         parallelOutline},
        {ZtDrawnType::TextNote, "textNote", QT_TRANSLATE_NOOP("ZtDrawnType", "Text note"), 1, 1, {}, nullptr},
        {ZtDrawnType::ScaleBar,
         "scaleBar",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Scale bar"),
         2,
         2,
         {},
         polylineOutline},
        {ZtDrawnType::Counter,
         "counter",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Counter"),
         0,
         unlimited,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Count"), ZtGsManipulator::Count, pointCount},
          {QT_TRANSLATE_NOOP("ZtDrawnType", "Share"), ZtGsManipulator::Percentage, nullptr}},
         nullptr},
        {ZtDrawnType::Circle,
         "circle",
         QT_TRANSLATE_NOOP("ZtDrawnType", "Circle"),
         2,
         2,
         {{QT_TRANSLATE_NOOP("ZtDrawnType", "Diameter"), length, diameter},
          {QT_TRANSLATE_NOOP("ZtDrawnType", "Area"), area, circleArea}},
         circleOutline},
    };
}

template <typename Predicate>
const ZtDrawnType *findType(Predicate predicate)
{
    const std::vector<ZtDrawnType> &types = ZtDrawnType::all();
    const auto found = std::find_if(types.begin(), types.end(), predicate);
    return found == types.end() ? nullptr : &*found;
}

} // namespace

const std::vector<ZtDrawnType> &ZtDrawnType::all()
{
    static const std::vector<ZtDrawnType> types = makeTypes();
    return types;
}

const ZtDrawnType *ZtDrawnType::find(int id)
{
    return findType([id](const ZtDrawnType &type) { return type.id == id; });
}

const ZtDrawnType *ZtDrawnType::findKey(const QString &key)
{
    return findType([&key](const ZtDrawnType &type) { return key == QLatin1String(type.key); });
}

bool ZtDrawnType::isCoordinatePair(const QPointF &point)
{
    return std::abs(point.x()) <= largestCoordinate && std::abs(point.y()) <= largestCoordinate;
}

bool ZtDrawnType::acceptsPoints(const QPolygonF &points) const
{
    return acceptsPointCount(points.size()) && std::all_of(points.begin(), points.end(), isCoordinatePair);
}

QString ZtDrawnType::displayName() const
{
    return QCoreApplication::translate(translationContext, name);
}

QStringList ZtDrawnType::valueNames() const
{
    QStringList names;
    for (const ZtDrawnValue &value : values)
        names.append(QCoreApplication::translate(translationContext, value.name));
    return names;
}

int ZtDrawnType::valuePosition(const QString &englishName) const
{
    for (std::size_t i = 0; i < values.size(); ++i) {
        if (englishName == QLatin1String(values[i].name))
            return static_cast<int>(i);
    }
    return -1;
}
