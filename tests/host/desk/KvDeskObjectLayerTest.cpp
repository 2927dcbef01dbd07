// SPDX-License-Identifier: MIT
#include "KvDeskObjectLayer.h"

#include "KvDeskObjectPlaces.h"
#include "host/measuring/Polygon.h"
#include "image/ZtImage.h"
#include "kernel/ZtImageTools.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QPainter>

namespace {

constexpr QSize viewSize(400, 300);

} // namespace

class KvDeskObjectLayerTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void keepsWhatDidNotChange();
    void drawsOnlyWhatIsOutOfDate();
    void liftedObjectsAreLeftOut();
    void settledObjectsComeBack();
    void manyObjectsAreRough();
    void manyPlacesOfACounterAreRough();
    void roughnessFollowsTheView();
    void stretchedPicturesTurnBackIntoSharpOnes();
    void oneObjectMoreRedrawsEverythingOnce();
    void picturesDrawnAnewAreInFull();
    void roughPicturesAreKept();
    void roughPicturesScroll();
    void burntPicturesAreAlwaysInFull();

private:
    QImage draw(KvDeskObjectLayer *layer, const QTransform &toView = QTransform(), double ratio = 1.0)
    {
        QImage image(viewSize * ratio, QImage::Format_ARGB32_Premultiplied);
        image.setDevicePixelRatio(ratio);
        image.fill(Qt::transparent);
        QPainter painter(&image);
        layer->draw(&painter, m_places.index(), toView, viewSize, ratio);
        return image;
    }
    QImage drawAnew(const QTransform &toView = QTransform(), double ratio = 1.0)
    {
        KvDeskObjectLayer layer;
        return draw(&layer, toView, ratio);
    }
    KvDeskObjectId line(const QPointF &from, const QPointF &to)
    {
        return {ZtDrawnType::Line, m_document.addObject(ZtDrawnType::Line, polygon({from, to}))};
    }
    /// Circles in rows, 8 pixels from each other.
    void addCircles(int count)
    {
        for (int i = 0; i < count; ++i) {
            const QPointF centre(4 + 8 * (i % 50), 4 + 8 * (i / 50));
            m_document.addObject(ZtDrawnType::Circle, polygon({centre, centre + QPointF(3, 0)}));
        }
    }
    void remove(KvDeskObjectLayer *layer, const KvDeskObjectId &object)
    {
        layer->invalidate(rect(object));
        ZtKernelData::getInstance()->removeObject(object.type, object.id);
    }
    QRectF rect(const KvDeskObjectId &object) const { return m_places.index().rect(object); }

private slots:
    void cleanup()
    {
        m_document.clear();
        StatReportTest::cleanup();
    }

private:
    ZtMeasuringDocument m_document;
    KvDeskObjectPlaces m_places;
};

void KvDeskObjectLayerTest::keepsWhatDidNotChange()
{
    addCircles(20);
    KvDeskObjectLayer layer;
    const QImage first = draw(&layer);
    QCOMPARE(layer.drawnObjects(), 20);
    QCOMPARE(draw(&layer), first);
    QCOMPARE(layer.drawnObjects(), 20);
    layer.invalidate();
    QCOMPARE(draw(&layer), first);
    QCOMPARE(layer.drawnObjects(), 40);
}

void KvDeskObjectLayerTest::drawsOnlyWhatIsOutOfDate()
{
    const KvDeskObjectId left = line({20, 20}, {60, 60});
    const KvDeskObjectId right = line({300, 200}, {340, 240});
    KvDeskObjectLayer layer;
    draw(&layer);
    const QRectF before = rect(left);
    m_document.addObject(left.type, polygon({{20, 60}, {60, 20}}), QString(), QString(), left.id);
    layer.invalidate(before);
    layer.invalidate(rect(left));
    QCOMPARE(draw(&layer), drawAnew());
    QCOMPARE(layer.drawnObjects(), 3);
    // Nothing was said about this one.
    m_document.addObject(right.type, polygon({{100, 200}, {140, 240}}), QString(), QString(), right.id);
    QVERIFY(draw(&layer) != drawAnew());
}

void KvDeskObjectLayerTest::liftedObjectsAreLeftOut()
{
    line({20, 20}, {60, 60});
    KvDeskObjectLayer layer;
    const QImage alone = draw(&layer);
    const KvDeskObjectId lifted = line({100, 100}, {160, 120});
    layer.lift(lifted);
    QVERIFY(layer.isLifted(lifted));
    layer.invalidate();
    QCOMPARE(draw(&layer), alone);
}

void KvDeskObjectLayerTest::settledObjectsComeBack()
{
    const KvDeskObjectId object = line({100, 100}, {160, 120});
    KvDeskObjectLayer layer;
    layer.lift(object);
    draw(&layer);
    layer.settle(object, rect(object));
    QVERIFY(!layer.isLifted(object));
    QCOMPARE(draw(&layer), drawAnew());
    QCOMPARE(layer.drawnObjects(), 1);
}

void KvDeskObjectLayerTest::manyObjectsAreRough()
{
    addCircles(KvDeskObjectLayer::mostInFull);
    KvDeskObjectLayer layer;
    draw(&layer);
    QVERIFY(!layer.isRough());
    addCircles(1);
    layer.invalidate();
    const QImage rough = draw(&layer);
    QVERIFY(layer.isRough());
    // Every circle is there: bright on its rim, nothing in its middle.
    for (int i = 0; i < KvDeskObjectLayer::mostInFull; ++i) {
        const QPoint centre(4 + 8 * (i % 50), 4 + 8 * (i / 50));
        QCOMPARE(qAlpha(rough.pixel(centre)), 0);
        QCOMPARE(qAlpha(rough.pixel(centre + QPoint(3, 0))), 255);
        QCOMPARE(qAlpha(rough.pixel(centre - QPoint(0, 3))), 255);
    }
}

void KvDeskObjectLayerTest::manyPlacesOfACounterAreRough()
{
    QPolygonF places;
    for (int i = 0; i < KvDeskObjectLayer::mostPointsInFull; ++i)
        places.append(QPointF(i % 400, i / 400));
    m_document.addObject(ZtDrawnType::Counter, places, QString(), QString(), 1);
    KvDeskObjectLayer layer;
    draw(&layer);
    QVERIFY(!layer.isRough());
    places.append(QPointF(200, 200));
    m_document.addObject(ZtDrawnType::Counter, places, QString(), QString(), 1);
    layer.invalidate();
    QCOMPARE(qAlpha(draw(&layer).pixel(203, 200)), 255);
    QVERIFY(layer.isRough());
}

void KvDeskObjectLayerTest::roughnessFollowsTheView()
{
    addCircles(KvDeskObjectLayer::mostInFull + 200);
    KvDeskObjectLayer layer;
    draw(&layer);
    QVERIFY(layer.isRough());
    const QTransform enlarged = QTransform::fromScale(4.0, 4.0);
    QVERIFY(draw(&layer, enlarged) != drawAnew(enlarged));
    QVERIFY(layer.isStretched());
    layer.sharpen();
    QCOMPARE(draw(&layer, enlarged), drawAnew(enlarged));
    QVERIFY(!layer.isStretched());
    QVERIFY(!layer.isRough());
    draw(&layer);
    QVERIFY(layer.isRough());
}

void KvDeskObjectLayerTest::stretchedPicturesTurnBackIntoSharpOnes()
{
    addCircles(KvDeskObjectLayer::mostInFull + 1);
    KvDeskObjectLayer layer;
    const QImage before = draw(&layer);
    const qint64 drawn = layer.drawnObjects();
    QVERIFY(draw(&layer, QTransform::fromScale(0.5, 0.5)) != before);
    QVERIFY(layer.isStretched());
    QCOMPARE(draw(&layer), before);
    QVERIFY(!layer.isStretched());
    QCOMPARE(layer.drawnObjects(), drawn);
    // Nothing is out of date.
    layer.sharpen();
    QCOMPARE(draw(&layer), before);
    QCOMPARE(layer.drawnObjects(), drawn);
    // Another size of the view's pixels is no zooming.
    QCOMPARE(draw(&layer, QTransform::fromScale(0.5, 0.5), 2.0),
             drawAnew(QTransform::fromScale(0.5, 0.5), 2.0));
}

void KvDeskObjectLayerTest::oneObjectMoreRedrawsEverythingOnce()
{
    addCircles(KvDeskObjectLayer::mostInFull);
    KvDeskObjectLayer layer;
    draw(&layer);
    const KvDeskObjectId added = line({200, 150}, {220, 160});
    layer.invalidate(rect(added));
    QCOMPARE(draw(&layer), drawAnew());
    QVERIFY(layer.isRough());
    // One that comes and goes does not change everything each time.
    const qint64 drawn = layer.drawnObjects();
    remove(&layer, added);
    draw(&layer);
    QVERIFY(layer.isRough());
    QVERIFY(layer.drawnObjects() - drawn < 100);
    for (int id = 1; id <= KvDeskObjectLayer::mostInFull / 4; ++id)
        remove(&layer, {ZtDrawnType::Circle, id});
    QCOMPARE(draw(&layer), drawAnew());
    QVERIFY(!layer.isRough());
}

void KvDeskObjectLayerTest::picturesDrawnAnewAreInFull()
{
    addCircles(KvDeskObjectLayer::mostInFull + 1);
    KvDeskObjectLayer layer;
    draw(&layer);
    QVERIFY(layer.isRough());
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Circle, 1);
    layer.invalidate();
    QCOMPARE(draw(&layer), drawAnew());
    QVERIFY(!layer.isRough());
}

void KvDeskObjectLayerTest::roughPicturesAreKept()
{
    addCircles(KvDeskObjectLayer::mostInFull + 200);
    KvDeskObjectLayer layer;
    draw(&layer);
    const qint64 before = layer.drawnObjects();
    const KvDeskObjectId added = line({200, 150}, {220, 160});
    layer.invalidate(rect(added));
    draw(&layer);
    QVERIFY(layer.isRough());
    QVERIFY2(layer.drawnObjects() - before < 100, qPrintable(QString::number(layer.drawnObjects() - before)));
}

void KvDeskObjectLayerTest::roughPicturesScroll()
{
    addCircles(KvDeskObjectLayer::mostInFull + 400);
    for (const double ratio : {1.0, 2.0}) {
        KvDeskObjectLayer layer;
        draw(&layer, QTransform(), ratio);
        const qint64 before = layer.drawnObjects();
        const QTransform moved = QTransform::fromTranslate(-16, -8);
        QCOMPARE(draw(&layer, moved, ratio), drawAnew(moved, ratio));
        QVERIFY(layer.isRough());
        QVERIFY(layer.drawnObjects() - before < 600);
    }
}

void KvDeskObjectLayerTest::burntPicturesAreAlwaysInFull()
{
    const QImage empty(viewSize, QImage::Format_RGB32);
    const auto burnt = [&empty] {
        QImage filled = empty;
        filled.fill(Qt::darkGray);
        ZtImage image(filled);
        ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, QTransform(), {ZtDrawnType::Circle});
        return image.getQImage().copy(0, 0, 100, 100);
    };
    addCircles(KvDeskObjectLayer::mostInFull);
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Circle, KvDeskObjectLayer::mostInFull);
    const QImage few = burnt();
    // Far away from the part that is compared.
    for (int i = 0; i < 50; ++i)
        m_document.addObject(ZtDrawnType::Circle, polygon({{380, 280}, {383, 280}}));
    KvDeskObjectLayer layer;
    draw(&layer);
    QVERIFY(layer.isRough());
    QCOMPARE(burnt(), few);
}

STATREPORT_TEST_MAIN(KvDeskObjectLayerTest)
#include "KvDeskObjectLayerTest.moc"
