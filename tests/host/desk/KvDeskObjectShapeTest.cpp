// SPDX-License-Identifier: MIT
#include "KvDeskObjectShape.h"

#include "host/measuring/Polygon.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtImportedObjectData.h"
#include "support/StatReportTest.h"

#include <QPainter>

namespace {

const QPolygonF pair = polygon({QPointF(10, 20), QPointF(50, 40)});

KvDeskObjectShape shapeOf(int type, const QPolygonF &points)
{
    const ZtDrawnObjectData data(points);
    return KvDeskObjectShape(type, &data);
}

} // namespace

class KvDeskObjectShapeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hits_data();
    void hits();
    void bounds_data();
    void bounds();
    void emptyShapes();
    void highlightKeepsItsWidth();
    void highlightsMarkers();
};

void KvDeskObjectShapeTest::hits_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<QPointF>("point");
    QTest::addColumn<bool>("hit");
    const int rectangle = ZtDrawnType::Rectangle;
    QTest::newRow("corner of a rectangle") << rectangle << pair << QPointF(50, 20) << true;
    QTest::newRow("beside its side") << rectangle << pair << QPointF(53, 30) << true;
    QTest::newRow("too far from it") << rectangle << pair << QPointF(55, 30) << false;
    QTest::newRow("inside it") << rectangle << pair << QPointF(30, 30) << false;
    const QPolygonF level = polygon({QPointF(0, 0), QPointF(100, 0)});
    QTest::newRow("level line") << static_cast<int>(ZtDrawnType::Line) << level << QPointF(40, -3) << true;
    QTest::newRow("beyond its end") << static_cast<int>(ZtDrawnType::Line) << level << QPointF(105, 0)
                                    << false;
    const QPolygonF counted = polygon({QPointF(0, 0), QPointF(90, 90)});
    QTest::newRow("counted place") << static_cast<int>(ZtDrawnType::Counter) << counted << QPointF(88, 91)
                                   << true;
    QTest::newRow("between places") << static_cast<int>(ZtDrawnType::Counter) << counted << QPointF(45, 45)
                                    << false;
    QTest::newRow("rim of a circle") << static_cast<int>(ZtDrawnType::Circle)
                                     << polygon({QPointF(0, 0), QPointF(10, 0)}) << QPointF(0, 11) << true;
}

void KvDeskObjectShapeTest::hits()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    QFETCH(QPointF, point);
    QFETCH(bool, hit);
    QCOMPARE(shapeOf(type, points).isAt(point, 4.0), hit);
}

void KvDeskObjectShapeTest::bounds_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<QRectF>("rect");
    QTest::newRow("rectangle") << static_cast<int>(ZtDrawnType::Rectangle) << pair << QRectF(10, 20, 40, 20);
    QTest::newRow("circle") << static_cast<int>(ZtDrawnType::Circle)
                            << polygon({QPointF(5, 5), QPointF(8, 9)}) << QRectF(0, 0, 10, 10);
    QTest::newRow("counter") << static_cast<int>(ZtDrawnType::Counter) << pair << QRectF(10, 20, 40, 20);
}

void KvDeskObjectShapeTest::bounds()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    QFETCH(QRectF, rect);
    QCOMPARE(shapeOf(type, points).boundingRect(), rect);
}

void KvDeskObjectShapeTest::emptyShapes()
{
    const ZtImportedObjectData imported(0);
    QVERIFY(KvDeskObjectShape(0x20000, &imported).isEmpty());
    QVERIFY(KvDeskObjectShape(ZtDrawnType::Line, nullptr).isEmpty());
    QVERIFY(shapeOf(ZtDrawnType::Line, QPolygonF()).isEmpty());
    // An object of another library may be registered under a built-in type.
    QVERIFY(KvDeskObjectShape(ZtDrawnType::Line, &imported).isEmpty());
    QVERIFY(!KvDeskObjectShape(ZtDrawnType::Line, &imported).isAt(QPointF(), 4.0));
}

void KvDeskObjectShapeTest::highlightKeepsItsWidth()
{
    int widths[2] = {0, 0};
    for (const int zoom : {1, 2}) {
        QImage canvas(100, 100, QImage::Format_RGB32);
        canvas.fill(Qt::black);
        {
            QPainter painter(&canvas);
            painter.scale(zoom, zoom);
            shapeOf(ZtDrawnType::Line, polygon({QPointF(0, 50.0 / zoom), QPointF(100.0 / zoom, 50.0 / zoom)}))
                .drawHighlight(&painter);
        }
        for (int y = 0; y < 100; ++y)
            widths[zoom - 1] += canvas.pixelColor(50, y) != QColor(Qt::black) ? 1 : 0;
    }
    QVERIFY(widths[0] >= 10);
    QCOMPARE(widths[1], widths[0]);
}

void KvDeskObjectShapeTest::highlightsMarkers()
{
    QImage canvas(40, 40, QImage::Format_RGB32);
    canvas.fill(Qt::black);
    {
        QPainter painter(&canvas);
        shapeOf(ZtDrawnType::Counter, polygon({QPointF(20, 20)})).drawHighlight(&painter);
    }
    QCOMPARE(canvas.pixelColor(20, 20), QColor(Qt::black));
    QVERIFY(canvas.pixelColor(29, 20) != QColor(Qt::black));
}

STATREPORT_TEST_MAIN(KvDeskObjectShapeTest)
#include "KvDeskObjectShapeTest.moc"
