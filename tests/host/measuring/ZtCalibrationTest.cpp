// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/Polygon.h"
#include "measuring/ZtCalibration.h"

#include <functional>
#include <limits>

using Change = std::function<void(ZtCalibration *)>;
Q_DECLARE_METATYPE(Change)
Q_DECLARE_METATYPE(ZtCalibration)

class ZtCalibrationTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void isUncalibratedAtFirst();
    void takesOnlySizesThatAPixelCanHave_data();
    void takesOnlySizesThatAPixelCanHave();
    void takesBothDirectionsOrNone();
    void mapsToThePlane_data();
    void mapsToThePlane();
    void dateIsUtc();
    void comparesEverything_data();
    void comparesEverything();
    void comparesSizesOfFiles_data();
    void comparesSizesOfFiles();
};

void ZtCalibrationTest::isUncalibratedAtFirst()
{
    const ZtCalibration calibration;
    QVERIFY(!calibration.isCalibrated());
    QCOMPARE(calibration.micrometresPerPixel(), 0.0);
    QCOMPARE(calibration.micrometresPerPixelX(), 0.0);
    QCOMPARE(calibration.micrometresPerPixelY(), 0.0);
    QCOMPARE(calibration.factor(), 1.0);
    QCOMPARE(calibration.aspect(), 1.0);
    QVERIFY(calibration.isSquare());
    QVERIFY(calibration.origin() == ZtCalibration::Origin::Typed);
    QVERIFY(!calibration.date().isValid());
    QCOMPARE(calibration.name() + calibration.objective() + calibration.author() + calibration.note(),
             QString());
}

void ZtCalibrationTest::takesOnlySizesThatAPixelCanHave_data()
{
    QTest::addColumn<double>("size");
    QTest::addColumn<bool>("valid");
    QTest::newRow("usual") << 0.25 << true;
    QTest::newRow("smallest") << std::numeric_limits<double>::denorm_min() << true;
    QTest::newRow("zero") << 0.0 << false;
    QTest::newRow("negative") << -1.0 << false;
    QTest::newRow("infinite") << std::numeric_limits<double>::infinity() << false;
    QTest::newRow("no number") << std::numeric_limits<double>::quiet_NaN() << false;
}

void ZtCalibrationTest::takesOnlySizesThatAPixelCanHave()
{
    QFETCH(double, size);
    QFETCH(bool, valid);
    const ZtCalibration calibration(size);
    QCOMPARE(ZtCalibration::isValidPixelSize(size), valid);
    QCOMPARE(calibration.isCalibrated(), valid);
    QCOMPARE(calibration.factor(), valid ? size : 1.0);
    QCOMPARE(calibration == ZtCalibration(), !valid);
    QCOMPARE(ZtCalibration(1.0, size).isCalibrated(), valid);
    QCOMPARE(ZtCalibration(size, 1.0).isCalibrated(), valid);
}

void ZtCalibrationTest::takesBothDirectionsOrNone()
{
    const ZtCalibration oblong(0.5, 2.0);
    QCOMPARE(oblong.micrometresPerPixel(), 0.5);
    QCOMPARE(oblong.micrometresPerPixelX(), 0.5);
    QCOMPARE(oblong.micrometresPerPixelY(), 2.0);
    QCOMPARE(oblong.factor(), 0.5);
    QCOMPARE(oblong.aspect(), 4.0);
    QVERIFY(!oblong.isSquare());
    QVERIFY(ZtCalibration(0.5).isSquare());
    QCOMPARE(ZtCalibration(0.0, 2.0).micrometresPerPixelY(), 0.0);
}

void ZtCalibrationTest::mapsToThePlane_data()
{
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("y");
    QTest::addColumn<QPointF>("mapped"); // of 10, 10
    QTest::newRow("uncalibrated") << 0.0 << 0.0 << QPointF(10, 10);
    QTest::newRow("square") << 3.0 << 3.0 << QPointF(10, 10);
    QTest::newRow("high pixels") << 1.0 << 2.0 << QPointF(10, 20);
    QTest::newRow("wide pixels") << 2.0 << 1.0 << QPointF(10, 5);
}

void ZtCalibrationTest::mapsToThePlane()
{
    QFETCH(double, x);
    QFETCH(double, y);
    const QPolygonF points = ZtCalibration(x, y).toPlane(polygon({{0, 0}, {10, 10}}));
    QCOMPARE(points.size(), 2);
    QCOMPARE(points.first(), QPointF());
    QTEST(points.last(), "mapped");
}

void ZtCalibrationTest::dateIsUtc()
{
    ZtCalibration calibration(1.0);
    const QDateTime elsewhere(QDate(2026, 1, 31), QTime(12, 0), Qt::OffsetFromUTC, 3600);
    calibration.setDate(elsewhere);
    QCOMPARE(calibration.date().timeSpec(), Qt::UTC);
    QCOMPARE(calibration.date().time(), QTime(11, 0));
}

void ZtCalibrationTest::comparesEverything_data()
{
    QTest::addColumn<Change>("change");
    QTest::addColumn<bool>("hasSameSize");
    const auto row = [](const char *name, bool hasSameSize, const Change &change) {
        QTest::newRow(name) << change << hasSameSize;
    };
    row("size in x", false, [](ZtCalibration *c) { *c = ZtCalibration(1.5, 2.0); });
    row("size in y", false, [](ZtCalibration *c) { *c = ZtCalibration(1.0, 2.5); });
    row("name", true, [](ZtCalibration *c) { c->setName(QStringLiteral("a")); });
    row("objective", true, [](ZtCalibration *c) { c->setObjective(QStringLiteral("a")); });
    row("author", true, [](ZtCalibration *c) { c->setAuthor(QStringLiteral("a")); });
    row("note", true, [](ZtCalibration *c) { c->setNote(QStringLiteral("a")); });
    row("date", true, [](ZtCalibration *c) { c->setDate(QDateTime::currentDateTimeUtc()); });
    row("origin", true, [](ZtCalibration *c) { c->setOrigin(ZtCalibration::Origin::Metadata); });
}

void ZtCalibrationTest::comparesEverything()
{
    QFETCH(Change, change);
    QFETCH(bool, hasSameSize);
    const ZtCalibration before(1.0, 2.0);
    ZtCalibration after = before;
    QVERIFY(after == before);
    change(&after);
    QVERIFY(after != before);
    QCOMPARE(after.hasSamePixelSize(before), hasSameSize);
}

void ZtCalibrationTest::comparesSizesOfFiles_data()
{
    QTest::addColumn<ZtCalibration>("a");
    QTest::addColumn<ZtCalibration>("b");
    QTest::addColumn<bool>("isNear");
    QTest::newRow("both uncalibrated") << ZtCalibration() << ZtCalibration() << true;
    QTest::newRow("one uncalibrated") << ZtCalibration(1.0) << ZtCalibration() << false;
    QTest::newRow("rounded") << ZtCalibration(0.65, 0.65) << ZtCalibration(0.6504, 0.6496) << true;
    QTest::newRow("other in x") << ZtCalibration(0.65, 0.65) << ZtCalibration(0.652, 0.65) << false;
    QTest::newRow("other in y") << ZtCalibration(0.65, 0.65) << ZtCalibration(0.65, 0.648) << false;
}

void ZtCalibrationTest::comparesSizesOfFiles()
{
    QFETCH(ZtCalibration, a);
    QFETCH(ZtCalibration, b);
    QTEST(a.hasNearlySamePixelSize(b), "isNear");
    QTEST(b.hasNearlySamePixelSize(a), "isNear");
}

STATREPORT_TEST_MAIN(ZtCalibrationTest)
#include "ZtCalibrationTest.moc"
