// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvLineGeometry.h"
#include <limits>

namespace KvLineGeometry = kvCharts::KvLineGeometry;

class KvLineGeometryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void scales_data();
    void scales();
    void runs_data();
    void runs();
    void trend_data();
    void trend();
    void noTrendWithoutFiniteEnds();
};

void KvLineGeometryTest::scales_data()
{
    QTest::addColumn<int>("count");
    QTest::addColumn<int>("index");
    QTest::addColumn<double>("value");
    QTest::addColumn<QPointF>("expected");
    QTest::newRow("one category, least") << 1 << 0 << 2.0 << QPointF(500, 1000);
    QTest::newRow("first of four, greatest") << 4 << 0 << 6.0 << QPointF(125, 0);
    QTest::newRow("last of four, half-way") << 4 << 3 << 4.0 << QPointF(875, 500);
    QTest::newRow("no such category") << 4 << -1 << 3.0 << QPointF(-125, 750);
    QTest::newRow("outside the range") << 4 << 1 << 8.0 << QPointF(375, -500);
}

void KvLineGeometryTest::scales()
{
    QFETCH(int, count);
    QFETCH(int, index);
    QFETCH(double, value);
    QFETCH(QPointF, expected);
    QCOMPARE(KvLineGeometry::scale(count, 2.0, 6.0).toScene(index, value), expected);
}

void KvLineGeometryTest::runs_data()
{
    QTest::addColumn<QVector<QPointF>>("points");
    QTest::addColumn<QVector<QVector<QPointF>>>("expected");
    using Points = QVector<QPointF>;
    using Runs = QVector<QVector<QPointF>>;
    const QPointF a(1, 2);
    const QPointF b(3, 4);
    const QPointF c(5, 0);
    const QPointF zero(0, 0);
    const QPointF nan(3, std::numeric_limits<double>::quiet_NaN());
    QTest::newRow("none") << Points{} << Runs{};
    QTest::newRow("one") << Points{a} << Runs{};
    QTest::newRow("all joined") << Points{a, b, c} << Runs{{a, b, c}};
    QTest::newRow("the origin ends a line") << Points{a, zero, b, c} << Runs{{a, zero}, {b, c}};
    QTest::newRow("no line from the origin") << Points{zero, a, b} << Runs{{a, b}};
    QTest::newRow("the origin twice") << Points{a, zero, zero, b} << Runs{{a, zero}};
    QTest::newRow("the origin last") << Points{a, b, zero} << Runs{{a, b, zero}};
    QTest::newRow("not finite") << Points{a, b, nan, c, b} << Runs{{a, b}, {c, b}};
    QTest::newRow("not finite, alone behind") << Points{a, b, nan, c} << Runs{{a, b}};
}

void KvLineGeometryTest::runs()
{
    QFETCH(QVector<QPointF>, points);
    QFETCH(QVector<QVector<QPointF>>, expected);
    QCOMPARE(KvLineGeometry::joinedRuns(points), expected);
}

void KvLineGeometryTest::trend_data()
{
    QTest::addColumn<double>("slope");
    QTest::addColumn<double>("intercept");
    QTest::addColumn<QLineF>("expected");
    QTest::newRow("level") << 0.0 << 400.0 << QLineF(-50, 400, 1050, 400);
    QTest::newRow("gentle") << 0.5 << 100.0 << QLineF(-50, 75, 1050, 625);
    QTest::newRow("to both corners") << 1.0 << 0.0 << QLineF(-50, -50, 1050, 1050);
    QTest::newRow("steep downwards") << 2.0 << -200.0 << QLineF(75, -50, 625, 1050);
    QTest::newRow("steep upwards") << -2.0 << 1200.0 << QLineF(75, 1050, 625, -50);
    QTest::newRow("left end only") << 1.0 << -100.0 << QLineF(50, -50, 1050, 950);
    QTest::newRow("right end only") << 1.0 << 100.0 << QLineF(-50, 50, 950, 1050);
}

void KvLineGeometryTest::trend()
{
    QFETCH(double, slope);
    QFETCH(double, intercept);
    QFETCH(QLineF, expected);
    const std::optional<QLineF> line = KvLineGeometry::trendLine(slope, intercept);
    QVERIFY(line.has_value());
    QCOMPARE(*line, expected);
}

void KvLineGeometryTest::noTrendWithoutFiniteEnds()
{
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double infinity = std::numeric_limits<double>::infinity();
    QVERIFY(!KvLineGeometry::trendLine(nan, nan));
    QVERIFY(!KvLineGeometry::trendLine(infinity, -infinity));
    QVERIFY(!KvLineGeometry::trendLine(nan, 5.0));
    QVERIFY(!KvLineGeometry::trendLine(0.0, 2000.0)); // level and out of the plot: cut nowhere
}

STATREPORT_TEST_MAIN(KvLineGeometryTest)
#include "KvLineGeometryTest.moc"
