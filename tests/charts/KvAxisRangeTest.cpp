// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvAxisRange.h"
#include <limits>

using kvCharts::KvAxisRange;

class KvAxisRangeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsAtTenWithElevenTicks();
    void around_data();
    void around();
    void staysDefined();
};

void KvAxisRangeTest::startsAtTenWithElevenTicks()
{
    const KvAxisRange range;
    QCOMPARE(range.minimum, 0.0);
    QCOMPARE(range.maximum, 10.0);
    QCOMPARE(range.tickCount, 11);
}

void KvAxisRangeTest::around_data()
{
    QTest::addColumn<double>("least");
    QTest::addColumn<double>("greatest");
    QTest::addColumn<double>("minimum");
    QTest::addColumn<double>("maximum");
    QTest::addColumn<int>("tickCount");
    QTest::newRow("step 10") << 0.0 << 100.0 << 0.0 << 100.0 << 11;
    QTest::newRow("step 5") << 3.0 << 47.0 << 0.0 << 50.0 << 11;
    QTest::newRow("13 intervals") << 0.5 << 12.5 << 0.0 << 13.0 << 14; // the floored start adds one
    QTest::newRow("too small for a step") << 0.0 << 2.0 << 0.0 << 2.0 << 5;
    QTest::newRow("just too small") << 1.0 << 4.9 << 1.0 << 4.9 << 5;
    QTest::newRow("just large enough") << 1.0 << 5.0 << 1.0 << 5.0 << 5;
    QTest::newRow("one value") << 5.0 << 5.0 << 4.5 << 5.5 << 5;
    QTest::newRow("zero") << 0.0 << 0.0 << -1.0 << 1.0 << 5;
    QTest::newRow("one negative value: swapped") << -7.0 << -7.0 << -6.3 << -7.7 << 5;
    QTest::newRow("from below zero") << -30.0 << 30.0 << -30.0 << 30.0 << 13;
    QTest::newRow("start below the least") << -3.0 << 44.0 << -5.0 << 45.0 << 11;
    QTest::newRow("all below zero") << -47.0 << -3.0 << -50.0 << 0.0 << 11;
    QTest::newRow("step 1") << 0.2 << 4.4 << 0.0 << 5.0 << 6;
    QTest::newRow("step 2") << 0.0 << 20.0 << 0.0 << 20.0 << 11;
    QTest::newRow("step 25") << 0.0 << 290.0 << 0.0 << 300.0 << 13;
    QTest::newRow("step 250") << 0.0 << 2600.0 << 0.0 << 2750.0 << 12;
    QTest::newRow("swapped limits") << 9.0 << 1.0 << 9.0 << 1.0 << 5;
    QTest::newRow("start beyond 32 bits") << 1e15 << 1e15 + 100 << 1e15 << 1e15 + 100 << 11;
}

void KvAxisRangeTest::around()
{
    QFETCH(double, least);
    QFETCH(double, greatest);
    QFETCH(double, minimum);
    QFETCH(double, maximum);
    QFETCH(int, tickCount);
    const KvAxisRange range = KvAxisRange::around(least, greatest);
    QCOMPARE(range.minimum, minimum);
    QCOMPARE(range.maximum, maximum);
    QCOMPARE(range.tickCount, tickCount);
}

void KvAxisRangeTest::staysDefined()
{
    const double infinity = std::numeric_limits<double>::infinity();
    const double nan = std::numeric_limits<double>::quiet_NaN();
    for (const double value : {infinity, -infinity, nan, 1e300, -1e300}) {
        QCOMPARE(KvAxisRange::around(0.0, value).tickCount, 5);
        QCOMPARE(KvAxisRange::around(value, 0.0).tickCount, 5);
    }
}

STATREPORT_TEST_MAIN(KvAxisRangeTest)
#include "KvAxisRangeTest.moc"
