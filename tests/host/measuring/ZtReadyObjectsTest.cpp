// SPDX-License-Identifier: MIT
#include "measuring/ZtReadyObjects.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtTableImport.h"
#include "measuring/ZtWorkerThread.h"
#include "support/StatReportTest.h"

#include <QSignalSpy>

namespace {

ZtImportedTable imported(const QByteArray &bytes)
{
    ZtImportedTable table;
    ZtFault fault;
    if (!ZtTableImport::parse(bytes, QStringLiteral("t.csv"), ZtTableImportOptions(), &table, &fault))
        qCritical("%s", qPrintable(fault.text()));
    return table;
}

ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

} // namespace

class ZtReadyObjectsTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanup();
    void makesObjectsWithNames();
    void keepsWhatTheSessionSays();
    void isMadeByAnotherThread();
    void handsOverSilently();
    void isFreedWithoutHandingOver();
    void endsWhenCancelled();
    void giftsOfAnySizeCostTheSame();
};

void ZtReadyObjectsTest::initTestCase()
{
    qRegisterMetaType<const ZtKernelObjectData *>("const ZtKernelObjectData*");
}

void ZtReadyObjectsTest::cleanup()
{
    for (int id = ZtTableImport::firstTypeId; id < ZtTableImport::firstTypeId + 10; ++id)
        kernel()->unregisterType(id);
    StatReportTest::cleanup();
}

void ZtReadyObjectsTest::makesObjectsWithNames()
{
    std::vector<ZtReadyObjects> ready =
        ZtReadyObjects::ofTable(imported("type,name,size\nA,,1\nB,two,2\nA,A 2,3\n"));
    QCOMPARE(ready.size(), std::size_t(2));
    const int first = ready[0].handOver(0);
    const int second = ready[1].handOver(first);
    QCOMPARE(first, static_cast<int>(ZtTableImport::firstTypeId));
    QCOMPARE(second, first + 1);
    QCOMPARE(kernel()->objects().value(first).keys(), (QList<int>{1, 2}));
    QCOMPARE(kernel()->getGsManipulator(first)->objectTypeId(), first);
    QCOMPARE(kernel()->getGsManipulator(first)->getObjectName(1), QStringLiteral("A 1"));
    QCOMPARE(kernel()->getGsManipulator(second)->getObjectName(1), QStringLiteral("two"));
    // The name that an object has by itself is none of its own.
    QCOMPARE(ready[0].table().rows.at(1).name, QString());
    QCOMPARE(ready[1].table().rows.at(0).name, QStringLiteral("two"));
}

void ZtReadyObjectsTest::keepsWhatTheSessionSays()
{
    const ZtImportedTable table = imported("a,b\n1,2\n3,4\n5,6\n");
    ZtSession session;
    session.tables.append({table.types.first(), {{4, 2, QStringLiteral("x"), {1}}, {7, 0, QString(), {}}}});
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofSession(session);
    const int type = ready[0].handOver(ZtTableImport::firstTypeId + 4);
    QCOMPARE(type, ZtTableImport::firstTypeId + 5);
    QCOMPARE(kernel()->objects().value(type).keys(), (QList<int>{4, 7}));
    const auto *const object = static_cast<const ZtImportedObjectData *>(kernel()->object(type, 4));
    QCOMPARE(object->row(), 2);
    QCOMPARE(object->hiddenValues(), QVector<int>{1});
    QCOMPARE(kernel()->getGsManipulator(type)->valueSet(4), QStringList(QStringLiteral("a")));
    QCOMPARE(kernel()->getGsManipulator(type)->valueSet(7).size(), 2);
}

void ZtReadyObjectsTest::isMadeByAnotherThread()
{
    const ZtImportedTable table = imported("size\n1\n2\n");
    std::vector<ZtReadyObjects> ready;
    const auto thread = ZtWorkerThread::begin([&]() { ready = ZtReadyObjects::ofTable(table); });
    QVERIFY(thread->wait(30000));
    QCOMPARE(kernel()->objects().value(ready[0].handOver(0)).size(), 2);
}

void ZtReadyObjectsTest::handsOverSilently()
{
    QSignalSpy created(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)));
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(imported("size\n1\n2\n"));
    ready[0].handOver(0);
    QCOMPARE(created.size(), 0);
    std::vector<ZtReadyObjects> more = ZtReadyObjects::ofTable(imported("size\n1\n2\n"));
    QCOMPARE(ZtTableImport::apply(&more).size(), 1);
    QCOMPARE(created.size(), 1);
}

// The sanitizer would tell.
void ZtReadyObjectsTest::isFreedWithoutHandingOver()
{
    const std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(imported("size\n1\n2\n"));
    QCOMPARE(ready.size(), std::size_t(1));
    QVERIFY(kernel()->objects().isEmpty());
}

void ZtReadyObjectsTest::endsWhenCancelled()
{
    QByteArray bytes = "size\n";
    bytes += QByteArray("1\n").repeated(2 * static_cast<int>(ZtProgress::stride));
    const ZtImportedTable table = imported(bytes);
    ZtProgress progress;
    progress.cancel();
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table, &progress);
    QCOMPARE(kernel()->objects().value(ready[0].handOver(0)).size(), 0);
}

void ZtReadyObjectsTest::giftsOfAnySizeCostTheSame()
{
    constexpr int rows = 300000;
    const ZtImportedTable table = imported("size\n" + QByteArray("1\n").repeated(rows));
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    QElapsedTimer clock;
    clock.start();
    const int type = ready[0].handOver(0);
    QVERIFY2(clock.elapsed() < 50, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(kernel()->objects().value(type).size(), rows);
}

STATREPORT_TEST_MAIN(ZtReadyObjectsTest)
#include "ZtReadyObjectsTest.moc"
