// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineParts.h"
#include "charts/KvLineSerie.h"
#include "charts/KvLineSeriesItem.h"
#include "data/KvStatisticsEngine.h"

using namespace kvCharts;

class KvLinePartsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void pointsAndLine();
    void unknownCategory();
    void theOrigin();
    void valuesThatAreNoNumbers();
    void limits();
    void trend();
    void noTrend_data();
    void noTrend();
    void noTrendAtOneX();
    void penStyles();
    void looksLikeSingleItems();
};

namespace {

QString name(const char *latin)
{
    return QString::fromLatin1(latin);
}

KvCategoryList categories(int count)
{
    KvCategoryList list;
    for (int i = 0; i < count; ++i)
        list.add(QString::number(i));
    return list;
}

void draw(const KvLineSerie &serie, int categoryCount, QGraphicsScene *scene)
{
    const KvChartThemes themes;
    KvLineParts part(&serie, categories(categoryCount), KvLineGeometry::scale(categoryCount, 0.0, 10.0));
    part.draw(scene, &themes);
}

} // namespace

void KvLinePartsTest::pointsAndLine()
{
    KvLineSerie serie(name("a"), Qt::red);
    serie.addPoint(name("0"), 10.0);
    serie.addPoint(name("1"), 0.0);
    serie.addPoint(name("1"), 5.0);
    QGraphicsScene scene;
    draw(serie, 2, &scene);
    QCOMPARE(scene.items().size(), 1);
    const KvLineSeriesItem *item = itemsOf<KvLineSeriesItem>(&scene).first();
    const QVector<QPointF> expected{{250, 0}, {750, 1000}, {750, 500}};
    QCOMPARE(item->points(), expected);
    QCOMPARE(item->runs(), QVector<QVector<QPointF>>{expected});
    QCOMPARE(item->pen().color(), QColor(Qt::red));
    QVERIFY(item->pen().isCosmetic());
}

void KvLinePartsTest::unknownCategory()
{
    KvLineSerie serie(name("a"), Qt::red);
    serie.addPoint(name("nowhere"), 5.0);
    QGraphicsScene scene;
    draw(serie, 2, &scene);
    QCOMPARE(itemsOf<KvLineSeriesItem>(&scene).first()->points(), QVector<QPointF>{QPointF(-250, 500)});
}

void KvLinePartsTest::theOrigin()
{
    const KvChartThemes themes;
    KvLineSerie serie(name("a"), Qt::red);
    for (const char *category : {"1", "0", "1"})
        serie.addPoint(name(category), 10.0);
    // With no offset category 0 stands at x = 0, where the greatest value lies at the null point.
    KvLineParts part(&serie, categories(2), {0.0, 500.0, 0.0, 10.0});
    QGraphicsScene scene;
    part.draw(&scene, &themes);
    const QVector<QVector<QPointF>> runs{{{500, 0}, {0, 0}}};
    QCOMPARE(itemsOf<KvLineSeriesItem>(&scene).first()->runs(), runs);
}

void KvLinePartsTest::valuesThatAreNoNumbers()
{
    KvLineSerie serie(name("a"), Qt::red);
    serie.setShowTrend(true);
    serie.addPoint(name("0"), qQNaN());
    serie.addPoint(name("1"), qInf());
    QGraphicsScene none;
    draw(serie, 4, &none);
    QVERIFY(none.items().isEmpty());
    serie.addPoint(name("2"), 5.0);
    serie.addPoint(name("3"), 5.0);
    QGraphicsScene scene;
    draw(serie, 4, &scene);
    QCOMPARE(itemsOf<KvLineSeriesItem>(&scene).first()->points().size(), 2);
    QCOMPARE(itemsOf<QGraphicsLineItem>(&scene).first()->line(), QLineF(-50, 500, 1050, 500));
}

void KvLinePartsTest::limits()
{
    KvLineSerie serie(name("a"), Qt::red);
    serie.addPoint(name("0"), 5.0);
    serie.setLimits(2.0, 8.0);
    QGraphicsScene hidden;
    draw(serie, 1, &hidden);
    QVERIFY(itemsOf<QGraphicsLineItem>(&hidden).isEmpty());
    serie.setShowLimits(true);
    QGraphicsScene scene;
    draw(serie, 1, &scene);
    const auto lines = itemsOf<QGraphicsLineItem>(&scene);
    QCOMPARE(lines.size(), 2);
    QCOMPARE(lines.at(0)->line(), QLineF(0, 200, 1000, 200)); // the upper one first
    QCOMPARE(lines.at(1)->line(), QLineF(0, 800, 1000, 800));
}

void KvLinePartsTest::trend()
{
    KvLineSerie serie(name("a"), Qt::red);
    serie.addPoint(name("0"), 4.0);
    serie.addPoint(name("1"), 6.0);
    serie.setShowTrend(true);
    QGraphicsScene scene;
    draw(serie, 2, &scene);
    // Through (250, 600) and (750, 400).
    const auto lines = itemsOf<QGraphicsLineItem>(&scene);
    QCOMPARE(lines.size(), 1);
    QVERIFY((lines.first()->line().p1() - QPointF(-50, 720)).manhattanLength() < 1e-6);
    QVERIFY((lines.first()->line().p2() - QPointF(1050, 280)).manhattanLength() < 1e-6);
}

void KvLinePartsTest::noTrend_data()
{
    QTest::addColumn<QStringList>("at");
    QTest::addColumn<bool>("show");
    QTest::newRow("not shown") << QStringList{name("0"), name("1")} << false;
    QTest::newRow("one point") << QStringList{name("0")} << true;
    QTest::newRow("no points") << QStringList{} << true;
    QTest::newRow("all at one x") << QStringList{name("1"), name("1"), name("1")} << true;
}

void KvLinePartsTest::noTrend()
{
    QFETCH(QStringList, at);
    QFETCH(bool, show);
    KvLineSerie serie(name("a"), Qt::red);
    serie.setShowTrend(show);
    double value = 1.0;
    for (const QString &category : qAsConst(at))
        serie.addPoint(category, value *= 2);
    QGraphicsScene scene;
    draw(serie, 2, &scene);
    QVERIFY(itemsOf<QGraphicsLineItem>(&scene).isEmpty());
}

// Whatever the mean of many equal numbers rounds to: thirds and sevenths are no exact ones.
void KvLinePartsTest::noTrendAtOneX()
{
    for (int categoryCount = 2; categoryCount <= 13; ++categoryCount) {
        KvLineSerie serie(name("a"), Qt::red);
        serie.setShowTrend(true);
        for (int count = 1; count <= 30; ++count) {
            serie.addPoint(name("0"), (count * 37) % 11 * 0.9);
            QGraphicsScene scene;
            draw(serie, categoryCount, &scene);
            QVERIFY2(itemsOf<QGraphicsLineItem>(&scene).isEmpty(),
                     qPrintable(QStringLiteral("%1 of %2").arg(count).arg(categoryCount)));
        }
        serie.addPoint(name("1"), 5.0);
        QGraphicsScene scene;
        draw(serie, categoryCount, &scene);
        QCOMPARE(itemsOf<QGraphicsLineItem>(&scene).size(), 1);
    }
}

void KvLinePartsTest::penStyles()
{
    KvLineSerie serie(name("a"), Qt::red);
    serie.addPoint(name("0"), 4.0);
    serie.addPoint(name("1"), 6.0);
    serie.setLimits(2.0, 8.0);
    serie.setShowLimits(true);
    serie.setShowTrend(true);
    QGraphicsScene scene;
    draw(serie, 2, &scene);
    const auto lines = itemsOf<QGraphicsLineItem>(&scene);
    const QVector<QVector<qreal>> dashes{{1, 6}, {1, 6}, {6, 8}};
    QCOMPARE(lines.size(), 3);
    for (int i = 0; i < 3; ++i) {
        QCOMPARE(lines.at(i)->pen().dashPattern(), dashes.at(i));
        QCOMPARE(lines.at(i)->pen().color(), QColor(Qt::red));
        QCOMPARE(lines.at(i)->pen().widthF(), 1.0);
        QVERIFY(lines.at(i)->pen().isCosmetic());
    }
}

// Points, limits and a trend line that leaves the plot at the right: everything a series can show.
void KvLinePartsTest::looksLikeSingleItems()
{
    const QColor color(255, 87, 34);
    KvLineSerie serie(name("a"), color);
    serie.setLimits(2.5, 7.75);
    serie.setShowLimits(true);
    serie.setShowTrend(true);
    QGraphicsScene single;
    QVector<QPointF> points;
    for (int i = 0; i < 20; ++i) {
        const double value = i < 3 ? 0.0 : 10.0 - 10.0 / i;
        serie.addPoint(QString::number(i), value);
        points.append(QPointF(i * 50 + 25, 1000 - value * 100));
    }
    ItemByItem::addSeries(&single, points, color);
    QPen pen = ItemByItem::cosmeticPen(color);
    pen.setDashPattern({1, 6});
    single.addLine(0, 225, 1000, 225, pen);
    single.addLine(0, 750, 1000, 750, pen);
    const QPair<double, double> line = KvStatisticsEngine::regression(points);
    const double right = line.first * 1050 + line.second;
    QVERIFY(line.second - 50 * line.first < 1050 && right < -50);
    pen.setDashPattern({6, 8});
    single.addLine(QLineF(-50, line.second - 50 * line.first, (-50 - line.second) / line.first, -50), pen);
    QGraphicsScene scene;
    draw(serie, 20, &scene);
    QVERIFY(ItemByItem::sameRect(scene.itemsBoundingRect(), single.itemsBoundingRect()));
    const QRectF source(-100, -100, 1200, 1200);
    const QImage picture = ItemByItem::picture(&scene, source);
    QVERIFY(ItemByItem::inkedPixels(picture) > 1000);
    // Lines are drawn under all markers instead of in turn: the same up to the rounding of two smooth edges.
    QVERIFY(ItemByItem::difference(picture, ItemByItem::picture(&single, source)) <= 2);
}

STATREPORT_TEST_MAIN(KvLinePartsTest)
#include "KvLinePartsTest.moc"
