// SPDX-License-Identifier: MIT
#include "KvDeskFilePixelSize.h"

#include "CalibratedDesk.h"

class KvDeskFilePixelSizeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void saysWhatTheFileStates();
};

void KvDeskFilePixelSizeTest::saysWhatTheFileStates()
{
    CalibratedDesk desk;
    KvDeskFilePixelSize way(&desk.calibrator);
    QCOMPARE(way.text(), QStringLiteral("The image's file does not state how large its pixels are."));
    QVERIFY(!way.calibration().isCalibrated());
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("<b>oblong.png"), 10.0, 20.0)));
    QSignalSpy changed(&way, SIGNAL(signalChanged()));
    way.refresh();
    QCOMPARE(changed.count(), 1);
    QCOMPARE(way.text(), QStringLiteral("<b>oblong.png states pixels of 10 × 20 μm."));
    QVERIFY(way.calibration().hasSamePixelSize(ZtCalibration(10.0, 20.0)));
    QVERIFY(way.calibration().origin() == ZtCalibration::Origin::Metadata);
}

STATREPORT_TEST_MAIN(KvDeskFilePixelSizeTest)
#include "KvDeskFilePixelSizeTest.moc"
