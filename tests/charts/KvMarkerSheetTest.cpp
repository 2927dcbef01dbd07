// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "charts/KvMarkerSheet.h"

#include <QPainter>
#include <QPicture>

#include <cmath>

using kvCharts::KvMarkerSheet;

class KvMarkerSheetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void looksLikeEllipses_data();
    void looksLikeEllipses();
    void isExactAtItsSteps();
    void leavesOutWhatNoDeviceReaches();
    void keepsPainterAsItIs();
    void isWorthwhileForManySmallMarkers();
    void isNotWorthwhile_data();
    void isNotWorthwhile();
    void isNotWorthwhileForVectors();
};

namespace {

constexpr int kMany = 4000;
constexpr int kSide = 300;
const QRectF kMarker(-2, -2, 5, 5);
const QColor kColor(255, 87, 34);

QImage blankImage()
{
    QImage image(kSide, kSide, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    return image;
}

void setUp(QPainter *painter)
{
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setPen(ItemByItem::cosmeticPen(kColor));
    painter->setBrush(kColor);
}

// Spread over places within a pixel, partly beyond all edges of the image.
QVector<QPointF> scatteredPoints()
{
    QVector<QPointF> points;
    for (int i = 0; i < 200; ++i)
        points.append(QPointF(150 + 160 * std::sin(i * 12.9898), 150 + 160 * std::cos(i * 78.233)));
    return points;
}

void drawEllipses(QPainter *painter, const QVector<QPointF> &points)
{
    for (const QPointF &point : points)
        painter->drawEllipse(kMarker.translated(point));
}

template <class Draw>
QImage drawn(const QTransform &transform, qreal pixelRatio, Draw draw)
{
    QImage image = blankImage();
    image.setDevicePixelRatio(pixelRatio);
    QPainter painter(&image);
    setUp(&painter);
    painter.setTransform(transform);
    draw(&painter);
    painter.end();
    image.setDevicePixelRatio(1.0);
    return image;
}

} // namespace

void KvMarkerSheetTest::looksLikeEllipses_data()
{
    QTest::addColumn<QTransform>("transform");
    QTest::addColumn<qreal>("pixelRatio");
    QTest::newRow("as it is") << QTransform() << 1.0;
    QTest::newRow("moved") << QTransform::fromTranslate(10.3, -20.7) << 1.0;
    QTest::newRow("smaller") << QTransform::fromScale(0.72, 0.72) << 1.0;
    QTest::newRow("larger, moved") << QTransform(2.3, 0, 0, 1.9, -140.5, -60.2) << 1.0;
    QTest::newRow("upside down") << QTransform(1, 0, 0, -1, 0, 300) << 1.0;
    QTest::newRow("dense screen") << QTransform::fromScale(0.5, 0.5) << 2.0;
}

void KvMarkerSheetTest::looksLikeEllipses()
{
    QFETCH(QTransform, transform);
    QFETCH(qreal, pixelRatio);
    const QVector<QPointF> points = scatteredPoints();
    const QImage ellipses =
        drawn(transform, pixelRatio, [&](QPainter *painter) { drawEllipses(painter, points); });
    const QImage sheet = drawn(transform, pixelRatio, [&](QPainter *painter) {
        QVERIFY(KvMarkerSheet::isWorthwhile(*painter, kMarker, kMany));
        KvMarkerSheet(*painter, kMarker).draw(painter, points);
    });
    QVERIFY(ItemByItem::inkedPixels(ellipses) > 1000);
    // A sixty-fourth of a pixel changes an edge by about 4 of 255, at each of its two sides.
    const int difference = ItemByItem::difference(sheet, ellipses);
    QVERIFY2(difference <= 10, qPrintable(QString::number(difference)));
}

void KvMarkerSheetTest::isExactAtItsSteps()
{
    QVector<QPointF> points;
    for (int i = 0; i < 256; ++i)
        points.append(QPointF(10 + (i % 16) * 17.0625, 10 + (i / 16) * 17.0625));
    const QImage ellipses =
        drawn(QTransform(), 1.0, [&](QPainter *painter) { drawEllipses(painter, points); });
    const QImage sheet = drawn(QTransform(), 1.0, [&](QPainter *painter) {
        KvMarkerSheet(*painter, kMarker).draw(painter, points);
    });
    QVERIFY(ItemByItem::inkedPixels(ellipses) > 1000);
    // Fill and outline are blended with each other first instead of with the paper, which rounds otherwise.
    const int difference = ItemByItem::difference(sheet, ellipses);
    QVERIFY2(difference <= 2, qPrintable(QString::number(difference)));
}

void KvMarkerSheetTest::leavesOutWhatNoDeviceReaches()
{
    const QVector<QPointF> points{{1e300, 5}, {5, -1e300}, {-4e9, 4e9}, {50, 50}};
    const QImage sheet = drawn(QTransform(), 1.0, [&](QPainter *painter) {
        KvMarkerSheet(*painter, kMarker).draw(painter, points);
    });
    const QImage ellipse =
        drawn(QTransform(), 1.0, [](QPainter *painter) { drawEllipses(painter, {QPointF(50, 50)}); });
    QVERIFY(ItemByItem::inkedPixels(ellipse) > 10);
    QVERIFY(ItemByItem::difference(sheet, ellipse) <= 1);
}

void KvMarkerSheetTest::keepsPainterAsItIs()
{
    const QTransform transform(0.72, 0, 0, 0.72, 3.5, 4.5);
    drawn(transform, 1.0, [&](QPainter *painter) {
        KvMarkerSheet(*painter, kMarker).draw(painter, scatteredPoints());
        QCOMPARE(painter->transform(), transform);
        QCOMPARE(painter->pen(), ItemByItem::cosmeticPen(kColor));
    });
}

void KvMarkerSheetTest::isWorthwhileForManySmallMarkers()
{
    QImage image = blankImage();
    QPainter painter(&image);
    setUp(&painter);
    QVERIFY(!KvMarkerSheet::isWorthwhile(painter, kMarker, 2047));
    QVERIFY(KvMarkerSheet::isWorthwhile(painter, kMarker, 2048));
}

void KvMarkerSheetTest::isNotWorthwhile_data()
{
    QTest::addColumn<QTransform>("transform");
    QTest::addColumn<QPen>("pen");
    QTest::addColumn<QBrush>("brush");
    QTest::addColumn<qreal>("opacity");
    QTest::addColumn<int>("mode");
    const QPen pen = ItemByItem::cosmeticPen(kColor);
    const QBrush brush(kColor);
    const int over = QPainter::CompositionMode_SourceOver;
    QTest::newRow("turned") << QTransform().rotate(30) << pen << brush << 1.0 << over;
    QTest::newRow("flat") << QTransform::fromScale(1, 0) << pen << brush << 1.0 << over;
    QTest::newRow("large") << QTransform::fromScale(6, 6) << pen << brush << 1.0 << over;
    QTest::newRow("huge") << QTransform::fromScale(1e12, 1e12) << pen << brush << 1.0 << over;
    QTest::newRow("wide pen") << QTransform() << ItemByItem::cosmeticPen(kColor, 40) << brush << 1.0 << over;
    QTest::newRow("pen that scales") << QTransform() << QPen(kColor, 2) << brush << 1.0 << over;
    QTest::newRow("pattern") << QTransform() << pen << QBrush(kColor, Qt::Dense4Pattern) << 1.0 << over;
    QTest::newRow("half seen") << QTransform() << pen << brush << 0.5 << over;
    QTest::newRow("blended") << QTransform() << pen << brush << 1.0
                             << int(QPainter::CompositionMode_Multiply);
}

void KvMarkerSheetTest::isNotWorthwhile()
{
    QFETCH(QTransform, transform);
    QFETCH(QPen, pen);
    QFETCH(QBrush, brush);
    QFETCH(qreal, opacity);
    QFETCH(int, mode);
    QImage image = blankImage();
    QPainter painter(&image);
    setUp(&painter);
    painter.setPen(pen);
    painter.setBrush(brush);
    painter.setOpacity(opacity);
    painter.setCompositionMode(static_cast<QPainter::CompositionMode>(mode));
    painter.setTransform(transform);
    QVERIFY(!KvMarkerSheet::isWorthwhile(painter, kMarker, kMany));
}

void KvMarkerSheetTest::isNotWorthwhileForVectors()
{
    QPicture picture;
    QPainter painter(&picture);
    setUp(&painter);
    QVERIFY(!KvMarkerSheet::isWorthwhile(painter, kMarker, kMany));
}

STATREPORT_TEST_MAIN(KvMarkerSheetTest)
#include "KvMarkerSheetTest.moc"
