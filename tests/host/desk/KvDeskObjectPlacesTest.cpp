// SPDX-License-Identifier: MIT
#include "KvDeskObjectPlaces.h"

#include "DeskFiles.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

namespace {

const KvDeskObjectId line1{ZtDrawnType::Line, 1};

void setPoints(const KvDeskObjectId &object, const QPolygonF &points)
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    static_cast<ZtDrawnObjectData *>(kernel->object(object.type, object.id))->setPoints(points);
    kernel->notifyObjectChanged(object.type, object.id);
}

} // namespace

class KvDeskObjectPlacesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void followsEveryChange();
    void followsManyChangesAtOnce();
    void findsTheTopmost();
    void findsPointsNearby();
    void countersWithoutPlacesLieNowhere();
    void walksThroughAllObjects();
};

void KvDeskObjectPlacesTest::followsEveryChange()
{
    ZtMeasuringDocument document;
    KvDeskObjectPlaces places;
    QCOMPARE(places.index().size(), 0);
    QSignalSpy changed(&places, SIGNAL(signalChanged(int,int,QRectF,QRectF)));
    QSignalSpy reset(&places, SIGNAL(signalReset()));
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {10, 10}}));
    QCOMPARE(places.index().rect(line1), QRectF(0, 0, 10, 10));
    QCOMPARE(changed.last().at(2).toRectF(), QRectF());
    QCOMPARE(changed.last().at(3).toRectF(), QRectF(0, 0, 10, 10));
    setPoints(line1, polygon({{0, 0}, {20, 10}}));
    QCOMPARE(places.index().rect(line1), QRectF(0, 0, 20, 10));
    QCOMPARE(changed.last().at(2).toRectF(), QRectF(0, 0, 10, 10));
    ZtKernelData::getInstance()->removeObject(line1.type, line1.id);
    QCOMPARE(places.index().size(), 0);
    QCOMPARE(changed.count(), 3);
    QCOMPARE(reset.count(), 0);
}

void KvDeskObjectPlacesTest::followsManyChangesAtOnce()
{
    ZtMeasuringDocument document;
    KvDeskObjectPlaces places;
    QCOMPARE(places.index().size(), 0);
    QSignalSpy reset(&places, SIGNAL(signalReset()));
    ZtFault fault;
    // One announcement stands for all objects of a type.
    QVERIFY(document.loadSession(DeskFiles::demoSession(), &fault));
    QVERIFY(reset.count() >= 1);
    int count = 0;
    for (const ZtDrawnType &type : ZtDrawnType::all())
        count += ZtKernelData::getInstance()->objects().value(type.id).size();
    QCOMPARE(places.index().size(), count);
    document.clear();
    QCOMPARE(places.index().size(), 0);
}

void KvDeskObjectPlacesTest::findsTheTopmost()
{
    ZtMeasuringDocument document;
    KvDeskObjectPlaces places;
    document.addObject(ZtDrawnType::Rectangle, polygon({{0, 0}, {100, 100}}));
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {100, 0}}));
    QCOMPARE(places.objectAt(QPointF(50, 2), 3.0), line1);
    QCOMPARE(places.objectAt(QPointF(50, 98), 3.0), (KvDeskObjectId{ZtDrawnType::Rectangle, 1}));
    QVERIFY(places.objectAt(QPointF(50, 50), 3.0).isNull());
    QVERIFY(places.objectAt(QPointF(50, 10), 3.0).isNull());
}

void KvDeskObjectPlacesTest::findsPointsNearby()
{
    ZtMeasuringDocument document;
    KvDeskObjectPlaces places;
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {100, 0}}));
    document.addObject(ZtDrawnType::Line, polygon({{3, 0}, {50, 50}}));
    QCOMPARE(places.pointsNear(QPointF(1, 1), 5.0, {}), (QVector<QPointF>{{0, 0}, {3, 0}}));
    QCOMPARE(places.pointsNear(QPointF(1, 1), 5.0, line1), (QVector<QPointF>{{3, 0}}));
    QVERIFY(places.pointsNear(QPointF(30, 0), 5.0, {}).isEmpty());
}

void KvDeskObjectPlacesTest::countersWithoutPlacesLieNowhere()
{
    ZtMeasuringDocument document;
    KvDeskObjectPlaces places;
    QCOMPARE(places.index().size(), 0);
    QSignalSpy reset(&places, SIGNAL(signalReset()));
    document.addObject(ZtDrawnType::Counter, QPolygonF());
    QCOMPARE(places.index().size(), 0);
    const KvDeskObjectId counter{ZtDrawnType::Counter, 1};
    setPoints(counter, polygon({{5, 5}}));
    QCOMPARE(places.objectAt(QPointF(6, 6), 3.0), counter);
    setPoints(counter, QPolygonF());
    QCOMPARE(places.index().size(), 0);
    document.addObject(ZtDrawnType::Counter, polygon({{5, 5}}));
    QCOMPARE(places.index().size(), 1);
    QCOMPARE(reset.count(), 0);
}

void KvDeskObjectPlacesTest::walksThroughAllObjects()
{
    ZtMeasuringDocument document;
    QVERIFY(KvDeskObjectPlaces::next({}, true).isNull());
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {100, 0}}), QString(), QString(), 2);
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {100, 0}}), QString(), QString(), 7);
    document.addObject(ZtDrawnType::Circle, polygon({{0, 0}, {100, 0}}));
    const QVector<KvDeskObjectId> order{
        {ZtDrawnType::Line, 2}, {ZtDrawnType::Line, 7}, {ZtDrawnType::Circle, 1}};
    KvDeskObjectId object;
    for (int i = 0; i < 6; ++i) {
        object = KvDeskObjectPlaces::next(object, true);
        QCOMPARE(object, order.at(i % 3));
    }
    object = KvDeskObjectId();
    for (int i = 5; i >= 0; --i) {
        object = KvDeskObjectPlaces::next(object, false);
        QCOMPARE(object, order.at(i % 3));
    }
}

STATREPORT_TEST_MAIN(KvDeskObjectPlacesTest)
#include "KvDeskObjectPlacesTest.moc"
