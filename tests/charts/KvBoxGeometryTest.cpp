// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvBoxGeometry.h"

namespace KvBoxGeometry = kvCharts::KvBoxGeometry;

class KvBoxGeometryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void extents_data();
    void extents();
    void boxesAndLines();
    void labels();
    void spread_data();
    void spread();
    void leaderLines();
};

void KvBoxGeometryTest::extents_data()
{
    QTest::addColumn<int>("count");
    QTest::addColumn<QVector<double>>("tops");
    QTest::addColumn<QVector<double>>("bottoms");
    using Numbers = QVector<double>;
    QTest::newRow("one") << 1 << Numbers{250} << Numbers{750};
    QTest::newRow("two") << 2 << Numbers{125, 625} << Numbers{375, 875};
    QTest::newRow("four") << 4 << Numbers{62.5, 312.5, 562.5, 812.5} << Numbers{187.5, 437.5, 687.5, 937.5};
    QTest::newRow("none") << 0 << Numbers{} << Numbers{};
}

void KvBoxGeometryTest::extents()
{
    QFETCH(int, count);
    QFETCH(QVector<double>, tops);
    QFETCH(QVector<double>, bottoms);
    const QVector<KvBoxGeometry::Extent> extents = KvBoxGeometry::extents(count);
    QCOMPARE(extents.size(), tops.size());
    for (int i = 0; i < extents.size(); ++i) {
        QCOMPARE(extents.at(i).top, tops.at(i));
        QCOMPARE(extents.at(i).bottom, bottoms.at(i));
    }
}

void KvBoxGeometryTest::boxesAndLines()
{
    const KvBoxGeometry::Positions x{100, 300, 400, 600, 900};
    const KvBoxGeometry::Extent extent{250, 750};
    QCOMPARE(KvBoxGeometry::boxRect(x, extent), QRectF(300, 250, 300, 500));
    const QVector<QLineF> expected{{100, 250, 100, 750},
                                   {400, 250, 400, 750},
                                   {900, 250, 900, 750},
                                   {100, 500, 300, 500},
                                   {600, 500, 900, 500}};
    QCOMPARE(KvBoxGeometry::lines(x, extent), expected);
}

void KvBoxGeometryTest::labels()
{
    const KvBoxGeometry::Extent extent{250, 750};
    QCOMPARE(KvBoxGeometry::labelPosition(400, extent, 50), QPointF(375, 761));
    QCOMPARE(KvBoxGeometry::labelAnchor(400, extent), QPointF(400, 753));
}

void KvBoxGeometryTest::spread_data()
{
    QTest::addColumn<QVector<double>>("lefts");
    QTest::addColumn<QVector<double>>("expected");
    QTest::addColumn<bool>("moved");
    using Numbers = QVector<double>;
    // All labels are 40 wide, so that two of them stand 46 apart at least.
    QTest::newRow("none") << Numbers{} << Numbers{} << false;
    QTest::newRow("one") << Numbers{10} << Numbers{10} << false;
    QTest::newRow("apart") << Numbers{0, 100, 200} << Numbers{0, 100, 200} << false;
    QTest::newRow("just apart") << Numbers{0, 46} << Numbers{0, 46} << false;
    QTest::newRow("too close") << Numbers{0, 40} << Numbers{-3, 43} << true;
    // All at one place: the last one goes 184, so all come back by 92.
    QTest::newRow("all at once") << Numbers{480, 480, 480, 480, 480} << Numbers{388, 434, 480, 526, 572}
                                 << true;
    // The last that moved counts, not the last label: back by half of 6.
    QTest::newRow("the last stands") << Numbers{0, 40, 500} << Numbers{-3, 43, 497} << true;
    QTest::newRow("the last that moved") << Numbers{0, 0, 90} << Numbers{-1, 45, 91} << true;
}

void KvBoxGeometryTest::spread()
{
    QFETCH(QVector<double>, lefts);
    QFETCH(QVector<double>, expected);
    QFETCH(bool, moved);
    QVector<QRectF> labels;
    for (const double left : lefts)
        labels.append(QRectF(left, 761, 40, 30));
    QCOMPARE(KvBoxGeometry::spreadLabels(labels), moved);
    for (int i = 0; i < labels.size(); ++i)
        QCOMPARE(labels.at(i), QRectF(expected.at(i), 761, 40, 30));
}

void KvBoxGeometryTest::leaderLines()
{
    QCOMPARE(KvBoxGeometry::leaderLine(QRectF(388, 761, 40, 30), QPointF(500, 753)),
             QLineF(408, 759, 500, 753));
}

STATREPORT_TEST_MAIN(KvBoxGeometryTest)
#include "KvBoxGeometryTest.moc"
