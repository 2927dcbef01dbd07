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
