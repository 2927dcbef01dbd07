// SPDX-License-Identifier: MIT
#include "KvDeskRoughObjects.h"

#include "KvDeskObjectShape.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QPainter>

#include <cmath>

namespace {

struct Sample
{
    int type;
    QPolygonF points;
};

const QVector<Sample> &samples()
{
    static const QVector<Sample> all{
        {ZtDrawnType::Rectangle, polygon({{10, 10}, {70, 50}})},
        {ZtDrawnType::Line, polygon({{10, 50}, {70, 10}})},
        {ZtDrawnType::Arc, polygon({{10, 40}, {40, 10}, {70, 40}})},
        {ZtDrawnType::Polygon, polygon({{10, 10}, {70, 20}, {40, 60}})},
        {ZtDrawnType::Polyline, polygon({{10, 10}, {70, 20}, {40, 60}})},
        {ZtDrawnType::ParallelDistance, polygon({{10, 10}, {70, 10}, {40, 50}})},
        {ZtDrawnType::ScaleBar, polygon({{10, 30}, {70, 30}})},
        {ZtDrawnType::Counter, polygon({{10, 10}, {40, 40}})},
        {ZtDrawnType::Circle, polygon({{40, 40}, {60, 40}})},
    };
    return all;
}

} // namespace

class KvDeskRoughObjectsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void liesWhereTheObjectIs_data();
    void liesWhereTheObjectIs();
    void circlesAreRound_data();
    void circlesAreRound();
    void smallObjectsAreSpecks();
    void farAwayPointsAreKept();
    void textsAreLeftToTheirLabels();
    void goneObjectsAreLeftOut();
    void isSeenOnAnyPicture_data();
    void isSeenOnAnyPicture();
    void leavesThePainterAlone();
    void countersHaveTheirColours();

private:
    QVector<QLineF> lines(int type, const QPolygonF &points, const QTransform &toView)
    {
        const int id = m_document.addObject(type, points);
        KvDeskRoughObjects objects(toView);
        const KvDeskObjectShape shape(type, ZtKernelData::getInstance()->object(type, id));
        objects.add({type, id}, shape.boundingRect());
        return objects.lines();
    }

    ZtMeasuringDocument m_document;
};

void KvDeskRoughObjectsTest::liesWhereTheObjectIs_data()
{
    QTest::addColumn<int>("sample");
    QTest::addColumn<double>("zoom");
    for (int i = 0; i < samples().size(); ++i) {
        const QByteArray name = ZtDrawnType::find(samples().at(i).type)->key;
        QTest::newRow(name + ", enlarged") << i << 2.0;
        QTest::newRow(name + ", large") << i << 20.0;
        QTest::newRow(name + ", reduced") << i << 0.25;
    }
}

void KvDeskRoughObjectsTest::liesWhereTheObjectIs()
{
    QFETCH(int, sample);
    QFETCH(double, zoom);
    const Sample &object = samples().at(sample);
    const QTransform toView = QTransform::fromScale(zoom, zoom) * QTransform::fromTranslate(-30, 7);
    const QVector<QLineF> drawn = lines(object.type, object.points, toView);
    QVERIFY(!drawn.isEmpty());
    const int id = ZtKernelData::getInstance()->objects().value(object.type).lastKey();
    const KvDeskObjectShape shape(object.type, ZtKernelData::getInstance()->object(object.type, id));
    const QTransform toScene = toView.inverted();
    // Arms of markers are four pixels long.
    const double tolerance = (object.type == ZtDrawnType::Counter ? 5.5 : 2.0) / zoom;
    for (const QLineF &line : drawn) {
        for (const double share : {0.0, 0.5, 1.0})
            QVERIFY2(shape.isAt(toScene.map(line.pointAt(share)), tolerance),
                     qPrintable(QString::number(share)));
    }
}

void KvDeskRoughObjectsTest::circlesAreRound_data()
{
    QTest::addColumn<double>("radius");
    for (const double radius : {1.5, 3.0, 5.9, 6.1, 23.0, 25.0, 90.0, 110.0, 1000.0})
        QTest::newRow(QByteArray::number(radius)) << radius;
}

void KvDeskRoughObjectsTest::circlesAreRound()
{
    QFETCH(double, radius);
    const QPointF centre(300, 200);
    double length = 0.0;
    for (const QLineF &line :
         lines(ZtDrawnType::Circle, polygon({centre, centre + QPointF(radius, 0)}), {})) {
        for (const double share : {0.0, 0.5, 1.0})
            QVERIFY(std::abs(QLineF(centre, line.pointAt(share)).length() - radius) <= 1.7);
        length += line.length();
    }
    // All around.
    QVERIFY(length > 0.95 * 2.0 * std::acos(-1.0) * radius - 2.0);
}

void KvDeskRoughObjectsTest::smallObjectsAreSpecks()
{
    const QTransform toView = QTransform::fromScale(0.01, 0.01);
    const QVector<QLineF> drawn =
        lines(ZtDrawnType::Polygon, polygon({{500, 500}, {560, 500}, {530, 560}}), toView);
    QCOMPARE(drawn.size(), 1);
    QVERIFY(QLineF(drawn.first().center(), QPointF(5.3, 5.3)).length() < 1.0);
}

void KvDeskRoughObjectsTest::farAwayPointsAreKept()
{
    const QVector<QLineF> drawn =
        lines(ZtDrawnType::Line, polygon({{-1e9, -1e9}, {1e9, 1e9}}), QTransform::fromScale(64.0, 64.0));
    QCOMPARE(drawn.size(), 1);
    QCOMPARE(drawn.first().p1(), QPointF(-64e9, -64e9));
    QCOMPARE(drawn.first().p2(), QPointF(64e9, 64e9));
}

void KvDeskRoughObjectsTest::textsAreLeftToTheirLabels()
{
    QVERIFY(lines(ZtDrawnType::TextNote, polygon({{10, 10}}), {}).isEmpty());
}

void KvDeskRoughObjectsTest::goneObjectsAreLeftOut()
{
    KvDeskRoughObjects objects{QTransform()};
    objects.add({ZtDrawnType::Polygon, 4711}, QRectF(0, 0, 50, 50));
    QVERIFY(objects.lines().isEmpty());
}

void KvDeskRoughObjectsTest::isSeenOnAnyPicture_data()
{
    QTest::addColumn<QColor>("background");
    QTest::addColumn<QPointF>("end");
    for (const QColor &background : {QColor(Qt::white), QColor(Qt::black), QColor(255, 214, 64)}) {
        for (const QPointF &end : {QPointF(60, 10), QPointF(60, 60), QPointF(10, 60), QPointF(60, 30)})
            QTest::addRow("%s to %g, %g", qPrintable(background.name()), end.x(), end.y())
                << background << end;
    }
}

void KvDeskRoughObjectsTest::isSeenOnAnyPicture()
{
    QFETCH(QColor, background);
    QFETCH(QPointF, end);
    const int id = m_document.addObject(ZtDrawnType::Line, polygon({{10, 10}, end}));
    KvDeskRoughObjects objects{QTransform()};
    objects.add({ZtDrawnType::Line, id}, QRectF(QPointF(10, 10), end));
    QImage image(80, 80, QImage::Format_ARGB32_Premultiplied);
    image.fill(background);
    QPainter painter(&image);
    objects.draw(&painter);
    painter.end();
    int different = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            different += qAbs(qGray(image.pixel(x, y)) - qGray(background.rgb())) > 100 ? 1 : 0;
    }
    QVERIFY2(different >= 45 && different < 150, qPrintable(QString::number(different)));
}

void KvDeskRoughObjectsTest::leavesThePainterAlone()
{
    KvDeskRoughObjects objects{QTransform()};
    QImage image(8, 8, QImage::Format_RGB32);
    QPainter painter(&image);
    painter.scale(2.0, 2.0);
    painter.setRenderHint(QPainter::Antialiasing);
    objects.draw(&painter);
    QCOMPARE(painter.worldTransform(), QTransform::fromScale(2.0, 2.0));
    QVERIFY(painter.testRenderHint(QPainter::Antialiasing));
    QCOMPARE(painter.pen(), QPen());
}

void KvDeskRoughObjectsTest::countersHaveTheirColours()
{
    m_document.clear();
    KvDeskRoughObjects objects{QTransform()};
    QImage image(80, 40, QImage::Format_RGB32);
    for (int round = 0; round < 2; ++round) {
        objects.restart(QTransform());
        image.fill(Qt::gray);
        for (int id = 1; id <= 3; ++id) {
            const QPointF place(20 * id, 20);
            if (round == 0)
                QCOMPARE(m_document.addObject(ZtDrawnType::Counter, polygon({place})), id);
            objects.add({ZtDrawnType::Counter, id}, QRectF(place, place));
        }
        QPainter painter(&image);
        objects.draw(&painter);
        painter.end();
        for (int id = 1; id <= 3; ++id)
            QCOMPARE(image.pixelColor(20 * id, 20), ZtDrawnObjectPainter::counterColor(id));
        QCOMPARE(objects.lines().size(), 6);
    }
}

STATREPORT_TEST_MAIN(KvDeskRoughObjectsTest)
#include "KvDeskRoughObjectsTest.moc"
