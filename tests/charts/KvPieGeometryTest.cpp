// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvPieGeometry.h"
#include <limits>

namespace KvPieGeometry = kvCharts::KvPieGeometry;

class KvPieGeometryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void slices_data();
    void slices();
    void noSlicesWithoutAFiniteSum();
    void paths();
    void labelCorner_data();
    void labelCorner();
    void labelsStayLevel();
};

void KvPieGeometryTest::slices_data()
{
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<QVector<double>>("starts");
    QTest::addColumn<QVector<double>>("spans");
    using Numbers = QVector<double>;
    QTest::newRow("one") << Numbers{5} << Numbers{0} << Numbers{360};
    QTest::newRow("quarters") << Numbers{1, 2, 1} << Numbers{0, 90, 270} << Numbers{90, 180, 90};
    QTest::newRow("with a zero") << Numbers{3, 0, 1} << Numbers{0, 270, 270} << Numbers{270, 0, 90};
    QTest::newRow("none") << Numbers{} << Numbers{} << Numbers{};
    QTest::newRow("all zero") << Numbers{0, 0} << Numbers{} << Numbers{};
    QTest::newRow("sum zero") << Numbers{2, -2} << Numbers{} << Numbers{};
}

void KvPieGeometryTest::slices()
{
    QFETCH(QVector<double>, values);
    QFETCH(QVector<double>, starts);
    QFETCH(QVector<double>, spans);
    const QVector<KvPieGeometry::Slice> slices = KvPieGeometry::slices(values);
    QCOMPARE(slices.size(), starts.size());
    for (int i = 0; i < slices.size(); ++i) {
        QCOMPARE(slices.at(i).start, starts.at(i));
        QCOMPARE(slices.at(i).span, spans.at(i));
    }
}

void KvPieGeometryTest::noSlicesWithoutAFiniteSum()
{
    QVERIFY(KvPieGeometry::slices({1.0, std::numeric_limits<double>::quiet_NaN()}).isEmpty());
    QVERIFY(KvPieGeometry::slices({1.0, std::numeric_limits<double>::infinity()}).isEmpty());
}

void KvPieGeometryTest::paths()
{
    const QPainterPath path = KvPieGeometry::slicePath({0.0, 90.0});
    // Clockwise from 3 o'clock is downwards on the screen.
    QVERIFY(path.contains(QPointF(700, 700)));
    QVERIFY(!path.contains(QPointF(700, 300)));
    QVERIFY(!path.contains(QPointF(300, 700)));
    QCOMPARE(QPointF(path.elementAt(0)), QPointF(500, 500));
    QCOMPARE(QPointF(path.elementAt(1)), QPointF(950, 500));
    QCOMPARE(path.currentPosition(), QPointF(500, 500));
    const QRectF bounds = path.boundingRect();
    QVERIFY(qAbs(bounds.right() - 950) < 1e-6 && qAbs(bounds.bottom() - 950) < 1e-6);
    const QRectF circle = KvPieGeometry::slicePath({0.0, 360.0}).boundingRect();
    QVERIFY(qAbs(circle.left() - 50) < 1e-6 && qAbs(circle.top() - 50) < 1e-6);
    QVERIFY(qAbs(circle.width() - 900) < 1e-6 && qAbs(circle.height() - 900) < 1e-6);
}

void KvPieGeometryTest::labelCorner_data()
{
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("span");
    QTest::addColumn<QPointF>("corner");
    // A label of 50 x 30 is moved by (200, -15), which turns with the slice's middle.
    QTest::newRow("middle 0") << -10.0 << 20.0 << QPointF(700, 485);
    QTest::newRow("middle 90") << 0.0 << 180.0 << QPointF(515, 700);
    QTest::newRow("middle 180: full circle") << 0.0 << 360.0 << QPointF(300, 515);
    QTest::newRow("middle 270") << 180.0 << 180.0 << QPointF(485, 300);
}

void KvPieGeometryTest::labelCorner()
{
    QFETCH(double, start);
    QFETCH(double, span);
    QFETCH(QPointF, corner);
    const QTransform transform = KvPieGeometry::labelTransform({start, span}, QSizeF(50, 30));
    QVERIFY((transform.map(QPointF(0, 0)) - corner).manhattanLength() < 1e-6);
}

void KvPieGeometryTest::labelsStayLevel()
{
    for (const double middle : {0.0, 33.0, 90.0, 200.0, 359.0}) {
        const QTransform transform = KvPieGeometry::labelTransform({middle, 0.0}, QSizeF(50, 30));
        const QPointF along = transform.map(QPointF(1, 0)) - transform.map(QPointF(0, 0));
        QVERIFY((along - QPointF(1, 0)).manhattanLength() < 1e-6);
    }
}

STATREPORT_TEST_MAIN(KvPieGeometryTest)
#include "KvPieGeometryTest.moc"
