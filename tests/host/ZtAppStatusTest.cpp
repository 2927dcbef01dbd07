// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"

class ZtAppStatusTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init()
    {
        StatReportTest::init();
        ZtStatusLog::getInstance()->setCapacity(10000);
        ZtStatusLog::getInstance()->clear();
    }

    void numbersAreFixed_data();
    void numbersAreFixed();
    void startsWithWhatItWasGiven();
    void settingAStatusLogsIt();
    void nothingIsLoggedBeforeAStatusIsSet();
    void theNewestEntriesAreKept_data();
    void theNewestEntriesAreKept();
    void loweringTheCapacityDropsTheOldest();
    void clearingSaysSoOnce();
};

void ZtAppStatusTest::numbersAreFixed_data()
{
    QTest::addColumn<int>("number");
    QTest::addColumn<int>("expected");
    QTest::newRow("no category") << int(ZtAppStatus::NoCategory) << 0;
    QTest::newRow("information") << int(ZtAppStatus::Information) << 1;
    QTest::newRow("warning") << int(ZtAppStatus::Warning) << 2;
    QTest::newRow("error") << int(ZtAppStatus::Error) << 3;
    QTest::newRow("any destination") << int(ZtAppStatus::AnyDestination) << 0;
    QTest::newRow("log file") << int(ZtAppStatus::LogFile) << 1;
    QTest::newRow("status bar") << int(ZtAppStatus::StatusBar) << 2;
    QTest::newRow("message box") << int(ZtAppStatus::MessageBox) << 3;
    QTest::newRow("status panel") << int(ZtAppStatus::StatusPanel) << 4;
}

void ZtAppStatusTest::numbersAreFixed()
{
    QFETCH(int, number);
    QTEST(number, "expected");
}

void ZtAppStatusTest::startsWithWhatItWasGiven()
{
    const ZtAppStatus empty;
    QCOMPARE(empty.category(), int(ZtAppStatus::NoCategory));
    QCOMPARE(empty.code(), 0);
    QCOMPARE(empty.preferredDestination(), int(ZtAppStatus::AnyDestination));
    QVERIFY(empty.message().isEmpty());

    const ZtAppStatus status(ZtAppStatus::Warning, 17);
    QCOMPARE(status.category(), int(ZtAppStatus::Warning));
    QCOMPARE(status.code(), 17);
}

void ZtAppStatusTest::settingAStatusLogsIt()
{
    QSignalSpy logged(ZtStatusLog::getInstance(), SIGNAL(signalEntryLogged(ZtStatusEntry)));
    const QDateTime before = QDateTime::currentDateTime();

    ZtAppStatus status(ZtAppStatus::Information, 1);
    status.setPreferredDestination(ZtAppStatus::StatusPanel);
    status.setAndLogStatus(ZtAppStatus::Error, 5, QStringLiteral("No space left"),
                           QStringLiteral("Writer::write"));

    QCOMPARE(status.category(), int(ZtAppStatus::Error));
    QCOMPARE(status.code(), 5);
    QCOMPARE(status.message(), QStringLiteral("No space left"));
    QCOMPARE(logged.count(), 1);
    const auto entry = logged.at(0).at(0).value<ZtStatusEntry>();
    QCOMPARE(entry.category, int(ZtAppStatus::Error));
    QCOMPARE(entry.code, 5);
    QCOMPARE(entry.destination, int(ZtAppStatus::StatusPanel));
    QCOMPARE(entry.message, QStringLiteral("No space left"));
    QCOMPARE(entry.source, QStringLiteral("Writer::write"));
    QVERIFY(entry.time >= before);
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    QCOMPARE(ZtStatusLog::getInstance()->entries().constFirst().message, entry.message);
}

void ZtAppStatusTest::nothingIsLoggedBeforeAStatusIsSet()
{
    ZtAppStatus status(ZtAppStatus::Error, 3);
    status.setPreferredDestination(ZtAppStatus::MessageBox);
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void ZtAppStatusTest::theNewestEntriesAreKept_data()
{
    QTest::addColumn<int>("capacity");
    QTest::addColumn<int>("logged");
    QTest::addColumn<int>("kept");
    QTest::newRow("room for all") << 5 << 3 << 3;
    QTest::newRow("just full") << 5 << 5 << 5;
    QTest::newRow("one too many") << 5 << 6 << 5;
    QTest::newRow("one at least") << 0 << 4 << 1;
    QTest::newRow("negative") << -3 << 2 << 1;
}

void ZtAppStatusTest::theNewestEntriesAreKept()
{
    QFETCH(int, capacity);
    QFETCH(int, logged);
    QFETCH(int, kept);
    ZtStatusLog::getInstance()->setCapacity(capacity);
    for (int i = 1; i <= logged; ++i)
        ZtAppStatus().setAndLogStatus(ZtAppStatus::Information, i, QString(), QString());

    const QVector<ZtStatusEntry> &entries = ZtStatusLog::getInstance()->entries();
    QCOMPARE(entries.size(), kept);
    QCOMPARE(entries.constFirst().code, logged - kept + 1);
    QCOMPARE(entries.constLast().code, logged);
}

void ZtAppStatusTest::loweringTheCapacityDropsTheOldest()
{
    for (int i = 1; i <= 4; ++i)
        ZtAppStatus().setAndLogStatus(ZtAppStatus::Information, i, QString(), QString());
    ZtStatusLog::getInstance()->setCapacity(2);
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 2);
    QCOMPARE(ZtStatusLog::getInstance()->entries().constFirst().code, 3);
}

void ZtAppStatusTest::clearingSaysSoOnce()
{
    ZtAppStatus().setAndLogStatus(ZtAppStatus::Information, 1, QString(), QString());
    QSignalSpy cleared(ZtStatusLog::getInstance(), SIGNAL(signalCleared()));
    ZtStatusLog::getInstance()->clear();
    ZtStatusLog::getInstance()->clear();
    QCOMPARE(cleared.count(), 1);
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

STATREPORT_TEST_MAIN(ZtAppStatusTest)
#include "ZtAppStatusTest.moc"
