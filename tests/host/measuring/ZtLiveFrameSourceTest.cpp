// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/FakeLiveSource.h"

class ZtLiveFrameSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void startsAndStops();
    void deliversTheNewestFrame();
    void lastFrameStays();
    void lateFramesOfAnEarlierRunAreLost();
    void countsDroppedFramesOfAllRuns();
    void reportsAndFailures();
    void lostSourceReconnects();
    void cannotBeStarted();
    void stopInAnswerToAFrame();
    void stopInAnswerToTheState();
    void watchdogNoticesSilence();
    void watchdogWaitsLongerForTheFirstFrame();
    void watchdogIsPatientWithABusyProgram();
    void silentSourceComesBack();
    void canDieWithAFrameOnItsWay();
    void measuresTheFrameRate();
};

void ZtLiveFrameSourceTest::startsAndStops()
{
    FakeLiveSource source;
    const QSignalSpy states(&source, SIGNAL(signalStateChanged()));
    QVERIFY(source.isLive());
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
    source.stop();
    QCOMPARE(states.count(), 0);
    source.start();
    source.start();
    QCOMPARE(source.state(), ZtFrameSource::Running);
    QCOMPARE(source.begun, 1);
    QCOMPARE(states.count(), 1);
    const int ended = source.ended;
    source.stop();
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
    QCOMPARE(source.ended, ended + 1);
    QVERIFY(source.mailbox->isClosed());
    QCOMPARE(states.count(), 2);
}

void ZtLiveFrameSourceTest::deliversTheNewestFrame()
{
    FakeLiveSource source;
    const QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    source.start();
    QVERIFY(source.frame().isNull());
    const QImage image = FakeLiveSource::picture(Qt::red);
    source.mailbox->put(FakeLiveSource::picture(Qt::blue));
    source.mailbox->put(image);
    QCOMPARE(frames.count(), 0);
    QCoreApplication::processEvents();
    QCOMPARE(frames.count(), 1);
    QVERIFY(source.frame().constBits() == image.constBits());
    QCOMPARE(source.droppedFrames(), 1ULL);
}

void ZtLiveFrameSourceTest::lastFrameStays()
{
    FakeLiveSource source;
    source.start();
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QCoreApplication::processEvents();
    source.stop();
    QCOMPARE(source.frame(), FakeLiveSource::picture(Qt::red));
    source.start();
    QCOMPARE(source.frame(), FakeLiveSource::picture(Qt::red));
    source.lose(QStringLiteral("gone"));
    QCOMPARE(source.frame(), FakeLiveSource::picture(Qt::red));
}

void ZtLiveFrameSourceTest::lateFramesOfAnEarlierRunAreLost()
{
    FakeLiveSource source;
    const QSignalSpy frames(&source, SIGNAL(signalFrameReady()));
    source.start();
    const std::shared_ptr<ZtFrameMailbox> earlier = source.mailbox;
    earlier->put(FakeLiveSource::picture(Qt::red)); // its event is on its way
    source.stop();
    source.start();
    QVERIFY(source.mailbox != earlier);
    earlier->put(FakeLiveSource::picture(Qt::red));
    earlier->fail(QStringLiteral("late"));
    QCoreApplication::processEvents();
    QCOMPARE(frames.count(), 0);
    QCOMPARE(source.state(), ZtFrameSource::Running);
}

void ZtLiveFrameSourceTest::countsDroppedFramesOfAllRuns()
{
    FakeLiveSource source;
    for (int run = 0; run < 2; ++run) {
        source.start();
        for (int i = 0; i < 3; ++i)
            source.mailbox->put(FakeLiveSource::picture(Qt::red));
        QCoreApplication::processEvents();
        source.stop();
    }
    QCOMPARE(source.droppedFrames(), 4ULL);
}

void ZtLiveFrameSourceTest::reportsAndFailures()
{
    FakeLiveSource source;
    const QSignalSpy faults(&source, SIGNAL(signalFault(QString)));
    source.start();
    source.mailbox->report(QStringLiteral("one"));
    source.mailbox->report(QStringLiteral("two"));
    QCoreApplication::processEvents();
    QCOMPARE(faults.count(), 2);
    QCOMPARE(faults.at(1).at(0).toString(), QStringLiteral("two"));
    QCOMPARE(source.state(), ZtFrameSource::Running);
    source.mailbox->fail(QStringLiteral("gone"));
    QCoreApplication::processEvents();
    QCOMPARE(faults.count(), 3);
    QCOMPARE(faults.at(2).at(0).toString(), QStringLiteral("gone"));
    QCOMPARE(source.state(), ZtFrameSource::Lost);
    QVERIFY(source.mailbox->isClosed());
}

void ZtLiveFrameSourceTest::lostSourceReconnects()
{
    FakeLiveSource source;
    source.start();
    source.lose(QStringLiteral("gone"));
    QCOMPARE(source.state(), ZtFrameSource::Lost);
    source.start();
    QCOMPARE(source.state(), ZtFrameSource::Running);
    QCOMPARE(source.begun, 2);
    QVERIFY(!source.mailbox->isClosed());
    source.lose(QStringLiteral("gone"));
    source.stop();
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
}

void ZtLiveFrameSourceTest::cannotBeStarted()
{
    FakeLiveSource source;
    source.isAbsent = true;
    const QSignalSpy faults(&source, SIGNAL(signalFault(QString)));
    source.start();
    QCOMPARE(source.state(), ZtFrameSource::Lost);
    QCOMPARE(faults.count(), 1);
    QVERIFY(source.mailbox->isClosed());
}

void ZtLiveFrameSourceTest::stopInAnswerToAFrame()
{
    FakeLiveSource source;
    connect(&source, &ZtFrameSource::signalFrameReady, &source, [&source] { source.stop(); });
    const QSignalSpy faults(&source, SIGNAL(signalFault(QString)));
    source.start();
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    source.mailbox->fail(QStringLiteral("gone"));
    QCoreApplication::processEvents();
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
    QCOMPARE(faults.count(), 0);
}

void ZtLiveFrameSourceTest::stopInAnswerToTheState()
{
    FakeLiveSource source;
    connect(&source, &ZtFrameSource::signalStateChanged, &source, [&source] {
        if (source.state() == ZtFrameSource::Running)
            source.stop();
    });
    source.start();
    QCOMPARE(source.state(), ZtFrameSource::Stopped);
    QCOMPARE(source.begun, 0);
}

void ZtLiveFrameSourceTest::watchdogNoticesSilence()
{
    FakeLiveSource source(40);
    QSignalSpy faults(&source, SIGNAL(signalFault(QString)));
    source.start();
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QTRY_COMPARE(source.state(), ZtFrameSource::Lost);
    QCOMPARE(faults.count(), 1);
    QCOMPARE(faults.at(0).at(0).toString(),
             QStringLiteral("Fake has stopped delivering pictures; the last one stays"));
    QCOMPARE(source.frame(), FakeLiveSource::picture(Qt::red));
    // Said once.
    QVERIFY(!faults.wait(200));
}

void ZtLiveFrameSourceTest::watchdogWaitsLongerForTheFirstFrame()
{
    QCOMPARE(FakeLiveSource(2000).watchdogInterval(), ZtLiveFrameSource::defaultWatchdogInterval);
    FakeLiveSource source(400);
    QElapsedTimer clock;
    clock.start();
    source.start();
    QTRY_COMPARE_WITH_TIMEOUT(source.state(), ZtFrameSource::Lost, 20000);
    QVERIFY2(clock.elapsed() >= 400 * (ZtLiveFrameSource::firstFrameFactor - 1),
             qPrintable(QString::number(clock.elapsed())));
}

void ZtLiveFrameSourceTest::watchdogIsPatientWithABusyProgram()
{
    FakeLiveSource source(400);
    source.start();
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QCoreApplication::processEvents();
    // Nobody looks for longer than the interval, and meanwhile no frame comes.
    QThread::msleep(900);
    QCoreApplication::processEvents();
    QCOMPARE(source.state(), ZtFrameSource::Running);
}

void ZtLiveFrameSourceTest::silentSourceComesBack()
{
    FakeLiveSource source(40);
    source.start();
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QTRY_COMPARE(source.state(), ZtFrameSource::Lost);
    source.mailbox->put(FakeLiveSource::picture(Qt::blue));
    QTRY_COMPARE(source.frame(), FakeLiveSource::picture(Qt::blue));
    QCOMPARE(source.begun, 1);
    // Running again, until it is silent again.
    QTRY_COMPARE(source.state(), ZtFrameSource::Lost);
}

void ZtLiveFrameSourceTest::canDieWithAFrameOnItsWay()
{
    std::shared_ptr<ZtFrameMailbox> mailbox;
    {
        FakeLiveSource source;
        source.start();
        mailbox = source.mailbox;
        mailbox->put(FakeLiveSource::picture(Qt::red));
    }
    QVERIFY(mailbox->isClosed());
    mailbox->put(FakeLiveSource::picture(Qt::red));
    QCoreApplication::processEvents();
}

void ZtLiveFrameSourceTest::measuresTheFrameRate()
{
    FakeLiveSource source;
    source.start();
    QCOMPARE(source.frameRate(), 0.0);
    for (int i = 0; i < 3; ++i) {
        source.mailbox->put(FakeLiveSource::picture(Qt::red));
        QCoreApplication::processEvents();
        QThread::msleep(20);
    }
    QVERIFY(source.frameRate() > 2.0);
    QVERIFY(source.frameRate() <= 50.0);
}

STATREPORT_TEST_MAIN(ZtLiveFrameSourceTest)
#include "ZtLiveFrameSourceTest.moc"
