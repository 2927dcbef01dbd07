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
    void tellsWhatChanged();
    void emptiedTypesAreTold();
    void changesOfReceiversComeNext();

public slots:
    void slotChanged();

private:
    KvDeskObjectChanges *m_changes = nullptr;
    QVector<KvDeskObjectChanges::Batch> m_batches;
    bool m_answers = false; ///< with another change
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

void KvDeskObjectChangesTest::slotChanged()
{
    m_batches.append(m_changes->batch());
    if (m_batches.size() == 1 && m_answers)
        emit ZtSignalCenter::getInstance()->signalObjectChanged(3, 4, nullptr);
}

void KvDeskObjectChangesTest::tellsWhatChanged()
{
    KvDeskObjectChanges changes;
    m_changes = &changes;
    m_batches.clear();
    connect(&changes, SIGNAL(signalChanged()), this, SLOT(slotChanged()));
    changeOne();
    changeOne();
    emit ZtSignalCenter::getInstance()->signalObjectCreated(2, 5, nullptr);
    changes.flush();
    changeLengthUnit();
    changes.flush();
    QCOMPARE(m_batches.size(), 2);
    QCOMPARE(m_batches.at(0).objects, QSet<KvDeskObjectId>({{1, 1}, {2, 5}}));
    QVERIFY(!m_batches.at(0).isReadingChanged);
    QVERIFY(m_batches.at(1).objects.isEmpty());
    QVERIFY(m_batches.at(1).isReadingChanged);
    QVERIFY(changes.batch().objects.isEmpty());
}

void KvDeskObjectChangesTest::emptiedTypesAreTold()
{
    KvDeskObjectChanges changes;
    m_changes = &changes;
    m_batches.clear();
    connect(&changes, SIGNAL(signalChanged()), this, SLOT(slotChanged()));
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    kernel->addObject(1, std::make_unique<ZtKernelObjectData>());
    kernel->addObject(1, std::make_unique<ZtKernelObjectData>());
    kernel->removeObject(1, 1);
    changes.flush();
    kernel->removeObject(1, 2);
    kernel->addObject(1, std::make_unique<ZtKernelObjectData>());
    changes.flush();
    kernel->clearObjects();
    QCOMPARE(m_batches.size(), 2);
    QVERIFY(m_batches.at(0).emptiedTypes.isEmpty());
    QCOMPARE(m_batches.at(1).emptiedTypes, QSet<int>({1}));
}

void KvDeskObjectChangesTest::changesOfReceiversComeNext()
{
    KvDeskObjectChanges changes;
    m_changes = &changes;
    m_batches.clear();
    connect(&changes, SIGNAL(signalChanged()), this, SLOT(slotChanged()));
    m_answers = true;
    changeOne();
    changes.flush();
    m_answers = false;
    changes.flush();
    QCOMPARE(m_batches.size(), 2);
    QCOMPARE(m_batches.at(1).objects, QSet<KvDeskObjectId>({{3, 4}}));
}

STATREPORT_TEST_MAIN(KvDeskObjectChangesTest)
#include "KvDeskObjectChangesTest.moc"
