// SPDX-License-Identifier: MIT
#include "KvDeskObjectChanges.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtSignalCenter.h"
#include "support/StatReportTest.h"

namespace {

void createMany()
{
    for (int i = 1; i <= 500; ++i)
        emit ZtSignalCenter::getInstance()->signalObjectCreated(1, i, nullptr);
}

void changeOne()
{
    emit ZtSignalCenter::getInstance()->signalObjectChanged(1, 1, nullptr);
}

void removeOne()
{
    emit ZtSignalCenter::getInstance()->signalObjectRemoved(1, 1);
}

void changeLengthUnit()
{
    emit ZtSignalCenter::getInstance()->signalLengthUnitChanged();
}

void changeAngleUnit()
{
    emit ZtSignalCenter::getInstance()->signalAngleUnitChanged();
}

void changeDigits()
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), 5U);
    ZtAppSettings::endGroup();
}

void changeOtherSetting()
{
    ZtAppSettings::setValue(QStringLiteral("Colour"), QStringLiteral("red"));
}

void changeProfile()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

} // namespace

using Happening = void (*)();
Q_DECLARE_METATYPE(Happening)

class KvDeskObjectChangesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void announcesOnce_data();
    void announcesOnce();
    void isNotPutOff();
};

void KvDeskObjectChangesTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvDeskObjectChangesTest::announcesOnce_data()
{
    QTest::addColumn<Happening>("happening");
    QTest::addColumn<int>("announcements");
    QTest::newRow("many created") << &createMany << 1;
    QTest::newRow("changed") << &changeOne << 1;
    QTest::newRow("removed") << &removeOne << 1;
    QTest::newRow("length unit") << &changeLengthUnit << 1;
    QTest::newRow("angle unit") << &changeAngleUnit << 1;
    QTest::newRow("digits") << &changeDigits << 1;
    QTest::newRow("profile") << &changeProfile << 1;
    QTest::newRow("another setting") << &changeOtherSetting << 0;
}

void KvDeskObjectChangesTest::announcesOnce()
{
    QFETCH(Happening, happening);
    QFETCH(int, announcements);
    KvDeskObjectChanges changes;
    QSignalSpy spy(&changes, SIGNAL(signalChanged()));
    happening();
    QCOMPARE(spy.count(), 0);
    changes.flush();
    QCOMPARE(spy.count(), announcements);
    changes.flush();
    QCOMPARE(spy.count(), announcements);
}

void KvDeskObjectChangesTest::isNotPutOff()
{
    KvDeskObjectChanges changes;
    QSignalSpy spy(&changes, SIGNAL(signalChanged()));
    // Changes without a pause: an update that waits for one would never come.
    QTimer timer;
    connect(&timer, &QTimer::timeout, &changeOne);
    timer.start(1);
    QVERIFY(spy.wait(5000));
}

STATREPORT_TEST_MAIN(KvDeskObjectChangesTest)
#include "KvDeskObjectChangesTest.moc"
