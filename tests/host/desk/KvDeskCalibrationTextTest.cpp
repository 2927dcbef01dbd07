// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationText.h"

#include "support/RightToLeft.h"
#include "support/StatReportTest.h"

#include <QLocale>

Q_DECLARE_METATYPE(ZtCalibration)

class KvDeskCalibrationTextTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void pixelSizes_data();
    void pixelSizes();
    void origins();
    void summaries();
};

void KvDeskCalibrationTextTest::pixelSizes_data()
{
    QTest::addColumn<ZtCalibration>("calibration");
    QTest::addColumn<QString>("text");
    QTest::newRow("uncalibrated") << ZtCalibration() << QString();
    QTest::newRow("square") << ZtCalibration(0.5) << QStringLiteral("0.5 μm");
    QTest::newRow("rounded") << ZtCalibration(2.0 / 3.0) << QStringLiteral("0.66667 μm");
    QTest::newRow("oblong") << ZtCalibration(0.5, 0.25) << QStringLiteral("0.5 × 0.25 μm");
    QTest::newRow("hardly oblong") << ZtCalibration(0.5, 0.500000001) << QStringLiteral("0.5 μm");
}

void KvDeskCalibrationTextTest::pixelSizes()
{
    QFETCH(ZtCalibration, calibration);
    QTEST(KvDeskCalibrationText::pixelSize(calibration), "text");
    // Number and unit keep their order.
    const RightToLeft arabic;
    QFETCH(QString, text);
    QCOMPARE(KvDeskCalibrationText::pixelSize(calibration),
             text.isEmpty() ? text : RightToLeft::isolated(text));
}

void KvDeskCalibrationTextTest::origins()
{
    using Origin = ZtCalibration::Origin;
    QCOMPARE(KvDeskCalibrationText::origin(Origin::KnownDistance), QStringLiteral("Known distance"));
    QCOMPARE(KvDeskCalibrationText::origin(Origin::Metadata), QStringLiteral("Image file"));
    QCOMPARE(KvDeskCalibrationText::origin(Origin::Typed), QStringLiteral("Typed"));
}

void KvDeskCalibrationTextTest::summaries()
{
    QCOMPARE(KvDeskCalibrationText::summary(ZtCalibration()), QStringLiteral("Not calibrated"));
    ZtCalibration calibration(0.5);
    QCOMPARE(KvDeskCalibrationText::summary(calibration), QStringLiteral("0.5 μm, Typed"));
    QCOMPARE(KvDeskCalibrationText::date(calibration.date()), QString());
    calibration.setObjective(QStringLiteral("10x"));
    calibration.setAuthor(QStringLiteral("A. Smith"));
    calibration.setDate(QDateTime(QDate(2026, 1, 31), QTime(12, 0), Qt::UTC));
    const QString date = QLocale().toString(calibration.date().toLocalTime(), QLocale::ShortFormat);
    QCOMPARE(KvDeskCalibrationText::date(calibration.date()), date);
    QCOMPARE(KvDeskCalibrationText::summary(calibration),
             QStringLiteral("0.5 μm, 10x, Typed, A. Smith, ") + date);
}

STATREPORT_TEST_MAIN(KvDeskCalibrationTextTest)
#include "KvDeskCalibrationTextTest.moc"
