// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/cameraimage/KvCameraOverlayHold.h"
#include "data/KvReportKernelData.h"

class KvCameraOverlayHoldTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isNotHeldAtFirst();
    void isHeldOnceAtMost();
    void endsWithItsObject();
    void severalAreCounted();
    void survivesTheAdapter();
    void needsNoAdapter();
};

void KvCameraOverlayHoldTest::isNotHeldAtFirst()
{
    KvReportKernelData data;
    const KvCameraOverlayHold hold(&data);
    QVERIFY(!data.isCameraImageWithDataWanted());
}

void KvCameraOverlayHoldTest::isHeldOnceAtMost()
{
    KvReportKernelData data;
    KvCameraOverlayHold hold(&data);
    hold.setHeld(true);
    hold.setHeld(true);
    QVERIFY(data.isCameraImageWithDataWanted());
    hold.setHeld(false);
    QVERIFY(!data.isCameraImageWithDataWanted());
    hold.setHeld(false); // takes nobody else's wish away
    data.setCameraImageWithDataWanted(true);
    hold.setHeld(false);
    QVERIFY(data.isCameraImageWithDataWanted());
}

void KvCameraOverlayHoldTest::endsWithItsObject()
{
    KvReportKernelData data;
    {
        KvCameraOverlayHold hold(&data);
        hold.setHeld(true);
        QVERIFY(data.isCameraImageWithDataWanted());
    }
    QVERIFY(!data.isCameraImageWithDataWanted());
}

void KvCameraOverlayHoldTest::severalAreCounted()
{
    KvReportKernelData data;
    KvCameraOverlayHold first(&data);
    first.setHeld(true);
    {
        KvCameraOverlayHold second(&data);
        second.setHeld(true);
        first.setHeld(false);
        QVERIFY(data.isCameraImageWithDataWanted());
    }
    QVERIFY(!data.isCameraImageWithDataWanted());
}

void KvCameraOverlayHoldTest::survivesTheAdapter()
{
    auto data = std::make_unique<KvReportKernelData>();
    KvCameraOverlayHold hold(data.get());
    hold.setHeld(true);
    data.reset();
    hold.setHeld(false);
    hold.setHeld(true);
}

void KvCameraOverlayHoldTest::needsNoAdapter()
{
    KvCameraOverlayHold hold(nullptr);
    hold.setHeld(true);
    hold.setHeld(false);
}

STATREPORT_TEST_MAIN(KvCameraOverlayHoldTest)
#include "KvCameraOverlayHoldTest.moc"
