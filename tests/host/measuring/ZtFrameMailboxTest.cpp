// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFrameMailbox.h"

#include <QThread>

#include <atomic>
#include <memory>

namespace {

QImage picture(int number)
{
    QImage image(2, 1, QImage::Format_RGB32);
    image.fill(static_cast<uint>(number));
    return image;
}

/// Notes the events that it gets.
class Receiver : public QObject
{
public:
    bool event(QEvent *event) override
    {
        order.append(event->type() == ZtFrameMailbox::eventType()    ? QStringLiteral("frame")
                     : event->type() == ZtFrameMailbox::noticeType() ? QStringLiteral("notice")
                                                                     : QStringLiteral("input"));
        return true;
    }

    QStringList order;
};

} // namespace

class ZtFrameMailboxTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void holdsTheNewestFrame();
    void sharesThePixels();
    void announcesOnceUntilTaken();
    void frameComesAfterInput();
    void keepsAllReports();
    void noticesAreSentEach();
    void nothingComesAfterClosing();
    void closingEndsAWait();
    void framesOfABusyWorker();
};

void ZtFrameMailboxTest::holdsTheNewestFrame()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    QVERIFY(mailbox.takeFrame().isNull());
    mailbox.put(picture(1));
    mailbox.put(picture(2));
    mailbox.put(picture(3));
    QCOMPARE(mailbox.takeFrame(), picture(3));
    QVERIFY(mailbox.takeFrame().isNull());
    QCOMPARE(mailbox.received(), 3ULL);
    QCOMPARE(mailbox.dropped(), 2ULL);
    mailbox.put(picture(4));
    QCOMPARE(mailbox.dropped(), 2ULL);
    mailbox.close();
}

void ZtFrameMailboxTest::sharesThePixels()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    const QImage image = picture(1);
    mailbox.put(image);
    QVERIFY(mailbox.takeFrame().constBits() == image.constBits());
    mailbox.close();
}

void ZtFrameMailboxTest::announcesOnceUntilTaken()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    for (int i = 0; i < 1000; ++i)
        mailbox.put(picture(i));
    QCoreApplication::sendPostedEvents();
    QCOMPARE(receiver.order, QStringList{QStringLiteral("frame")});
    mailbox.takeFrame();
    mailbox.put(picture(0));
    QCoreApplication::sendPostedEvents();
    QCOMPARE(receiver.order.size(), 2);
    mailbox.close();
}

void ZtFrameMailboxTest::frameComesAfterInput()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    mailbox.put(picture(1));
    QCoreApplication::postEvent(&receiver, new QEvent(QEvent::User));
    QCoreApplication::sendPostedEvents();
    QCOMPARE(receiver.order, QStringList({QStringLiteral("input"), QStringLiteral("frame")}));
    mailbox.close();
}

void ZtFrameMailboxTest::keepsAllReports()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    mailbox.report(QStringLiteral("one"));
    mailbox.report(QStringLiteral("two"));
    mailbox.fail(QStringLiteral("end"));
    QCoreApplication::sendPostedEvents();
    QCOMPARE(receiver.order.size(), 1);
    QCOMPARE(mailbox.takeReports(), QStringList({QStringLiteral("one"), QStringLiteral("two")}));
    QVERIFY(mailbox.takeReports().isEmpty());
    QCOMPARE(mailbox.takeFailure(), QStringLiteral("end"));
    QVERIFY(mailbox.takeFailure().isEmpty());
    mailbox.close();
}

void ZtFrameMailboxTest::noticesAreSentEach()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    mailbox.notify();
    mailbox.close();
    mailbox.notify();
    QCoreApplication::sendPostedEvents();
    QCOMPARE(receiver.order, QStringList{QStringLiteral("notice")});
}

void ZtFrameMailboxTest::nothingComesAfterClosing()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    mailbox.put(picture(1));
    QCoreApplication::sendPostedEvents();
    mailbox.close();
    QVERIFY(mailbox.isClosed());
    QVERIFY(mailbox.takeFrame().isNull());
    mailbox.put(picture(2));
    mailbox.report(QStringLiteral("late"));
    mailbox.fail(QStringLiteral("late"));
    QCoreApplication::sendPostedEvents();
    QCOMPARE(receiver.order.size(), 1);
    QVERIFY(mailbox.takeFrame().isNull());
    QCOMPARE(mailbox.received(), 1ULL);
}

void ZtFrameMailboxTest::closingEndsAWait()
{
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    QVERIFY(!mailbox.waitForClose(0));
    QVERIFY(!mailbox.waitForClose(1));
    std::atomic_bool isClosed{false};
    const std::unique_ptr<QThread> worker(
        QThread::create([&] { isClosed = mailbox.waitForClose(60 * 1000); }));
    worker->start();
    mailbox.close();
    QVERIFY(worker->wait(10 * 1000));
    QVERIFY(isClosed);
}

void ZtFrameMailboxTest::framesOfABusyWorker()
{
    constexpr int count = 5000;
    Receiver receiver;
    ZtFrameMailbox mailbox(&receiver);
    const std::unique_ptr<QThread> worker(QThread::create([&] {
        for (int i = 1; i <= count; ++i)
            mailbox.put(picture(i));
    }));
    worker->start();
    quint64 taken = 0;
    QRgb newest = 0;
    bool isInOrder = true;
    while (newest != count) {
        const QImage frame = mailbox.takeFrame();
        if (frame.isNull())
            continue;
        ++taken;
        const QRgb number = frame.pixel(0, 0) & 0xFFFFFFU;
        isInOrder = isInOrder && number > newest;
        newest = number;
    }
    QVERIFY(worker->wait(10 * 1000));
    QVERIFY(isInOrder);
    QCOMPARE(taken + mailbox.dropped(), quint64(count));
    mailbox.close();
}

STATREPORT_TEST_MAIN(ZtFrameMailboxTest)
#include "ZtFrameMailboxTest.moc"
