// SPDX-License-Identifier: MIT
#include "KvDeskPlaceCommand.h"

#include "KvDeskObjectState.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QSignalSpy>
#include <QUndoStack>

class KvDeskPlaceCommandTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void placesComeAndGo_data();
    void placesComeAndGo();
    void everyStepIsAnnouncedOnce();
    void stepsDoNotBecomeOne();
    void counterThatIsGoneStaysAway();

private:
    KvDeskObjectId counter(const QPolygonF &places)
    {
        return {ZtDrawnType::Counter, m_document.addObject(ZtDrawnType::Counter, places)};
    }
    static QPolygonF places(const KvDeskObjectId &object) { return KvDeskObjectState::of(object).points; }

    ZtMeasuringDocument m_document;
};

void KvDeskPlaceCommandTest::cleanup()
{
    m_document.clear();
    StatReportTest::cleanup();
}

void KvDeskPlaceCommandTest::placesComeAndGo_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("index");
    QTest::addColumn<QPolygonF>("after");
    QTest::newRow("last comes") << static_cast<int>(KvDeskPlaceCommand::Add) << 2
                                << polygon({{1, 1}, {2, 2}, {9, 9}});
    QTest::newRow("first comes") << static_cast<int>(KvDeskPlaceCommand::Add) << 0
                                 << polygon({{9, 9}, {1, 1}, {2, 2}});
    QTest::newRow("first goes") << static_cast<int>(KvDeskPlaceCommand::Remove) << 0 << polygon({{2, 2}});
    QTest::newRow("last goes") << static_cast<int>(KvDeskPlaceCommand::Remove) << 1 << polygon({{1, 1}});
}

void KvDeskPlaceCommandTest::placesComeAndGo()
{
    QFETCH(int, kind);
    QFETCH(int, index);
    QFETCH(QPolygonF, after);
    const QPolygonF before = polygon({{1, 1}, {2, 2}});
    const KvDeskObjectId object = counter(before);
    const QPointF place = kind == KvDeskPlaceCommand::Add ? QPointF(9, 9) : before.at(index);
    QUndoStack stack;
    stack.push(new KvDeskPlaceCommand(QStringLiteral("place"), static_cast<KvDeskPlaceCommand::Kind>(kind),
                                      object, index, place));
    QCOMPARE(places(object), after);
    stack.undo();
    QCOMPARE(places(object), before);
    stack.redo();
    QCOMPARE(places(object), after);
}

void KvDeskPlaceCommandTest::everyStepIsAnnouncedOnce()
{
    const KvDeskObjectId object = counter(QPolygonF());
    QSignalSpy changed(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)));
    QUndoStack stack;
    stack.push(new KvDeskPlaceCommand(QStringLiteral("place"), KvDeskPlaceCommand::Add, object, 0, {3, 4}));
    stack.undo();
    stack.redo();
    QCOMPARE(changed.count(), 3);
}

void KvDeskPlaceCommandTest::stepsDoNotBecomeOne()
{
    const KvDeskObjectId object = counter(QPolygonF());
    QUndoStack stack;
    for (int i = 0; i < 5; ++i)
        stack.push(new KvDeskPlaceCommand(QStringLiteral("place"), KvDeskPlaceCommand::Add, object, i,
                                          QPointF(i, i)));
    QCOMPARE(stack.count(), 5);
    stack.setIndex(2);
    QCOMPARE(places(object), polygon({{0, 0}, {1, 1}}));
}

void KvDeskPlaceCommandTest::counterThatIsGoneStaysAway()
{
    const KvDeskObjectId object = counter(QPolygonF());
    QUndoStack stack;
    stack.push(new KvDeskPlaceCommand(QStringLiteral("place"), KvDeskPlaceCommand::Add, object, 0, {3, 4}));
    ZtKernelData::getInstance()->removeObject(object.type, object.id);
    stack.undo();
    QVERIFY(!KvDeskObjectState::of(object).exists);
}

STATREPORT_TEST_MAIN(KvDeskPlaceCommandTest)
#include "KvDeskPlaceCommandTest.moc"
