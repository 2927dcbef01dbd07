// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtWorkerThread.h"

#include <QPointer>
#include <QSemaphore>

#include <atomic>

class ZtWorkerThreadTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void doesItsWork();
    void waitsForItsWork();
    void isDeletedAfterItsWork();
    void retiresWhenDone();
};

void ZtWorkerThreadTest::doesItsWork()
{
    std::atomic_int done{0};
    const auto created = ZtWorkerThread::create([&] { ++done; });
    QVERIFY(!created->isRunning());
    const auto begun = ZtWorkerThread::begin([&] { ++done; });
    QVERIFY(begun->wait(10000));
    QCOMPARE(done.load(), 1);
    created->start();
    QVERIFY(created->wait(10000));
    QCOMPARE(done.load(), 2);
}

void ZtWorkerThreadTest::waitsForItsWork()
{
    std::atomic_bool isDone{false};
    {
        const auto thread = ZtWorkerThread::begin([&] {
            QThread::msleep(50);
            isDone = true;
        });
    }
    QVERIFY(isDone);
}

void ZtWorkerThreadTest::isDeletedAfterItsWork()
{
    QSemaphore goOn;
    auto thread = ZtWorkerThread::begin([&] { goOn.acquire(); });
    const QPointer<ZtWorkerThread> retired(thread.get());
    ZtWorkerThread::retire(std::move(thread));
    // Nobody waited.
    QVERIFY(retired);
    QVERIFY(retired->isRunning());
    QVERIFY(retired->parent() == QCoreApplication::instance());
    goOn.release();
    QTRY_VERIFY(!retired);
}

void ZtWorkerThreadTest::retiresWhenDone()
{
    auto thread = ZtWorkerThread::begin([] {});
    const QPointer<ZtWorkerThread> retired(thread.get());
    QVERIFY(thread->wait(10000));
    ZtWorkerThread::retire(std::move(thread));
    QVERIFY(!retired);
    ZtWorkerThread::retire(nullptr);
}

STATREPORT_TEST_MAIN(ZtWorkerThreadTest)
#include "ZtWorkerThreadTest.moc"
