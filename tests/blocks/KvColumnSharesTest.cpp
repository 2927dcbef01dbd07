// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/table/KvColumnShares.h"

#include <numeric>

class KvColumnSharesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void equalColumns_data();
    void equalColumns();
    void fittedColumns_data();
    void fittedColumns();
    void theWidthIsUsedWhole();
};

void KvColumnSharesTest::equalColumns_data()
{
    QTest::addColumn<int>("left");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("columns");
    QTest::addColumn<QVector<int>>("edges");
    QTest::newRow("no column") << 5 << 100 << 0 << QVector<int>{};
    QTest::newRow("one") << 5 << 100 << 1 << QVector<int>{5, 105};
    QTest::newRow("evenly") << 0 << 100 << 4 << QVector<int>{0, 25, 50, 75, 100};
    QTest::newRow("the last one takes the rest") << 10 << 101 << 3 << QVector<int>{10, 43, 76, 111};
    QTest::newRow("more columns than pixels") << 0 << 2 << 3 << QVector<int>{0, 0, 0, 2};
    QTest::newRow("no width") << 4 << -7 << 2 << QVector<int>{4, 4, 4};
}

void KvColumnSharesTest::equalColumns()
{
    QFETCH(int, left);
    QFETCH(int, width);
    QFETCH(int, columns);
    QTEST(KvColumnShares::edges(left, width, columns, {}), "edges");
}

void KvColumnSharesTest::fittedColumns_data()
{
    QTest::addColumn<int>("width");
    QTest::addColumn<QVector<int>>("wanted");
    QTest::addColumn<int>("yielding");
    QTest::addColumn<QVector<int>>("widths");
    QTest::newRow("all fit") << 301 << QVector<int>{100, 20, 90} << 0 << QVector<int>{100, 100, 101};
    QTest::newRow("one takes from the others")
        << 300 << QVector<int>{160, 20, 60} << 0 << QVector<int>{160, 70, 70};
    QTest::newRow("two take from the third")
        << 300 << QVector<int>{120, 30, 130} << 0 << QVector<int>{120, 50, 130};
    QTest::newRow("just enough") << 300 << QVector<int>{100, 30, 170} << 0 << QVector<int>{100, 30, 170};
    QTest::newRow("one is cut") << 300 << QVector<int>{1000, 20, 60} << 0 << QVector<int>{220, 20, 60};
    QTest::newRow("two are cut alike")
        << 300 << QVector<int>{500, 20, 600} << 0 << QVector<int>{140, 20, 140};
    QTest::newRow("names give way") << 300 << QVector<int>{150, 120, 90, 90} << 2
                                    << QVector<int>{60, 60, 90, 90};
    QTest::newRow("the longer name gives way")
        << 300 << QVector<int>{50, 120, 90, 90} << 2 << QVector<int>{50, 70, 90, 90};
    QTest::newRow("names keep something")
        << 300 << QVector<int>{150, 120, 110, 110} << 2 << QVector<int>{75, 75, 75, 75};
    QTest::newRow("nobody needs to give way")
        << 300 << QVector<int>{80, 60, 40, 110} << 2 << QVector<int>{80, 60, 50, 110};
    QTest::newRow("no room") << 0 << QVector<int>{50, 60} << 0 << QVector<int>{0, 0};
    QTest::newRow("needs of some columns") << 100 << QVector<int>{80, 0, 0} << 0 << QVector<int>{80, 10, 10};
}

void KvColumnSharesTest::fittedColumns()
{
    QFETCH(int, width);
    QFETCH(QVector<int>, wanted);
    QFETCH(int, yielding);
    QTEST(KvColumnShares::widths(width, wanted.size(), {wanted, yielding}), "widths");
}

void KvColumnSharesTest::theWidthIsUsedWhole()
{
    const QVector<int> wanted{17, 230, 44, 91, 3, 120, 64};
    for (int width = 0; width < 900; ++width) {
        const QVector<int> widths = KvColumnShares::widths(width, wanted.size(), {wanted, width % 3});
        QCOMPARE(std::accumulate(widths.cbegin(), widths.cend(), 0), width);
        QVERIFY(*std::min_element(widths.cbegin(), widths.cend()) >= 0);
    }
    QCOMPARE(KvColumnShares::widths(90, 3, {{60}, 0}), (QVector<int>{60, 15, 15}));
}

STATREPORT_TEST_MAIN(KvColumnSharesTest)
#include "KvColumnSharesTest.moc"
