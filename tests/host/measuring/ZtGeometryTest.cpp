// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/Polygon.h"
#include "measuring/ZtGeometry.h"

#include <cmath>

Q_DECLARE_METATYPE(QPolygonF)

namespace {

const double pi = std::acos(-1.0);

QPolygonF square(const QPointF &corner, double side)
{
    return polygon(
        {corner, corner + QPointF(side, 0), corner + QPointF(side, side), corner + QPointF(0, side)});
}

bool isNear(double actual, double expected, double tolerance = 1e-9)
{
    const bool result = std::abs(actual - expected) <= tolerance * qMax(1.0, std::abs(expected));
    if (!result)
        qInfo("got %.17g, not %.17g", actual, expected);
    return result;
}

} // namespace

class ZtGeometryTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void measuresPaths_data();
    void measuresPaths();
    void measuresAreas_data();
    void measuresAreas();
    void keepsDigitsFarFromTheOrigin();
    void measuresTheDistanceFromALine_data();
    void measuresTheDistanceFromALine();
    void findsTheArc_data();
    void findsTheArc();
    void takesPointsOnALineAsOne_data();
    void takesPointsOnALineAsOne();
    void measuresArcsThatAreNearlyStraight();
};

void ZtGeometryTest::measuresPaths_data()
{
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<double>("length");
    QTest::addColumn<double>("perimeter");
    QTest::newRow("no point") << QPolygonF() << 0.0 << 0.0;
    QTest::newRow("one point") << polygon({{5, 5}}) << 0.0 << 0.0;
    QTest::newRow("line") << polygon({{0, 0}, {3, 4}}) << 5.0 << 10.0;
    QTest::newRow("way and back") << polygon({{0, 0}, {3, 4}, {0, 0}}) << 10.0 << 10.0;
    QTest::newRow("same point twice") << polygon({{1, 1}, {1, 1}}) << 0.0 << 0.0;
    QTest::newRow("square") << square({-1, -1}, 2) << 6.0 << 8.0;
    QTest::newRow("right triangle") << polygon({{0, 0}, {3, 0}, {3, 4}}) << 7.0 << 12.0;
}

void ZtGeometryTest::measuresPaths()
{
    QFETCH(QPolygonF, points);
    QTEST(ZtGeometry::pathLength(points), "length");
    QTEST(ZtGeometry::perimeter(points), "perimeter");
}

void ZtGeometryTest::measuresAreas_data()
{
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<double>("area");
    QTest::newRow("no point") << QPolygonF() << 0.0;
    QTest::newRow("two points") << polygon({{0, 0}, {3, 4}}) << 0.0;
    QTest::newRow("on one line") << polygon({{0, 0}, {1, 1}, {5, 5}, {2, 2}}) << 0.0;
    QTest::newRow("right triangle") << polygon({{0, 0}, {3, 0}, {3, 4}}) << 6.0;
    QTest::newRow("other direction") << polygon({{3, 4}, {3, 0}, {0, 0}}) << 6.0;
    QTest::newRow("square") << square({10, -7}, 2.5) << 6.25;
    QTest::newRow("with a notch") << polygon({{0, 0}, {4, 0}, {4, 4}, {2, 2}, {0, 4}}) << 12.0;
    QTest::newRow("bow tie") << polygon({{0, 0}, {2, 2}, {2, 0}, {0, 2}}) << 0.0;
}

void ZtGeometryTest::measuresAreas()
{
    QFETCH(QPolygonF, points);
    QTEST(ZtGeometry::area(points), "area");
}

void ZtGeometryTest::keepsDigitsFarFromTheOrigin()
{
    QCOMPARE(ZtGeometry::area(square({1e8, 1e8}, 0.5)), 0.25);
}

void ZtGeometryTest::measuresTheDistanceFromALine_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::addColumn<QPointF>("a");
    QTest::addColumn<QPointF>("b");
    QTest::addColumn<double>("distance");
    QTest::newRow("above") << QPointF(5, -3) << QPointF(0, 0) << QPointF(10, 0) << 3.0;
    QTest::newRow("below") << QPointF(5, 3) << QPointF(0, 0) << QPointF(10, 0) << 3.0;
    QTest::newRow("beyond its end") << QPointF(50, 3) << QPointF(0, 0) << QPointF(10, 0) << 3.0;
    QTest::newRow("on it") << QPointF(7, 7) << QPointF(0, 0) << QPointF(10, 10) << 0.0;
    QTest::newRow("slanting") << QPointF(0, 5) << QPointF(0, 0) << QPointF(4, 3) << 4.0;
    QTest::newRow("line of one point") << QPointF(3, 4) << QPointF(0, 0) << QPointF(0, 0) << 5.0;
}

void ZtGeometryTest::measuresTheDistanceFromALine()
{
    QFETCH(QPointF, point);
    QFETCH(QPointF, a);
    QFETCH(QPointF, b);
    QTEST(ZtGeometry::distanceToLine(point, a, b), "distance");
}

void ZtGeometryTest::findsTheArc_data()
{
    QTest::addColumn<QPointF>("start");
    QTest::addColumn<QPointF>("middle");
    QTest::addColumn<QPointF>("end");
    QTest::addColumn<QPointF>("centre");
    QTest::addColumn<double>("radius");
    QTest::addColumn<double>("startAngle");
    QTest::addColumn<double>("sweep");
    const double half = std::sqrt(0.5);
    QTest::newRow("quarter, clockwise")
        << QPointF(1, 0) << QPointF(half, half) << QPointF(0, 1) << QPointF(0, 0) << 1.0 << 0.0 << 90.0;
    QTest::newRow("quarter, counterclockwise")
        << QPointF(0, 1) << QPointF(half, half) << QPointF(1, 0) << QPointF(0, 0) << 1.0 << 90.0 << -90.0;
    QTest::newRow("half") << QPointF(7, 5) << QPointF(5, 7) << QPointF(3, 5) << QPointF(5, 5) << 2.0 << 0.0
                          << 180.0;
    QTest::newRow("three quarters") << QPointF(10, 0) << QPointF(-10, 0) << QPointF(0, -10) << QPointF(0, 0)
                                    << 10.0 << 0.0 << 270.0;
    QTest::newRow("three quarters, counterclockwise")
        << QPointF(10, 0) << QPointF(-10, 0) << QPointF(0, 10) << QPointF(0, 0) << 10.0 << 0.0 << -270.0;
}

void ZtGeometryTest::findsTheArc()
{
    QFETCH(QPointF, start);
    QFETCH(QPointF, middle);
    QFETCH(QPointF, end);
    QFETCH(QPointF, centre);
    QFETCH(double, radius);
    QFETCH(double, startAngle);
    QFETCH(double, sweep);
    const ZtArc arc = ZtGeometry::arcThrough(start, middle, end);
    QVERIFY(isNear(arc.centre.x(), centre.x()));
    QVERIFY(isNear(arc.centre.y(), centre.y()));
    QVERIFY(isNear(arc.radius, radius));
    QVERIFY(isNear(arc.startAngle, startAngle));
    QVERIFY(isNear(arc.sweep, sweep));
    QVERIFY(isNear(ZtGeometry::arcLength(start, middle, end), radius * std::abs(sweep) * pi / 180.0));
}

void ZtGeometryTest::takesPointsOnALineAsOne_data()
{
    QTest::addColumn<QPointF>("start");
    QTest::addColumn<QPointF>("middle");
    QTest::addColumn<QPointF>("end");
    QTest::addColumn<double>("length");
    QTest::newRow("horizontal") << QPointF(0, 0) << QPointF(1, 0) << QPointF(3, 0) << 3.0;
    QTest::newRow("middle beyond the end") << QPointF(0, 0) << QPointF(4, 0) << QPointF(3, 0) << 5.0;
    QTest::newRow("off by rounding") << QPointF(0.1, 0.3) << QPointF(0.2, 0.6) << QPointF(0.3, 0.9)
                                     << std::sqrt(0.4);
    QTest::newRow("off by rounding, beyond the end")
        << QPointF(0.1, 0.3) << QPointF(0.3, 0.9) << QPointF(0.2, 0.6) << 1.5 * std::sqrt(0.4);
    QTest::newRow("one point") << QPointF(2, 2) << QPointF(2, 2) << QPointF(2, 2) << 0.0;
    QTest::newRow("middle is the start") << QPointF(0, 0) << QPointF(0, 0) << QPointF(3, 4) << 5.0;
    QTest::newRow("middle is the end") << QPointF(0, 0) << QPointF(3, 4) << QPointF(3, 4) << 5.0;
    QTest::newRow("end is the start") << QPointF(0, 0) << QPointF(3, 4) << QPointF(0, 0) << 10.0;
}

void ZtGeometryTest::takesPointsOnALineAsOne()
{
    QFETCH(QPointF, start);
    QFETCH(QPointF, middle);
    QFETCH(QPointF, end);
    QFETCH(double, length);
    const ZtArc arc = ZtGeometry::arcThrough(start, middle, end);
    QCOMPARE(arc.radius, 0.0);
    QCOMPARE(arc.sweep, 0.0);
    QVERIFY(isNear(ZtGeometry::arcLength(start, middle, end), length));
}

void ZtGeometryTest::measuresArcsThatAreNearlyStraight()
{
    // The height above a chord of 2000 is so small that the length differs from the chord's by 8 h^2 / (3 *
    // 2000).
    const double height = 1e-4;
    const double length = ZtGeometry::arcLength({0, 0}, {1000, height}, {2000, 0});
    QVERIFY(isNear(length, 2000.0, 1e-9));
    const ZtArc arc = ZtGeometry::arcThrough({0, 0}, {1000, height}, {2000, 0});
    QVERIFY(isNear(std::abs(arc.sweep), 4.0 * height / 1000.0 * 180.0 / pi, 1e-9));
}

STATREPORT_TEST_MAIN(ZtGeometryTest)
#include "ZtGeometryTest.moc"
