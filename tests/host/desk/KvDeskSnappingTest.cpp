// SPDX-License-Identifier: MIT
#include "KvDeskSnapping.h"

#include "support/StatReportTest.h"

class KvDeskSnappingTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void directions_data();
    void directions();
    void squares_data();
    void squares();
    void nearest();
};

void KvDeskSnappingTest::directions_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::addColumn<QPointF>("expected");
    QTest::newRow("level") << QPointF(110, 13) << QPointF(110, 10);
    QTest::newRow("to the left") << QPointF(-90, 7) << QPointF(-90, 10);
    QTest::newRow("upright") << QPointF(11, 60) << QPointF(10, 60);
    QTest::newRow("up") << QPointF(8, -60) << QPointF(10, -60);
    QTest::newRow("diagonal") << QPointF(62, 58) << QPointF(60, 60);
    QTest::newRow("other diagonal") << QPointF(62, -38) << QPointF(60, -40);
    // 14 degrees: 100 in that direction, at 15 degrees.
    QTest::newRow("15 degrees") << QPointF(10 + 97.0295726275997, 10 + 24.192189559966772)
                                << QPointF(10 + 96.57787115, 10 + 25.87796257);
    QTest::newRow("at the origin") << QPointF(10, 10) << QPointF(10, 10);
}

void KvDeskSnappingTest::directions()
{
    QFETCH(QPointF, point);
    QFETCH(QPointF, expected);
    const QPointF snapped = KvDeskSnapping::alongDirection(QPointF(10, 10), point, 15.0);
    QVERIFY2(QLineF(snapped, expected).length() < 1e-6,
             qPrintable(QStringLiteral("%1, %2").arg(snapped.x(), 0, 'g', 12).arg(snapped.y(), 0, 'g', 12)));
}

void KvDeskSnappingTest::squares_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::addColumn<QPointF>("expected");
    QTest::newRow("wide") << QPointF(60, 20) << QPointF(60, 60);
    QTest::newRow("high") << QPointF(20, 90) << QPointF(90, 90);
    QTest::newRow("up and left") << QPointF(-40, 0) << QPointF(-40, -40);
    QTest::newRow("at the origin") << QPointF(10, 10) << QPointF(10, 10);
}

void KvDeskSnappingTest::squares()
{
    QFETCH(QPointF, point);
    QTEST(KvDeskSnapping::toSquare(QPointF(10, 10), point), "expected");
}

void KvDeskSnappingTest::nearest()
{
    const QVector<QPointF> candidates{{0, 0}, {10, 0}, {4, 3}};
    QCOMPARE(KvDeskSnapping::nearest(QPointF(6, 3), candidates, 5.0), &candidates.at(2));
    QCOMPARE(KvDeskSnapping::nearest(QPointF(13, 4), candidates, 5.0), &candidates.at(1));
    QVERIFY(!KvDeskSnapping::nearest(QPointF(13, 5), candidates, 5.0));
    QVERIFY(!KvDeskSnapping::nearest(QPointF(0, 0), {}, 5.0));
}

STATREPORT_TEST_MAIN(KvDeskSnappingTest)
#include "KvDeskSnappingTest.moc"
