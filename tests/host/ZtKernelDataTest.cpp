// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/FakeManipulator.h"
#include "host/SignalRecorder.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "kernel/iZTKernelImage.h"

#include <limits>
#include <memory>

namespace {

/// Counts the living ones, so that a test sees a leak.
class CountedObject : public ZtKernelObjectData
{
public:
    CountedObject() { ++living; }
    ~CountedObject() override { --living; }
    static int living;
};

int CountedObject::living = 0;

class SilentImage : public iZTKernelImage
{
public:
    void requestImage() override {}
};

int add(int type, int id = 0)
{
    return ZtKernelData::getInstance()->addObject(type, std::make_unique<CountedObject>(), id);
}

void registerFakeType(int type)
{
    ZtKernelData::getInstance()->registerType(
        type, std::make_unique<FakeManipulator>(type),
        std::make_unique<ZtKernelObjectDataDescr>(type, QStringLiteral("square")));
}

/// Adds an object out of the announcement of a removal.
class Replacer : public QObject
{
    Q_OBJECT
public:
    Replacer()
    {
        connect(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int,int)), this,
                                                      SLOT(slotRemoved(int,int)));
    }

private slots:
    void slotRemoved(int type, int id) { add(type + 1, id); }
};

} // namespace

class ZtKernelDataTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void revisionCountsEveryChange();
    void init();
    void cleanup();
    void isTheSameForAll();
    void anUnknownTypeHasNothing();
    void registersTypes();
    void registeringAgainReplaces();
    void aTypeMayLackEitherHalf();
    void unregisteringTakesTheObjectsSilently();
    void nextFreeId_data();
    void nextFreeId();
    void idsCountPerType();
    void addingAnnouncesIt();
    void nothingComesOfNull();
    void anIdInUseIsReplaced();
    void removingAnnouncesAndDeletes();
    void removingWhatIsNotThere();
    void removingTakesTheNameAway();
    void editsAreAnnounced();
    void clearingAnnouncesEveryRemoval();
    void clearingLeavesWhatReceiversAdd();
    void setsAndTakesManyObjects();
    void unregisteringGivesTheManipulator();
    void blockersNest();
    void keepsTheImage();

private:
    ZtKernelData *m_kernel = ZtKernelData::getInstance();
};

void ZtKernelDataTest::init()
{
    StatReportTest::init();
    QCOMPARE(CountedObject::living, 0);
}

void ZtKernelDataTest::cleanup()
{
    m_kernel->clearObjects();
    for (const int type : {1, 2, 3})
        m_kernel->unregisterType(type);
    m_kernel->setKernelImage(nullptr);
    StatReportTest::cleanup();
}

void ZtKernelDataTest::isTheSameForAll()
{
    QVERIFY(m_kernel != nullptr);
    QCOMPARE(ZtKernelData::getInstance(), m_kernel);
}

void ZtKernelDataTest::anUnknownTypeHasNothing()
{
    QVERIFY(m_kernel->getGsManipulator(1) == nullptr);
    QVERIFY(m_kernel->getDataDescriptor(1) == nullptr);
    QVERIFY(m_kernel->object(1, 1) == nullptr);
    QVERIFY(m_kernel->objects().isEmpty());
}

void ZtKernelDataTest::registersTypes()
{
    registerFakeType(1);
    QCOMPARE(m_kernel->getGsManipulator(1)->objectTypeId(), 1);
    QCOMPARE(m_kernel->getDataDescriptor(1)->objectType(), 1);
    QCOMPARE(m_kernel->getDataDescriptor(1)->key(), QStringLiteral("square"));
    m_kernel->unregisterType(1);
    QVERIFY(m_kernel->getGsManipulator(1) == nullptr);
    QVERIFY(m_kernel->getDataDescriptor(1) == nullptr);
}

void ZtKernelDataTest::registeringAgainReplaces()
{
    registerFakeType(1);
    const ZtGsManipulator *const first = m_kernel->getGsManipulator(1);
    auto second = std::make_unique<FakeManipulator>(1);
    const ZtGsManipulator *const expected = second.get();
    m_kernel->registerType(1, std::move(second), nullptr);
    QVERIFY(expected != first);
    QVERIFY(m_kernel->getGsManipulator(1) == expected);
    QVERIFY(m_kernel->getDataDescriptor(1) == nullptr);
}

void ZtKernelDataTest::aTypeMayLackEitherHalf()
{
    m_kernel->registerType(1, nullptr, std::make_unique<ZtKernelObjectDataDescr>(1, QStringLiteral("bare")));
    m_kernel->registerType(2, std::make_unique<FakeManipulator>(2), nullptr);
    QVERIFY(m_kernel->getGsManipulator(1) == nullptr);
    QVERIFY(m_kernel->getDataDescriptor(1) != nullptr);
    QVERIFY(m_kernel->getGsManipulator(2) != nullptr);
    QVERIFY(m_kernel->getDataDescriptor(2) == nullptr);
    add(1);
    QVERIFY(m_kernel->removeObject(1, 1));
}

void ZtKernelDataTest::unregisteringTakesTheObjectsSilently()
{
    registerFakeType(1);
    add(1);
    add(2);
    SignalRecorder recorder;
    m_kernel->unregisterType(1);
    QCOMPARE(recorder.taken(), QStringList());
    QVERIFY(m_kernel->object(1, 1) == nullptr);
    QVERIFY(m_kernel->object(2, 1) != nullptr);
    QCOMPARE(CountedObject::living, 1);
}

void ZtKernelDataTest::nextFreeId_data()
{
    constexpr int largest = std::numeric_limits<int>::max();
    QTest::addColumn<QVector<int>>("taken");
    QTest::addColumn<int>("expected");
    QTest::newRow("first") << QVector<int>() << 1;
    QTest::newRow("second") << QVector<int>{1} << 2;
    QTest::newRow("a gap stays") << QVector<int>{1, 2, 9} << 10;
    QTest::newRow("negative ones do not count") << QVector<int>{-5} << 1;
    QTest::newRow("the numbers ran out") << QVector<int>{1, 2, 4, largest} << 3;
    QTest::newRow("only the last number") << QVector<int>{largest} << 1;
}

void ZtKernelDataTest::nextFreeId()
{
    QFETCH(QVector<int>, taken);
    for (const int id : taken)
        QCOMPARE(add(1, id), id);
    const int id = add(1);
    QTEST(id, "expected");
}

void ZtKernelDataTest::idsCountPerType()
{
    QCOMPARE(add(1), 1);
    QCOMPARE(add(1), 2);
    QCOMPARE(add(2), 1);
    QCOMPARE(m_kernel->objects().keys(), QList<int>({1, 2}));
    QCOMPARE(m_kernel->objects().value(1).keys(), QList<int>({1, 2}));
    QVERIFY(m_kernel->removeObject(1, 2));
    QCOMPARE(add(1), 2);
}

void ZtKernelDataTest::addingAnnouncesIt()
{
    SignalRecorder recorder;
    add(1);
    add(2, 40);
    QCOMPARE(recorder.taken(), QStringList({QStringLiteral("created 1/1"), QStringLiteral("created 2/40")}));
}

void ZtKernelDataTest::nothingComesOfNull()
{
    SignalRecorder recorder;
    QCOMPARE(m_kernel->addObject(1, nullptr), 0);
    QVERIFY(m_kernel->objects().isEmpty());
    QCOMPARE(recorder.taken(), QStringList());
}

void ZtKernelDataTest::anIdInUseIsReplaced()
{
    add(1, 3);
    SignalRecorder recorder;
    add(1, 3);
    QCOMPARE(recorder.taken(), QStringList({QStringLiteral("removed 1/3"), QStringLiteral("created 1/3")}));
    QCOMPARE(CountedObject::living, 1);
}

void ZtKernelDataTest::removingAnnouncesAndDeletes()
{
    add(1);
    SignalRecorder recorder;
    QVERIFY(m_kernel->removeObject(1, 1));
    QCOMPARE(recorder.taken(), QStringList(QStringLiteral("removed 1/1")));
    QCOMPARE(CountedObject::living, 0);
    QVERIFY(m_kernel->objects().isEmpty());
}

void ZtKernelDataTest::removingWhatIsNotThere()
{
    add(1);
    SignalRecorder recorder;
    QVERIFY(!m_kernel->removeObject(1, 2));
    QVERIFY(!m_kernel->removeObject(2, 1));
    QCOMPARE(recorder.taken(), QStringList());
    QCOMPARE(CountedObject::living, 1);
}

void ZtKernelDataTest::removingTakesTheNameAway()
{
    registerFakeType(1);
    add(1);
    m_kernel->getGsManipulator(1)->setObjectName(1, QStringLiteral("Mine"));
    m_kernel->removeObject(1, 1);
    add(1);
    QCOMPARE(m_kernel->getGsManipulator(1)->getObjectName(1), QStringLiteral("Square 1"));
}

void ZtKernelDataTest::editsAreAnnounced()
{
    add(1);
    SignalRecorder recorder;
    m_kernel->notifyObjectChanged(1, 1);
    m_kernel->notifyObjectChanged(1, 2);
    m_kernel->notifyObjectChanged(2, 1);
    QCOMPARE(recorder.taken(), QStringList(QStringLiteral("changed 1/1")));
}

void ZtKernelDataTest::clearingAnnouncesEveryRemoval()
{
    registerFakeType(1);
    add(1);
    add(1);
    add(2);
    SignalRecorder recorder;
    m_kernel->clearObjects();
    QCOMPARE(recorder.taken(), QStringList({QStringLiteral("removed 1/1"), QStringLiteral("removed 1/2"),
                                            QStringLiteral("removed 2/1")}));
    QVERIFY(m_kernel->objects().isEmpty());
    QCOMPARE(CountedObject::living, 0);
    QVERIFY(m_kernel->getGsManipulator(1) != nullptr);
}

void ZtKernelDataTest::clearingLeavesWhatReceiversAdd()
{
    add(1);
    {
        const Replacer replacer;
        m_kernel->clearObjects();
    }
    QCOMPARE(m_kernel->objects().keys(), QList<int>{2});
}

void ZtKernelDataTest::setsAndTakesManyObjects()
{
    registerFakeType(1);
    add(1);
    SignalRecorder recorder;
    m_kernel->setObjects(1, {{3, new CountedObject}, {5, new CountedObject}});
    QCOMPARE(m_kernel->objects().value(1).keys(), (QList<int>{3, 5}));
    QCOMPARE(CountedObject::living, 2);
    QCOMPARE(add(1), 6);
    recorder.taken();
    const ZtObjectMap taken = m_kernel->takeObjects(1);
    QCOMPARE(taken.size(), 3);
    QVERIFY(!m_kernel->objects().contains(1));
    QVERIFY(m_kernel->takeObjects(1).isEmpty());
    m_kernel->setObjects(1, ZtObjectMap());
    QVERIFY(!m_kernel->objects().contains(1));
    QCOMPARE(CountedObject::living, 3);
    qDeleteAll(taken);
    QCOMPARE(recorder.taken(), QStringList());
}

void ZtKernelDataTest::unregisteringGivesTheManipulator()
{
    registerFakeType(1);
    const ZtGsManipulator *const manipulator = m_kernel->getGsManipulator(1);
    const std::unique_ptr<ZtGsManipulator> taken = m_kernel->unregisterType(1);
    QCOMPARE(taken.get(), manipulator);
    QVERIFY(!m_kernel->getGsManipulator(1));
    QVERIFY(!m_kernel->unregisterType(1));
}

void ZtKernelDataTest::blockersNest()
{
    SignalRecorder recorder;
    {
        const ZtKernelData::SignalBlocker outer;
        {
            const ZtKernelData::SignalBlocker inner;
            add(1);
        }
        m_kernel->notifyObjectChanged(1, 1);
        m_kernel->removeObject(1, 1);
    }
    QCOMPARE(recorder.taken(), QStringList());
    add(1);
    QCOMPARE(recorder.taken(), QStringList(QStringLiteral("created 1/1")));
}

void ZtKernelDataTest::keepsTheImage()
{
    QVERIFY(m_kernel->kernelImage() == nullptr);
    SilentImage image;
    m_kernel->setKernelImage(&image);
    QVERIFY(m_kernel->kernelImage() == &image);
}

void ZtKernelDataTest::revisionCountsEveryChange()
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    registerFakeType(7);
    QVector<quint64> seen{kernel->revision()};
    const auto isChange = [&]() {
        seen.append(kernel->revision());
        return seen.count(seen.last()) == 1;
    };
    QVERIFY(add(7) > 0 && isChange());
    kernel->notifyObjectChanged(7, 1);
    QVERIFY(isChange());
    {
        const ZtKernelData::SignalBlocker blocker;
        QVERIFY(add(7) > 0 && isChange());
        QVERIFY(kernel->removeObject(7, 2) && isChange());
    }
    QVERIFY(!kernel->removeObject(7, 2) && !isChange());
    const ZtObjectMap objects = kernel->takeObjects(7);
    QVERIFY(isChange());
    kernel->setObjects(7, objects);
    QVERIFY(isChange());
    kernel->unregisterType(7);
    QVERIFY(isChange());
}

STATREPORT_TEST_MAIN(ZtKernelDataTest)
#include "ZtKernelDataTest.moc"
