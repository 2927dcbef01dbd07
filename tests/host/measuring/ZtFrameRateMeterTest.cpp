// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFrameRateMeter.h"

class ZtFrameRateMeterTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void rate_data();
    void rate();
};

void ZtFrameRateMeterTest::rate_data()
{
    QTest::addColumn<QVector<int>>("times");
    QTest::addColumn<int>("now");
    QTest::addColumn<double>("rate");
    const QVector<int> steady{0, 40, 80, 120, 160, 200};
    QTest::newRow("none") << QVector<int>() << 0 << 0.0;
    QTest::newRow("one") << QVector<int>{5} << 10 << 0.0;
    QTest::newRow("two") << QVector<int>{0, 500} << 600 << 2.0;
    QTest::newRow("steady") << steady << 210 << 25.0;
    QTest::newRow("some time ago") << steady << 1100 << 25.0;
    QTest::newRow("long ago") << steady << 1500 << 0.0;
    QTest::newRow("only the last second counts")
        << QVector<int>{0, 10, 20, 30, 1500, 1600, 1700} << 1700 << 10.0;
    QTest::newRow("all at once") << QVector<int>{7, 7, 7} << 8 << 0.0;
    QTest::newRow("one each two seconds") << QVector<int>{0, 2000, 4000} << 4000 << 0.0;
}

void ZtFrameRateMeterTest::rate()
{
    QFETCH(QVector<int>, times);
    QFETCH(int, now);
    QFETCH(double, rate);
    ZtFrameRateMeter meter;
    for (const int time : times)
        meter.addFrame(time);
    QCOMPARE(meter.rate(now), rate);
}

STATREPORT_TEST_MAIN(ZtFrameRateMeterTest)
#include "ZtFrameRateMeterTest.moc"
