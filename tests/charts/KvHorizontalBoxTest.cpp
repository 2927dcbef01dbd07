// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvChartThemes.h"
#include "charts/KvHorizontalBox.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"

using namespace kvCharts;

class KvHorizontalBoxTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void defaults();
    void announcesChanges();
    void draws_data();
    void draws();
    void emptyLabelsAreLeftOut();
    void crowdedLabels();
    void looksLikeSingleItems();
};

namespace {

KvHorizontalBox::Points points(double a, double b, double c, double d, double e)
{
    return {{{a, QStringLiteral("1")},
             {b, QStringLiteral("2.5")},
             {c, QStringLiteral("3")},
             {d, QStringLiteral("4")},
             {e, QStringLiteral("5")}}};
}

} // namespace

void KvHorizontalBoxTest::defaults()
{
    const KvHorizontalBox box;
    QCOMPARE(box.pen().color(), QColor(Qt::white));
    QCOMPARE(box.pen().widthF(), 1.0);
    QVERIFY(box.pen().isCosmetic());
    QCOMPARE(box.brush(), QBrush(Qt::gray, Qt::SolidPattern));
}

void KvHorizontalBoxTest::announcesChanges()
{
    KvHorizontalBox box;
    QSignalSpy spy(&box, SIGNAL(changed()));
    box.setPoints(points(1, 2, 3, 4, 5));
    box.setExtent({1.0, 2.0});
    box.setPenColor(Qt::red);
    box.setBrushColor(Qt::red);
    QCOMPARE(spy.count(), 4);
    QCOMPARE(box.points().at(4).x, 5.0);
    QCOMPARE(box.extent().bottom, 2.0);
    QCOMPARE(box.pen().color(), QColor(Qt::red));
    QCOMPARE(box.brush().color(), QColor(Qt::red));
}

void KvHorizontalBoxTest::draws_data()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<QString>("lineColor");
    QTest::newRow("dark") << 0 << QStringLiteral("#dcdcdc");
    QTest::newRow("light") << 1 << QStringLiteral("#373737");
}

void KvHorizontalBoxTest::draws()
{
    QFETCH(int, theme);
    QFETCH(QString, lineColor);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    KvHorizontalBox box;
    box.setPoints(points(100, 300, 400, 600, 900));
    box.setExtent({250, 750});
    box.setBrushColor(Qt::green);
    QGraphicsScene scene;
    box.draw(&scene, &themes);
    const QGraphicsRectItem *rect = itemsOf<QGraphicsRectItem>(&scene).first();
    QCOMPARE(rect->rect(), QRectF(300, 250, 300, 500));
    QCOMPARE(rect->pen().color().name(), lineColor);
    QCOMPARE(rect->brush().color(), QColor(Qt::green));
    const auto lines = itemsOf<KvLineRunItem>(&scene);
    QCOMPARE(lines.size(), 1); // room enough: no leader lines
    QCOMPARE(lines.first()->lines().size(), 5);
    QCOMPARE(lines.first()->pen().color().name(), lineColor);
    const QVector<KvPlacedText> labels = itemsOf<KvTextRunItem>(&scene).first()->texts();
    QCOMPARE(labels.size(), 5);
    QCOMPARE(labels.at(1).text, QStringLiteral("2.5"));
    QCOMPARE(labels.at(1).topLeft, QPointF(300 - labels.at(1).extent.size.width() / 2, 761));
}

void KvHorizontalBoxTest::emptyLabelsAreLeftOut()
{
    const KvChartThemes themes;
    KvHorizontalBox box;
    KvHorizontalBox::Points some = points(100, 300, 400, 600, 900);
    some[1].label.clear();
    some[3].label.clear();
    box.setPoints(some);
    QGraphicsScene scene;
    box.draw(&scene, &themes);
    QCOMPARE(itemsOf<KvTextRunItem>(&scene).first()->texts().size(), 3);
    box.setPoints(KvHorizontalBox::Points());
    QGraphicsScene unlabelled;
    box.draw(&unlabelled, &themes);
    QVERIFY(itemsOf<KvTextRunItem>(&unlabelled).isEmpty());
}

void KvHorizontalBoxTest::crowdedLabels()
{
    const KvChartThemes themes;
    KvHorizontalBox box;
    const KvHorizontalBox::Point five{500.0, QStringLiteral("5")};
    box.setPoints({{five, five, five, five, five}});
    box.setExtent({250, 750});
    QGraphicsScene scene;
    box.draw(&scene, &themes);
    const QVector<KvPlacedText> labels = itemsOf<KvTextRunItem>(&scene).first()->texts();
    const double width = labels.first().extent.size.width();
    for (int i = 0; i < 5; ++i)
        QCOMPARE(labels.at(i).topLeft.x(), 500 - width / 2 + (i - 2) * (width + 6));
    const auto lines = itemsOf<KvLineRunItem>(&scene);
    QCOMPARE(lines.size(), 2);
    QCOMPARE(lines.last()->lines().size(), 5);
    QCOMPARE(lines.last()->lines().first(), QLineF(500 - 2 * (width + 6), 759, 500, 753));
    QCOMPARE(lines.last()->lines().at(2), QLineF(500, 759, 500, 753));
}

void KvHorizontalBoxTest::looksLikeSingleItems()
{
    const KvChartThemes themes;
    const QPen pen = ItemByItem::cosmeticPen(themes.colors().at(6));
    KvHorizontalBox box;
    box.setPoints(points(100, 300, 310, 600, 900));
    box.setExtent({250, 750});
    QGraphicsScene combined;
    box.draw(&combined, &themes);
    QGraphicsScene single;
    single.addRect(300, 250, 300, 500, pen, QBrush(Qt::gray));
    for (const double x : {100.0, 310.0, 900.0})
        single.addLine(x, 250, x, 750, pen);
    single.addLine(100, 500, 300, 500, pen);
    single.addLine(600, 500, 900, 500, pen);
    for (const KvPlacedText &label : itemsOf<KvTextRunItem>(&combined).first()->texts())
        ItemByItem::addText(&single, label.text, label.topLeft, themes.colors().at(1));
    for (const QLineF &leader : itemsOf<KvLineRunItem>(&combined).last()->lines())
        single.addLine(leader, pen);
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    const QRectF source(0, 0, 1000, 1000);
    QCOMPARE(
        ItemByItem::difference(ItemByItem::picture(&combined, source), ItemByItem::picture(&single, source)),
        0);
}

STATREPORT_TEST_MAIN(KvHorizontalBoxTest)
#include "KvHorizontalBoxTest.moc"
