// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "charts/KvLineGeometry.h"
#include "charts/KvLineSeriesItem.h"
#include <QBuffer>
#include <QGraphicsEllipseItem>
#include <QPainter>
#include <QPdfWriter>
#include <QPicture>
#include <cmath>

using kvCharts::KvLineSeriesItem;

class KvLineSeriesItemTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void looksLikeSingleItems_data();
    void looksLikeSingleItems();
    void thousandsLookLikeSingleItems();
    void markersStandAroundThePoint();
    void staysVectorsInPdf();
    void pdfDotsAreAsLargeAsEllipses();
};

namespace {

QVector<QPointF> zigzag(int count)
{
    QVector<QPointF> points;
    for (int i = 0; i < count; ++i)
        points.append(QPointF(1000.0 * (i + 0.5) / count, 500 + 400 * std::sin(i * 12.9898)));
    return points;
}

KvLineSeriesItem *makeItem(const QVector<QPointF> &points, const QColor &color)
{
    return new KvLineSeriesItem(points, kvCharts::KvLineGeometry::joinedRuns(points),
                                ItemByItem::cosmeticPen(color), QBrush(color));
}

QByteArray pdf(QGraphicsScene *scene)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    QPdfWriter writer(&buffer);
    QPainter painter(&writer);
    scene->render(&painter, QRectF(0, 0, 8000, 8000), QRectF(-50, -50, 1100, 1100));
    painter.end();
    return buffer.data();
}

} // namespace

void KvLineSeriesItemTest::looksLikeSingleItems_data()
{
    QTest::addColumn<QVector<QPointF>>("points");
    QTest::newRow("one") << zigzag(1);
    QTest::newRow("two") << zigzag(2);
    QTest::newRow("many") << zigzag(200);
    QTest::newRow("through the origin")
        << QVector<QPointF>{{300, 200}, {0, 0}, {500, 700}, {900, 30}, {0, 0}, {0, 0}, {40, 900}};
    QTest::newRow("outside the plot") << QVector<QPointF>{{-300, 200}, {500, 1700}};
}

void KvLineSeriesItemTest::looksLikeSingleItems()
{
    QFETCH(QVector<QPointF>, points);
    QGraphicsScene combined;
    QGraphicsScene single;
    combined.addItem(makeItem(points, QColor(255, 87, 34)));
    ItemByItem::addSeries(&single, points, QColor(255, 87, 34));
    QCOMPARE(combined.items().size(), 1);
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    const QRectF source(-350, -50, 2000, 2000);
    const QImage picture = ItemByItem::picture(&combined, source);
    QVERIFY(ItemByItem::inkedPixels(picture) > 5);
    // Lines are drawn under all markers instead of in turn: the same up to the rounding of two smooth edges.
    QVERIFY(ItemByItem::difference(picture, ItemByItem::picture(&single, source)) <= 2);
}

void KvLineSeriesItemTest::thousandsLookLikeSingleItems()
{
    QGraphicsScene combined;
    QGraphicsScene single;
    const QVector<QPointF> points = zigzag(4000);
    combined.addItem(makeItem(points, QColor(255, 87, 34)));
    ItemByItem::addSeries(&single, points, QColor(255, 87, 34));
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    const QRectF source(-50, -50, 1100, 1100);
    const QImage picture = ItemByItem::picture(&combined, source);
    QVERIFY(ItemByItem::inkedPixels(picture) > 5000);
    // Markers stand at thirty-seconds of a pixel, which shows at their edges alone, and hardly.
    const int difference = ItemByItem::difference(picture, ItemByItem::picture(&single, source));
    QVERIFY2(difference <= 12, qPrintable(QString::number(difference)));
}

void KvLineSeriesItemTest::markersStandAroundThePoint()
{
    QCOMPARE(KvLineSeriesItem::markerRect(QPointF(10, 20)), QRectF(8, 18, 5, 5));
}

void KvLineSeriesItemTest::staysVectorsInPdf()
{
    QGraphicsScene combined;
    QGraphicsScene single;
    const QVector<QPointF> points = zigzag(2000);
    combined.addItem(makeItem(points, Qt::red));
    ItemByItem::addSeries(&single, points, Qt::red);
    const QByteArray document = pdf(&combined);
    QVERIFY(!document.contains("/Subtype /Image"));
    QVERIFY(document.size() * 3 < pdf(&single).size());
}

void KvLineSeriesItemTest::pdfDotsAreAsLargeAsEllipses()
{
    // The vector way of drawing, shown on pixels through a picture, which is no raster device either.
    QGraphicsScene combined;
    QGraphicsScene single;
    combined.addItem(makeItem({QPointF(50, 50)}, Qt::red));
    ItemByItem::addSeries(&single, {QPointF(50, 50)}, Qt::red);
    QPicture picture;
    QPainter recorder(&picture);
    recorder.setTransform(QTransform::fromScale(8, 8));
    const QGraphicsItem *item = combined.items().first();
    const_cast<QGraphicsItem *>(item)->paint(&recorder, nullptr, nullptr);
    recorder.end();
    QImage dots(900, 900, QImage::Format_ARGB32_Premultiplied);
    dots.fill(Qt::white);
    QPainter painter(&dots);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.drawPicture(0, 0, picture);
    painter.end();
    single.setBackgroundBrush(Qt::white);
    const QImage ellipses = ItemByItem::picture(&single, QRectF(0, 0, 112.5, 112.5));
    QVERIFY(ItemByItem::inkedPixels(ellipses) > 1000);
    int different = 0;
    for (int y = 0; y < 900; ++y) {
        for (int x = 0; x < 900; ++x)
            different += qAbs(qGreen(dots.pixel(x, y)) - qGreen(ellipses.pixel(x, y))) > 64 ? 1 : 0;
    }
    QVERIFY2(different < 20, qPrintable(QString::number(different)));
}

STATREPORT_TEST_MAIN(KvLineSeriesItemTest)
#include "KvLineSeriesItemTest.moc"
