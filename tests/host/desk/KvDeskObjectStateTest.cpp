// SPDX-License-Identifier: MIT
#include "KvDeskObjectState.h"

#include "host/SignalRecorder.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtTableImportOptions.h"
#include "support/StatReportTest.h"

#include <QBuffer>
#include <QSignalSpy>

#include <functional>

namespace {

using Change = std::function<void(KvDeskObjectState *)>;

const QPolygonF corners = polygon({{1, 2}, {31, 42}});

} // namespace

Q_DECLARE_METATYPE(Change)

class KvDeskObjectStateTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void knowsEverythingAboutAnObject();
    void whatIsNotThereIsMissing_data();
    void whatIsNotThereIsMissing();
    void everyPartCounts_data();
    void everyPartCounts();
    void restoresAndAnnouncesOnce_data();
    void restoresAndAnnouncesOnce();
    void createdObjectsAreCompleteWhenAnnounced();
    void restoringNothingIsSilent();
    void importedObjectsKeepTheirRow();
    void objectsOfATableThatIsGoneStayAway();

private:
    KvDeskObjectId rectangle()
    {
        return {ZtDrawnType::Rectangle, m_document.addObject(ZtDrawnType::Rectangle, corners)};
    }
    int importTable()
    {
        QBuffer file;
        file.setData("name;width\nA;1,5\nB;2,5\n");
        file.open(QIODevice::ReadOnly);
        ZtFault fault;
        m_document.importTable(&file, QStringLiteral("t.csv"), ZtTableImportOptions(), &fault);
        return m_document.importedTypes().value(0);
    }

    ZtMeasuringDocument m_document;
};

void KvDeskObjectStateTest::cleanup()
{
    m_document.clear();
    StatReportTest::cleanup();
}

void KvDeskObjectStateTest::knowsEverythingAboutAnObject()
{
    const KvDeskObjectId note{ZtDrawnType::TextNote,
                              m_document.addObject(ZtDrawnType::TextNote, polygon({{5, 6}}),
                                                   QStringLiteral("Hint"), QStringLiteral("look"))};
    const KvDeskObjectState state = KvDeskObjectState::of(note);
    QVERIFY(state.exists);
    QCOMPARE(state.object, note);
    QCOMPARE(state.points, polygon({{5, 6}}));
    QCOMPARE(state.name, QStringLiteral("Hint"));
    QCOMPARE(state.text, QStringLiteral("look"));
    QCOMPARE(state.row, -1);
    QVERIFY(state.hiddenValues.isEmpty());
    // The name that every object has is not its own.
    QCOMPARE(KvDeskObjectState::of(rectangle()).name, QString());
}

void KvDeskObjectStateTest::whatIsNotThereIsMissing_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<int>("id");
    QTest::newRow("no such id") << static_cast<int>(ZtDrawnType::Line) << 9;
    QTest::newRow("no such type") << 12 << 1;
    QTest::newRow("none") << 0 << 0;
}

void KvDeskObjectStateTest::whatIsNotThereIsMissing()
{
    QFETCH(int, type);
    QFETCH(int, id);
    const KvDeskObjectState state = KvDeskObjectState::of({type, id});
    QVERIFY(!state.exists);
    QVERIFY(state == KvDeskObjectState::missing({type, id}));
}

void KvDeskObjectStateTest::everyPartCounts_data()
{
    QTest::addColumn<Change>("change");
    const auto row = [](const char *name, const Change &change) { QTest::newRow(name) << change; };
    row("object", [](KvDeskObjectState *s) { s->object.id = 99; });
    row("existence", [](KvDeskObjectState *s) { s->exists = false; });
    row("row", [](KvDeskObjectState *s) { s->row = 3; });
    row("points", [](KvDeskObjectState *s) { s->points[0].rx() += 1.0; });
    row("text", [](KvDeskObjectState *s) { s->text = QStringLiteral("x"); });
    row("name", [](KvDeskObjectState *s) { s->name = QStringLiteral("x"); });
    row("hidden values", [](KvDeskObjectState *s) { s->hiddenValues.append(0); });
}

void KvDeskObjectStateTest::everyPartCounts()
{
    QFETCH(Change, change);
    const KvDeskObjectState before = KvDeskObjectState::of(rectangle());
    KvDeskObjectState after = before;
    QVERIFY(after == before);
    change(&after);
    QVERIFY(after != before);
}

void KvDeskObjectStateTest::restoresAndAnnouncesOnce_data()
{
    QTest::addColumn<Change>("change");
    const auto row = [](const char *name, const Change &change) { QTest::newRow(name) << change; };
    row("points", [](KvDeskObjectState *s) { s->points.translate(5, 5); });
    row("text", [](KvDeskObjectState *s) { s->text = QStringLiteral("x"); });
    row("name", [](KvDeskObjectState *s) { s->name = QStringLiteral("x"); });
    row("hidden value", [](KvDeskObjectState *s) { s->hiddenValues = {2}; });
    row("hidden values", [](KvDeskObjectState *s) { s->hiddenValues = {0, 2}; });
}

void KvDeskObjectStateTest::restoresAndAnnouncesOnce()
{
    QFETCH(Change, change);
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    QSignalSpy changed(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)));
    QSignalSpy created(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)));
    QSignalSpy removed(center, SIGNAL(signalObjectRemoved(int,int)));
    const KvDeskObjectId object = rectangle();
    created.clear();
    const KvDeskObjectState before = KvDeskObjectState::of(object);
    KvDeskObjectState after = before;
    change(&after);
    after.restore();
    QVERIFY(KvDeskObjectState::of(object) == after);
    QCOMPARE(changed.count(), 1);
    before.restore();
    QVERIFY(KvDeskObjectState::of(object) == before);
    QCOMPARE(changed.count(), 2);
    QCOMPARE(created.count() + removed.count(), 0);
    KvDeskObjectState::missing(object).restore();
    QCOMPARE(removed.count(), 1);
    after.restore();
    QVERIFY(KvDeskObjectState::of(object) == after);
    QCOMPARE(created.count(), 1);
    QCOMPARE(changed.count(), 2);
}

namespace {

/// What an object was when its creation was announced.
class CreationWitness : public QObject
{
    Q_OBJECT
public:
    CreationWitness()
    {
        connect(ZtSignalCenter::getInstance(), SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)),
                                                      this,
                                                      SLOT(slotCreated(int,int,const ZtKernelObjectData*)));
    }

    KvDeskObjectState seen;

private slots:
    void slotCreated(int aType, int aId, const ZtKernelObjectData *aObject)
    {
        Q_UNUSED(aObject)
        seen = KvDeskObjectState::of({aType, aId});
    }
};

} // namespace

void KvDeskObjectStateTest::createdObjectsAreCompleteWhenAnnounced()
{
    KvDeskObjectState state = KvDeskObjectState::missing({ZtDrawnType::Rectangle, 5});
    state.exists = true;
    state.points = corners;
    state.name = QStringLiteral("Frame");
    state.hiddenValues = {1};
    const CreationWitness witness;
    state.restore();
    QVERIFY(witness.seen == state);
}

void KvDeskObjectStateTest::restoringNothingIsSilent()
{
    QSignalSpy removed(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int,int)));
    KvDeskObjectState::missing({ZtDrawnType::Line, 3}).restore();
    QCOMPARE(removed.count(), 0);
}

void KvDeskObjectStateTest::importedObjectsKeepTheirRow()
{
    const KvDeskObjectId second{importTable(), 2};
    const KvDeskObjectState state = KvDeskObjectState::of(second);
    QCOMPARE(state.row, 1);
    KvDeskObjectState::missing(second).restore();
    QVERIFY(!KvDeskObjectState::of(second).exists);
    state.restore();
    QVERIFY(KvDeskObjectState::of(second) == state);
}

void KvDeskObjectStateTest::objectsOfATableThatIsGoneStayAway()
{
    const KvDeskObjectId object{importTable(), 1};
    const KvDeskObjectState state = KvDeskObjectState::of(object);
    QVERIFY(state.exists);
    m_document.clear();
    state.restore();
    QVERIFY(!ZtKernelData::getInstance()->object(object.type, object.id));
}

STATREPORT_TEST_MAIN(KvDeskObjectStateTest)
#include "KvDeskObjectStateTest.moc"
