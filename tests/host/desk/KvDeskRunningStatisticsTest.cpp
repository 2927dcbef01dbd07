// SPDX-License-Identifier: MIT
#include "KvDeskRunningStatistics.h"

#include "support/StatReportTest.h"

#include <cmath>
#include <limits>

class KvDeskRunningStatisticsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void nothing();
    void oneNumber();
    void someNumbers();
    void numbersFarFromZero();
    void otherThanNumbersAreCounted();
    void sumOfTwo_data();
    void sumOfTwo();

private:
    static KvDeskRunningStatistics of(const QVector<double> &numbers)
    {
        KvDeskRunningStatistics statistics;
        for (const double number : numbers)
            statistics.add(number);
        return statistics;
    }
};

void KvDeskRunningStatisticsTest::nothing()
{
    const KvDeskRunningStatistics statistics;
    QCOMPARE(statistics.count(), 0);
    QVERIFY(std::isnan(statistics.mean()));
    QVERIFY(std::isnan(statistics.standardDeviation()));
    QVERIFY(std::isnan(statistics.minimum()));
    QVERIFY(std::isnan(statistics.maximum()));
}

void KvDeskRunningStatisticsTest::oneNumber()
{
    const KvDeskRunningStatistics statistics = of({-3.5});
    QCOMPARE(statistics.count(), 1);
    QCOMPARE(statistics.mean(), -3.5);
    QVERIFY(std::isnan(statistics.standardDeviation()));
    QCOMPARE(statistics.minimum(), -3.5);
    QCOMPARE(statistics.maximum(), -3.5);
}

void KvDeskRunningStatisticsTest::someNumbers()
{
    const KvDeskRunningStatistics statistics = of({2, 4, 4, 4, 5, 5, 7, 9});
    QCOMPARE(statistics.count(), 8);
    QCOMPARE(statistics.mean(), 5.0);
    QCOMPARE(statistics.standardDeviation(), 2.0);
    QCOMPARE(statistics.minimum(), 2.0);
    QCOMPARE(statistics.maximum(), 9.0);
}

// Squares of such numbers would leave nothing of their differences.
void KvDeskRunningStatisticsTest::numbersFarFromZero()
{
    const KvDeskRunningStatistics statistics = of({1e9 + 4, 1e9 + 7, 1e9 + 13, 1e9 + 16});
    QCOMPARE(statistics.mean(), 1e9 + 10);
    QCOMPARE(statistics.standardDeviation(), std::sqrt(22.5));
}

void KvDeskRunningStatisticsTest::otherThanNumbersAreCounted()
{
    const KvDeskRunningStatistics statistics =
        of({1.0, std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity(), 3.0});
    QCOMPARE(statistics.count(), 2);
    QCOMPARE(statistics.leftOut(), 2);
    QCOMPARE(statistics.mean(), 2.0);
    QCOMPARE(statistics.maximum(), 3.0);
}

void KvDeskRunningStatisticsTest::sumOfTwo_data()
{
    QTest::addColumn<QVector<double>>("first");
    QTest::addColumn<QVector<double>>("second");
    const double nan = std::numeric_limits<double>::quiet_NaN();
    QTest::newRow("both") << QVector<double>{1, 2, 4} << QVector<double>{-8, 1e6};
    QTest::newRow("first empty") << QVector<double>{} << QVector<double>{3, 5};
    QTest::newRow("second empty") << QVector<double>{3, 5} << QVector<double>{};
    QTest::newRow("not only numbers") << QVector<double>{nan, 3} << QVector<double>{nan};
    QTest::newRow("first without numbers") << QVector<double>{nan} << QVector<double>{nan, 4, 5};
}

void KvDeskRunningStatisticsTest::sumOfTwo()
{
    QFETCH(QVector<double>, first);
    QFETCH(QVector<double>, second);
    KvDeskRunningStatistics sum = of(first);
    sum.add(of(second));
    const KvDeskRunningStatistics expected = of(first + second);
    QCOMPARE(sum.count(), expected.count());
    QCOMPARE(sum.leftOut(), expected.leftOut());
    QCOMPARE(sum.minimum(), expected.minimum());
    QCOMPARE(sum.maximum(), expected.maximum());
    QCOMPARE(sum.mean(), expected.mean());
    QCOMPARE(sum.standardDeviation(), expected.standardDeviation());
}

STATREPORT_TEST_MAIN(KvDeskRunningStatisticsTest)
#include "KvDeskRunningStatisticsTest.moc"
