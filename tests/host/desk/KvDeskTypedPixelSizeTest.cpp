// SPDX-License-Identifier: MIT
#include "KvDeskTypedPixelSize.h"

#include "KvDeskNumberBox.h"
#include "KvDeskResources.h"
#include "support/StatReportTest.h"

class KvDeskTypedPixelSizeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void linkedSizesAreEqual();
    void unlinkedSizesAreApart();
    void linkingAgainMakesThemEqual();
    void missingNumbersCalibrateNothing();
    void showsAPixelSize();
    void fieldsSayWhatIsWrong();
    void linkedSizeSaysNothingOfItsOwn();
    void fieldsHaveNames();
};

void KvDeskTypedPixelSizeTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
}

void KvDeskTypedPixelSizeTest::linkedSizesAreEqual()
{
    KvDeskTypedPixelSize way;
    QVERIFY(way.linkButton()->isChecked());
    QVERIFY(!way.yBox()->isEnabled());
    QSignalSpy changed(&way, SIGNAL(signalChanged()));
    QTest::keyClicks(way.xBox(), QStringLiteral("0,5"));
    QVERIFY(changed.count() > 0);
    QVERIFY(way.calibration() == ZtCalibration(0.5));
    QVERIFY(way.calibration().origin() == ZtCalibration::Origin::Typed);
}

void KvDeskTypedPixelSizeTest::unlinkedSizesAreApart()
{
    KvDeskTypedPixelSize way;
    way.linkButton()->click();
    QVERIFY(way.yBox()->isEnabled());
    QTest::keyClicks(way.xBox(), QStringLiteral("0.5"));
    QVERIFY(!way.calibration().isCalibrated());
    QTest::keyClicks(way.yBox(), QStringLiteral("2"));
    QVERIFY(way.calibration() == ZtCalibration(0.5, 2.0));
}

void KvDeskTypedPixelSizeTest::linkingAgainMakesThemEqual()
{
    KvDeskTypedPixelSize way;
    way.setPixelSize(ZtCalibration(0.5, 2.0));
    way.linkButton()->click();
    QVERIFY(way.calibration() == ZtCalibration(0.5));
}

void KvDeskTypedPixelSizeTest::missingNumbersCalibrateNothing()
{
    const KvDeskTypedPixelSize way;
    QVERIFY(!way.calibration().isCalibrated());
}

void KvDeskTypedPixelSizeTest::showsAPixelSize()
{
    KvDeskTypedPixelSize way;
    way.setPixelSize(ZtCalibration(0.5, 2.0));
    QVERIFY(!way.linkButton()->isChecked());
    QCOMPARE(way.xBox()->text(), QStringLiteral("0.5"));
    QCOMPARE(way.yBox()->text(), QStringLiteral("2"));
    way.setPixelSize(ZtCalibration(3.0));
    QVERIFY(way.linkButton()->isChecked());
    QCOMPARE(way.yBox()->text(), QStringLiteral("3"));
}

void KvDeskTypedPixelSizeTest::fieldsSayWhatIsWrong()
{
    KvDeskTypedPixelSize way;
    way.linkButton()->click();
    QTest::keyClicks(way.xBox(), QStringLiteral("2"));
    QTest::keyClicks(way.yBox(), QStringLiteral("1.234,5"));
    QVERIFY(!way.calibration().isCalibrated());
    QCOMPARE(way.fault(), QStringLiteral("Type a number such as 5.3 or 5,3"));
    QCOMPARE(way.xBox()->fault(), QString());
    QCOMPARE(way.yBox()->fault(), way.fault());
    way.yBox()->setValue(3.0);
    QCOMPARE(way.fault(), QString());
    QVERIFY(way.calibration() == ZtCalibration(2.0, 3.0));
}

void KvDeskTypedPixelSizeTest::linkedSizeSaysNothingOfItsOwn()
{
    KvDeskTypedPixelSize way;
    QTest::keyClicks(way.xBox(), QStringLiteral("5"));
    QTest::keyClicks(way.xBox(), QStringLiteral("e9"));
    QVERIFY(!way.fault().isEmpty());
    QCOMPARE(way.yBox()->text(), QString());
    QCOMPARE(way.yBox()->fault(), QString());
    way.linkButton()->click();
    QTest::keyClicks(way.yBox(), QStringLiteral("x"));
    QVERIFY(!way.yBox()->fault().isEmpty());
    way.linkButton()->click();
    QCOMPARE(way.yBox()->fault(), QString());
    QVERIFY(!way.yBox()->isEnabled());
    QCOMPARE(way.yBox()->toolTip(), QStringLiteral("Same size in both directions"));
}

void KvDeskTypedPixelSizeTest::fieldsHaveNames()
{
    const KvDeskTypedPixelSize way;
    QCOMPARE(way.xBox()->accessibleName(), QStringLiteral("Width of a pixel in micrometres"));
    QCOMPARE(way.yBox()->accessibleName(), QStringLiteral("Height of a pixel in micrometres"));
    QCOMPARE(way.linkButton()->toolTip(), QStringLiteral("Same size in both directions"));
    QVERIFY(!way.linkButton()->icon().isNull());
}

STATREPORT_TEST_MAIN(KvDeskTypedPixelSizeTest)
#include "KvDeskTypedPixelSizeTest.moc"
