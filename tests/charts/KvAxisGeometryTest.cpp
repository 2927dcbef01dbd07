// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvAxisGeometry.h"

namespace KvAxisGeometry = kvCharts::KvAxisGeometry;

class KvAxisGeometryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void maps_data();
    void maps();
    void valueTicks_data();
    void valueTicks();
    void sumsUp();
    void bandEdges_data();
    void bandEdges();
    void bandEdgesOfManyBands();
    void lines_data();
    void lines();
    void gridAtTheOrigin();
    void labels_data();
    void labels();
};

void KvAxisGeometryTest::maps_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<double>("expected");
    QTest::newRow("minimum") << 2.0 << 2.0 << 4.0 << 0.0;
    QTest::newRow("maximum") << 4.0 << 2.0 << 4.0 << 1000.0;
    QTest::newRow("between") << 2.5 << 2.0 << 4.0 << 250.0;
    QTest::newRow("below") << 1.0 << 2.0 << 4.0 << -500.0;
    QTest::newRow("above") << 6.0 << 2.0 << 4.0 << 2000.0;
    QTest::newRow("swapped limits") << -7.0 << -6.3 << -7.7 << 500.0;
}

void KvAxisGeometryTest::maps()
{
    QFETCH(double, value);
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(double, expected);
    QCOMPARE(KvAxisGeometry::valueToScene(value, min, max), expected);
}

void KvAxisGeometryTest::valueTicks_data()
{
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<int>("count");
    QTest::addColumn<QVector<double>>("offsets");
    QTest::addColumn<QVector<double>>("values");
    using Numbers = QVector<double>;
    QTest::newRow("five") << 0.0 << 2.0 << 5 << Numbers{0, 250, 500, 750, 1000} << Numbers{0, 0.5, 1, 1.5, 2};
    QTest::newRow("two") << 3.0 << 8.0 << 2 << Numbers{0, 1000} << Numbers{3, 8};
    QTest::newRow("one: the minimum at the start") << 3.0 << 8.0 << 1 << Numbers{0} << Numbers{3};
    QTest::newRow("none") << 3.0 << 8.0 << 0 << Numbers{} << Numbers{};
    QTest::newRow("fewer than none") << 3.0 << 8.0 << -4 << Numbers{} << Numbers{};
    QTest::newRow("downwards") << 4.0 << 0.0 << 3 << Numbers{0, 500, 1000} << Numbers{4, 2, 0};
}

void KvAxisGeometryTest::valueTicks()
{
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(int, count);
    QFETCH(QVector<double>, offsets);
    QFETCH(QVector<double>, values);
    QVector<double> foundOffsets;
    QVector<double> foundValues;
    for (const KvAxisGeometry::Tick &tick : KvAxisGeometry::valueTicks(min, max, count)) {
        foundOffsets.append(tick.offset);
        foundValues.append(tick.value);
    }
    QCOMPARE(foundOffsets, offsets);
    QCOMPARE(foundValues, values);
}

void KvAxisGeometryTest::sumsUp()
{
    // -0.3 + 0.1 + 0.1 + 0.1 is not quite zero, where a product would be
    const auto ticks = KvAxisGeometry::valueTicks(-0.3, 0.7, 11);
    double sum = -0.3;
    for (int i = 0; i < 3; ++i)
        sum += (0.7 - -0.3) / 10;
    QVERIFY(sum != 0.0);
    QVERIFY(ticks.at(3).value == sum);

    const auto many = KvAxisGeometry::valueTicks(0.0, 1.0, 50);
    double offset = 0.0;
    for (int i = 0; i < 49; ++i)
        offset += 1000.0 / 49;
    QVERIFY(offset != 49 * (1000.0 / 49));
    QVERIFY(many.last().offset == offset);
}

void KvAxisGeometryTest::bandEdges_data()
{
    QTest::addColumn<int>("count");
    QTest::addColumn<QVector<double>>("edges");
    QTest::newRow("fewer than none") << -1 << QVector<double>{};
    QTest::newRow("none") << 0 << QVector<double>{};
    QTest::newRow("one") << 1 << QVector<double>{1000};
    QTest::newRow("four") << 4 << QVector<double>{250, 500, 750, 1000};
    QTest::newRow("three") << 3 << QVector<double>{1000.0 / 3, 2000.0 / 3, 1000};
}

void KvAxisGeometryTest::bandEdges()
{
    QFETCH(int, count);
    QFETCH(QVector<double>, edges);
    for (const Qt::Orientation orientation : {Qt::Horizontal, Qt::Vertical}) {
        const QVector<double> found = KvAxisGeometry::bandEdges(orientation, count);
        QCOMPARE(found.size(), edges.size());
        for (int i = 0; i < edges.size(); ++i)
            QVERIFY(qAbs(found.at(i) - edges.at(i)) < 1e-9);
    }
}

void KvAxisGeometryTest::bandEdgesOfManyBands()
{
    // Along x each band starts where the one before ends, along y at a multiple of its height.
    constexpr int count = 49;
    const double band = 1000.0 / count;
    double sum = 0.0;
    for (int i = 0; i < count; ++i)
        sum += band;
    QVERIFY(sum != count * band);
    QVERIFY(KvAxisGeometry::bandEdges(Qt::Horizontal, count).last() == sum);
    QVERIFY(KvAxisGeometry::bandEdges(Qt::Vertical, count).last() == count * band);
}

void KvAxisGeometryTest::lines_data()
{
    QTest::addColumn<QLineF>("found");
    QTest::addColumn<QLineF>("expected");
    using namespace KvAxisGeometry;
    QTest::newRow("axis x") << axisLine(Qt::Horizontal) << QLineF(0, 1000, 1000, 1000);
    QTest::newRow("axis y") << axisLine(Qt::Vertical) << QLineF(0, 1000, 0, 0);
    QTest::newRow("tick x") << tickMark(Qt::Horizontal, 250) << QLineF(250, 1000, 250, 1005);
    QTest::newRow("tick y") << tickMark(Qt::Vertical, 250) << QLineF(-5, 750, 0, 750);
    QTest::newRow("grid x") << gridLine(Qt::Horizontal, 250) << QLineF(250, 0, 250, 999);
    QTest::newRow("grid y") << gridLine(Qt::Vertical, 250) << QLineF(1, 750, 1000, 750);
}

void KvAxisGeometryTest::lines()
{
    QFETCH(QLineF, found);
    QFETCH(QLineF, expected);
    QCOMPARE(found, expected);
}

void KvAxisGeometryTest::gridAtTheOrigin()
{
    QVERIFY(!KvAxisGeometry::hasGridAtOrigin(Qt::Horizontal)); // the y axis stands there
    QVERIFY(KvAxisGeometry::hasGridAtOrigin(Qt::Vertical));
}

void KvAxisGeometryTest::labels_data()
{
    QTest::addColumn<QPointF>("found");
    QTest::addColumn<QPointF>("expected");
    using namespace KvAxisGeometry;
    const QSizeF size(40, 30);
    QTest::newRow("value x") << valueLabel(Qt::Horizontal, 250, size) << QPointF(230, 1005);
    QTest::newRow("value y") << valueLabel(Qt::Vertical, 250, size) << QPointF(-47, 735);
    QTest::newRow("category x") << categoryLabel(Qt::Horizontal, 250, 500, size) << QPointF(355, 1005);
    // The first band of a y axis is the topmost.
    QTest::newRow("category y") << categoryLabel(Qt::Vertical, 0, 250, size) << QPointF(-45, 110);
}

void KvAxisGeometryTest::labels()
{
    QFETCH(QPointF, found);
    QFETCH(QPointF, expected);
    QCOMPARE(found, expected);
}

STATREPORT_TEST_MAIN(KvAxisGeometryTest)
#include "KvAxisGeometryTest.moc"
