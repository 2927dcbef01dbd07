// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtCalibration.h"

#include <limits>

class ZtCalibrationTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void isUncalibratedAtFirst();
    void takesOnlySizesThatAPixelCanHave_data();
    void takesOnlySizesThatAPixelCanHave();
};

void ZtCalibrationTest::isUncalibratedAtFirst()
{
    const ZtCalibration calibration;
    QVERIFY(!calibration.isCalibrated());
    QCOMPARE(calibration.micrometresPerPixel(), 0.0);
    QCOMPARE(calibration.factor(), 1.0);
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
}

STATREPORT_TEST_MAIN(ZtCalibrationTest)
#include "ZtCalibrationTest.moc"
