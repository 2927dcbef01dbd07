// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtLimitedDevice.h"
#include "measuring/ZtProgress.h"

#include <QBuffer>

class ZtLimitedDeviceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void endsAtItsLimit();
    void limitBehindTheEnd();
    void limitCanGrow();
    void seeks();
    void cannotBeWritten();
    void tellsHowMuchWasRead();
    void failsWhenItIsNotWantedAnyMore();

private:
    QBuffer m_buffer;
};

void ZtLimitedDeviceTest::init()
{
    StatReportTest::init();
    m_buffer.close();
    m_buffer.setData("0123456789");
    m_buffer.open(QIODevice::ReadOnly);
}

void ZtLimitedDeviceTest::endsAtItsLimit()
{
    ZtLimitedDevice device(&m_buffer, 4);
    QCOMPARE(device.size(), 4LL);
    QCOMPARE(device.read(3), QByteArray("012"));
    QVERIFY(!device.atEnd());
    QVERIFY(!device.isExceeded());
    QCOMPARE(device.read(3), QByteArray("3"));
    QVERIFY(device.isExceeded());
    QVERIFY(device.atEnd());
    QCOMPARE(device.read(3), QByteArray());
}

void ZtLimitedDeviceTest::limitBehindTheEnd()
{
    ZtLimitedDevice device(&m_buffer, 100);
    QCOMPARE(device.size(), 10LL);
    QCOMPARE(device.readAll(), QByteArray("0123456789"));
}

void ZtLimitedDeviceTest::limitCanGrow()
{
    ZtLimitedDevice device(&m_buffer, 2);
    QCOMPARE(device.readAll(), QByteArray("01"));
    device.setLimit(5);
    QCOMPARE(device.readAll(), QByteArray("234"));
}

void ZtLimitedDeviceTest::seeks()
{
    ZtLimitedDevice device(&m_buffer, 5);
    QVERIFY(device.seek(3));
    QCOMPARE(device.peek(1), QByteArray("3"));
    QCOMPARE(device.readAll(), QByteArray("34"));
    QVERIFY(device.seek(5));
    QVERIFY(!device.seek(6));
    QVERIFY(!device.seek(-1));
    QVERIFY(device.seek(0));
    QCOMPARE(device.read(1), QByteArray("0"));
}

void ZtLimitedDeviceTest::cannotBeWritten()
{
    ZtLimitedDevice device(&m_buffer, 5);
    QVERIFY(device.isOpen());
    QVERIFY(!device.isSequential());
    QVERIFY(!device.isWritable());
}

void ZtLimitedDeviceTest::tellsHowMuchWasRead()
{
    ZtProgress progress;
    ZtLimitedDevice device(&m_buffer, 8, &progress);
    QCOMPARE(device.read(3), QByteArray("012"));
    // Of the whole: the limit may grow.
    QCOMPARE(progress.fraction(), 0.3);
    QCOMPARE(device.readAll(), QByteArray("34567"));
    QCOMPARE(progress.fraction(), 0.8);
}

void ZtLimitedDeviceTest::failsWhenItIsNotWantedAnyMore()
{
    ZtProgress progress;
    ZtLimitedDevice device(&m_buffer, 10, &progress);
    QCOMPARE(device.read(2), QByteArray("01"));
    QVERIFY(progress.cancel());
    char byte = 0;
    QCOMPARE(device.read(&byte, 1), -1LL);
    QCOMPARE(progress.fraction(), 0.2);
}

STATREPORT_TEST_MAIN(ZtLimitedDeviceTest)
#include "ZtLimitedDeviceTest.moc"
