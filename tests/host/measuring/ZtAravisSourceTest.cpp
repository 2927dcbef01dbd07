// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"
#include "measuring/ZtAravisSource.h"
#include "measuring/ZtKernelImage.h"

namespace {

ZtFrameSourceInfo fakeCamera()
{
    return {ZtFrameSourceInfo::GenicamCamera, QString::fromLatin1(ZtAravisSource::fakeCameraId),
            QStringLiteral("Test camera")};
}

} // namespace

class ZtAravisSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();

    void isListed();
    void streams();
    void stops();
    void startsAgain();
    void unplugged();
    void reconnects();
    void isLostWhenAbsent();
    void exposure();
    void speed();
    void diesWhileStreaming();
    void twoAtATime();
};

void ZtAravisSourceTest::initTestCase()
{
    ZtAravisSource::enableFakeCamera();
}

void ZtAravisSourceTest::isListed()
{
    const QVector<ZtFrameSourceInfo> devices = ZtAravisSource::devices();
    const int index = devices.indexOf(fakeCamera());
    QVERIFY(index >= 0);
    QVERIFY2(devices.at(index).title.startsWith(QLatin1String("Aravis Fake")),
             qPrintable(devices.at(index).title));
}

void ZtAravisSourceTest::streams()
{
    ZtAravisSource source(fakeCamera());
    QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    QCOMPARE(source.displayName(), QStringLiteral("Test camera"));
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
    QVERIFY(source.isLive());
    source.start();
    QCOMPARE(source.state(), ZtFrameSource::Running);
    QTRY_VERIFY_WITH_TIMEOUT(frames.count() >= 5, 20000);
    const QImage frame = source.frame();
    QCOMPARE(frame.size(), QSize(512, 512));
    QCOMPARE(frame.format(), QImage::Format_RGB32);
    QVERIFY(source.frameRate() > 1.0);
    QVERIFY(source.frameRate() < 40.0);
    // The pattern moves.
    QTRY_VERIFY(source.frame() != frame);
}

void ZtAravisSourceTest::stops()
{
    ZtAravisSource source(fakeCamera());
    QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    source.start();
    QVERIFY(frames.wait(20000));
    source.stop();
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
    frames.clear();
    QVERIFY(!frames.wait(200));
    QVERIFY(!source.frame().isNull());
}

void ZtAravisSourceTest::startsAgain()
{
    ZtAravisSource source(fakeCamera());
    QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    for (int run = 0; run < 5; ++run) {
        source.start();
        QVERIFY(frames.wait(20000));
        source.stop();
    }
    // Started and stopped before the camera is open.
    for (int run = 0; run < 20; ++run) {
        source.start();
        source.stop();
    }
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
}

void ZtAravisSourceTest::unplugged()
{
    ZtAravisSource source(fakeCamera());
    ZtKernelImage image;
    image.setSource(&source);
    QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    ZtStatusLog::getInstance()->clear();
    source.start();
    QVERIFY(frames.wait(20000));
    source.simulateUnplugging();
    QTRY_COMPARE(source.state(), ZtFrameSource::Lost);
    QVERIFY(!image.frame().isNull());
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    QCOMPARE(ZtStatusLog::getInstance()->entries().first().message,
             QStringLiteral("Test camera is disconnected; its last picture stays"));
}

void ZtAravisSourceTest::reconnects()
{
    ZtAravisSource source(fakeCamera());
    QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    source.start();
    QVERIFY(frames.wait(20000));
    source.simulateUnplugging();
    QTRY_COMPARE(source.state(), ZtFrameSource::Lost);
    frames.clear();
    source.start();
    QCOMPARE(source.state(), ZtFrameSource::Running);
    QVERIFY(frames.wait(20000));
}

void ZtAravisSourceTest::isLostWhenAbsent()
{
    ZtAravisSource source(
        {ZtFrameSourceInfo::GenicamCamera, QStringLiteral("Nobody-1"), QStringLiteral("Nobody")});
    QSignalSpy faults(&source, SIGNAL(signalFault(QString)));
    source.start();
    QVERIFY(faults.wait(20000));
    QCOMPARE(source.state(), ZtFrameSource::Lost);
    QVERIFY2(faults.at(0).at(0).toString().startsWith(QLatin1String("Nobody cannot be opened (")),
             qPrintable(faults.at(0).at(0).toString()));
}

void ZtAravisSourceTest::exposure()
{
    ZtAravisSource source(fakeCamera());
    QSignalSpy changes(&source, SIGNAL(signalExposureChanged()));
    QVERIFY(!source.exposureRange());
    QCOMPARE(source.exposure(), 0.0);
    source.start();
    QVERIFY(changes.wait(20000));
    QVERIFY(source.exposureRange());
    QCOMPARE(source.exposureRange()->minimum, 0.01);
    QCOMPARE(source.exposureRange()->maximum, 10000.0);
    QVERIFY(source.exposure() > 0.0);
    source.setExposure(2.5);
    QTRY_COMPARE(source.exposure(), 2.5);
    // The nearest one.
    source.setExposure(1e9);
    QTRY_COMPARE(source.exposure(), 10000.0);
    source.setExposure(2.5);
    QTRY_COMPARE(source.exposure(), 2.5);
    QVERIFY(changes.count() >= 3);
}

void ZtAravisSourceTest::speed()
{
    ZtAravisSource source(fakeCamera());
    QSignalSpy changes(&source, SIGNAL(signalExposureChanged()));
    QCOMPARE(source.framesPerSecond(), 0.0);
    source.start();
    QVERIFY(changes.wait(20000));
    source.setFramesPerSecond(10.0);
    QTRY_VERIFY(qAbs(source.framesPerSecond() - 10.0) < 0.1);
    QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    QTRY_VERIFY_WITH_TIMEOUT(frames.count() >= 12, 20000);
    QVERIFY2(source.frameRate() < 15.0, qPrintable(QString::number(source.frameRate())));
    source.setFramesPerSecond(25.0);
    QTRY_VERIFY(qAbs(source.framesPerSecond() - 25.0) < 0.1);
}

void ZtAravisSourceTest::diesWhileStreaming()
{
    for (int run = 0; run < 5; ++run) {
        ZtAravisSource source(fakeCamera());
        QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
        source.start();
        if (run > 0)
            QVERIFY(frames.wait(20000));
    }
    QCoreApplication::processEvents();
}

void ZtAravisSourceTest::twoAtATime()
{
    ZtAravisSource one(fakeCamera());
    ZtAravisSource other(fakeCamera());
    QSignalSpy frames(&one, SIGNAL(signalFrameReady()));
    QSignalSpy otherFrames(&other, SIGNAL(signalFrameReady()));
    one.start();
    other.start();
    QTRY_VERIFY_WITH_TIMEOUT(frames.count() > 1 && otherFrames.count() > 1, 20000);
}

STATREPORT_TEST_MAIN(ZtAravisSourceTest)
#include "ZtAravisSourceTest.moc"
