// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtUvcCameraSource.h"

class ZtUvcCameraSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void listsCamerasOnly();
    void isLostWhenAbsent();
    void hasNoExposureWithoutACamera();
};

void ZtUvcCameraSourceTest::listsCamerasOnly()
{
    // Whatever is connected to this computer.
    const QVector<ZtFrameSourceInfo> devices = ZtUvcCameraSource::devices();
    for (const ZtFrameSourceInfo &device : devices) {
        QCOMPARE(device.kind, ZtFrameSourceInfo::UvcCamera);
        QVERIFY(!device.id.isEmpty());
    }
}

void ZtUvcCameraSourceTest::isLostWhenAbsent()
{
    ZtUvcCameraSource source(
        {ZtFrameSourceInfo::UvcCamera, QStringLiteral("/dev/no-such-camera"), QStringLiteral("Nobody")});
    const QSignalSpy faults(&source, SIGNAL(signalFault(QString)));
    QCOMPARE(source.displayName(), QStringLiteral("Nobody"));
    for (int run = 1; run < 3; ++run) {
        source.start();
        QCOMPARE(source.state(), ZtFrameSource::Lost);
        QCOMPARE(faults.count(), run);
        QCOMPARE(faults.last().at(0).toString(), QStringLiteral("Nobody is not connected"));
    }
    source.stop();
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
}

void ZtUvcCameraSourceTest::hasNoExposureWithoutACamera()
{
    ZtUvcCameraSource source(
        {ZtFrameSourceInfo::UvcCamera, QStringLiteral("/dev/no-such-camera"), QStringLiteral("Nobody")});
    QVERIFY(!source.exposureRange());
    QCOMPARE(source.exposure(), 0.0);
    source.setExposure(10.0);
    QCOMPARE(source.exposure(), 0.0);
}

STATREPORT_TEST_MAIN(ZtUvcCameraSourceTest)
#include "ZtUvcCameraSourceTest.moc"
