// SPDX-License-Identifier: MIT
#include "KvDeskSelection.h"

#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

namespace {

const KvDeskObjectId a{ZtDrawnType::Line, 1};
const KvDeskObjectId b{ZtDrawnType::Line, 2};
const KvDeskObjectId c{ZtDrawnType::Circle, 1};

} // namespace

class KvDeskSelectionTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsEmpty();
    void selectsOne();
    void toggles();
    void sets();
    void announcesOnlyChanges();
    void forgetsRemovedObjects();
    void forgetsObjectsRemovedTogether();
};

void KvDeskSelectionTest::startsEmpty()
{
    const KvDeskSelection selection;
    QVERIFY(selection.isEmpty());
    QVERIFY(selection.current().isNull());
}

void KvDeskSelectionTest::selectsOne()
{
    KvDeskSelection selection;
    selection.select(a);
    selection.select(c);
    QCOMPARE(selection.objects(), QSet<KvDeskObjectId>{c});
    QCOMPARE(selection.current(), c);
    selection.select(KvDeskObjectId());
    QVERIFY(selection.isEmpty());
}

void KvDeskSelectionTest::toggles()
{
    KvDeskSelection selection;
    selection.toggle(a);
    selection.toggle(b);
    QCOMPARE(selection.objects(), (QSet<KvDeskObjectId>{a, b}));
    QCOMPARE(selection.current(), b);
    selection.toggle(b);
    QCOMPARE(selection.current(), a);
    selection.toggle(KvDeskObjectId());
    QCOMPARE(selection.objects(), QSet<KvDeskObjectId>{a});
    selection.toggle(a);
    QVERIFY(selection.current().isNull());
}

void KvDeskSelectionTest::sets()
{
    KvDeskSelection selection;
    selection.set({a, b}, a);
    QCOMPARE(selection.current(), a);
    // The current one is always among them.
    selection.set({c}, a);
    QCOMPARE(selection.current(), c);
    selection.set({}, a);
    QVERIFY(selection.current().isNull());
}

void KvDeskSelectionTest::announcesOnlyChanges()
{
    KvDeskSelection selection;
    QSignalSpy spy(&selection, SIGNAL(signalSelectionChanged()));
    selection.clear();
    QCOMPARE(spy.count(), 0);
    selection.select(a);
    selection.select(a);
    QCOMPARE(spy.count(), 1);
    selection.set({a, b}, a);
    selection.set({a, b}, b);
    QCOMPARE(spy.count(), 3);
}

void KvDeskSelectionTest::forgetsRemovedObjects()
{
    ZtMeasuringDocument document;
    for (int i = 0; i < 3; ++i)
        document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {1, 1}}));
    KvDeskSelection selection;
    selection.set({a, b}, b);
    QSignalSpy spy(&selection, SIGNAL(signalSelectionChanged()));
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 3);
    QCOMPARE(spy.count(), 0);
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 2);
    QCOMPARE(selection.objects(), QSet<KvDeskObjectId>{a});
    QCOMPARE(selection.current(), a);
    QCOMPARE(spy.count(), 1);
}

void KvDeskSelectionTest::forgetsObjectsRemovedTogether()
{
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {1, 1}}));
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {1, 1}}));
    document.addObject(ZtDrawnType::Circle, polygon({{0, 0}, {1, 1}}));
    KvDeskSelection selection;
    selection.set({a, b, c}, b);
    // Announced once for each type.
    document.clear();
    QVERIFY(selection.isEmpty());
}

STATREPORT_TEST_MAIN(KvDeskSelectionTest)
#include "KvDeskSelectionTest.moc"
