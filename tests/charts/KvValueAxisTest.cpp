// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYValues.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"

using namespace kvCharts;

class KvValueAxisTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void defaults();
    void announcesChanges();
    void autoRange();
    void looksLikeSingleItems_data();
    void looksLikeSingleItems();
    void noTicks_data();
    void noTicks();
    void labelTexts_data();
    void labelTexts();
    void gridIsOffAtFirst();
};

namespace {

QStringList labelsOf(const QGraphicsScene &scene)
{
    QStringList texts;
    for (const KvTextRunItem *run : itemsOf<KvTextRunItem>(&scene)) {
        for (const KvPlacedText &text : run->texts())
            texts.append(text.text);
    }
    return texts;
}

} // namespace

void KvValueAxisTest::defaults()
{
    const KvAxisXValues axis;
    QCOMPARE(axis.minimum(), 0.0);
    QCOMPARE(axis.maximum(), 10.0);
    QGraphicsScene scene;
    const KvChartThemes themes;
    KvAxisYValues().draw(&scene, &themes);
    QCOMPARE(labelsOf(scene).size(), 11);
}

void KvValueAxisTest::announcesChanges()
{
    KvAxisYValues axis;
    QSignalSpy spy(&axis, SIGNAL(changed()));
    axis.setRange(0.0, 10.0);
    axis.setTickCount(11);
    axis.setGridVisible(false);
    QCOMPARE(spy.count(), 0);
    axis.setRange(0.0, 11.0);
    QCOMPARE(spy.count(), 1);
    axis.setRange(-1.0, 11.0);
    QCOMPARE(spy.count(), 2);
    axis.setRange(5.0, 1.0); // any order
    QCOMPARE(axis.minimum(), 5.0);
    QCOMPARE(axis.maximum(), 1.0);
    QCOMPARE(spy.count(), 3);
    axis.setTickCount(0);
    axis.setTickCount(0);
    QCOMPARE(spy.count(), 4);
    axis.setGridVisible(true);
    axis.setGridVisible(true);
    QCOMPARE(spy.count(), 5);
}

void KvValueAxisTest::autoRange()
{
    KvAxisXValues axis;
    QSignalSpy spy(&axis, SIGNAL(changed()));
    axis.autoRange(5.0, 5.0);
    QCOMPARE(axis.minimum(), 4.5);
    QCOMPARE(axis.maximum(), 5.5);
    QCOMPARE(spy.count(), 2); // range, then ticks
    axis.autoRange(5.0, 5.0);
    QCOMPARE(spy.count(), 2);
    axis.autoRange(3.0, 47.0);
    const KvChartThemes themes;
    QGraphicsScene scene;
    axis.draw(&scene, &themes);
    QCOMPARE(labelsOf(scene).join(QLatin1Char(' ')), QStringLiteral("0 5 10 15 20 25 30 35 40 45 50"));
}

void KvValueAxisTest::looksLikeSingleItems_data()
{
    QTest::addColumn<bool>("alongX");
    QTest::addColumn<int>("theme");
    QTest::addColumn<bool>("grid");
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<int>("ticks");
    for (const bool alongX : {true, false}) {
        for (const int theme : {0, 1}) {
            for (const bool grid : {true, false}) {
                const char *name = alongX ? "x" : "y";
                QTest::addRow("%s %d %d, eleven", name, theme, grid)
                    << alongX << theme << grid << 0.0 << 100.0 << 11;
                QTest::addRow("%s %d %d, one", name, theme, grid)
                    << alongX << theme << grid << 3.0 << 7.0 << 1;
                QTest::addRow("%s %d %d, uneven", name, theme, grid)
                    << alongX << theme << grid << -1e-7 << 2e6 << 8;
            }
        }
    }
}

void KvValueAxisTest::looksLikeSingleItems()
{
    QFETCH(bool, alongX);
    QFETCH(int, theme);
    QFETCH(bool, grid);
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(int, ticks);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    KvAxisXValues x;
    KvAxisYValues y;
    KvBaseAxis *axis = alongX ? static_cast<KvBaseAxis *>(&x) : &y;
    axis->setRange(min, max);
    axis->setTickCount(ticks);
    axis->setGridVisible(grid);
    QGraphicsScene combined;
    axis->draw(&combined, &themes);
    const ItemByItem::AxisLook look{ItemByItem::cosmeticPen(themes.colors().at(6)),
                                    ItemByItem::cosmeticPen(themes.colors().at(7)), themes.colors().at(3),
                                    grid};
    QGraphicsScene single;
    const auto add = alongX ? ItemByItem::addValueAxisX : ItemByItem::addValueAxisY;
    add(&single, look, min, max, ticks);
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    const QRectF source(-150, -50, 1250, 1250);
    QCOMPARE(ItemByItem::placedTexts(&combined), ItemByItem::placedTexts(&single));
    QCOMPARE(ItemByItem::placedLines(&combined), ItemByItem::placedLines(&single));
    QVERIFY(ItemByItem::alike(ItemByItem::picture(&combined, source), ItemByItem::picture(&single, source)));
    QVERIFY(combined.items().size() <= 4);
}

void KvValueAxisTest::noTicks_data()
{
    QTest::addColumn<bool>("alongX");
    QTest::addColumn<int>("ticks");
    QTest::newRow("x, none") << true << 0;
    QTest::newRow("x, fewer") << true << -3;
    QTest::newRow("y, none") << false << 0;
    QTest::newRow("y, fewer") << false << -3;
}

void KvValueAxisTest::noTicks()
{
    QFETCH(bool, alongX);
    QFETCH(int, ticks);
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvAxisXValues x;
    KvAxisYValues y;
    KvBaseAxis *axis = alongX ? static_cast<KvBaseAxis *>(&x) : &y;
    axis->setTickCount(ticks);
    axis->setGridVisible(true);
    axis->draw(&scene, &themes);
    QCOMPARE(scene.items().size(), 1);
    QCOMPARE(itemsOf<QGraphicsLineItem>(&scene).size(), 1);
}

void KvValueAxisTest::labelTexts_data()
{
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<int>("ticks");
    QTest::addColumn<QString>("texts");
    QTest::newRow("halves") << 0.0 << 2.0 << 5 << QStringLiteral("0 0.5 1 1.5 2");
    QTest::newRow("a million") << 0.0 << 1000000.0 << 3 << QStringLiteral("0 500000 1e+06");
    QTest::newRow("nearly a million") << 999999.5 << 999999.5 << 1 << QStringLiteral("1e+06");
    QTest::newRow("six digits") << 0.123456789 << 1.0 << 1 << QStringLiteral("0.123457");
    QTest::newRow("negative zero") << -0.0 << 3.0 << 1 << QStringLiteral("0");
    // Values are summed up, so that a zero tick shows the rounding error.
    QTest::newRow("not quite zero") << -1.0 << 1.0 << 11
                                    << QStringLiteral(
                                           "-1 -0.8 -0.6 -0.4 -0.2 -5.55112e-17 0.2 0.4 0.6 0.8 1");
    QTest::newRow("more than six digits") << 1234567.0 << 1234567.0 << 1 << QStringLiteral("1.23457e+06");
    QTest::newRow("small") << 0.00001 << 1.0 << 1 << QStringLiteral("1e-05");
    QTest::newRow("downwards") << 4.0 << 0.0 << 3 << QStringLiteral("4 2 0");
    QTest::newRow("the minimum alone") << 3.0 << 8.0 << 1 << QStringLiteral("3");
}

void KvValueAxisTest::labelTexts()
{
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(int, ticks);
    QFETCH(QString, texts);
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvAxisXValues axis;
    axis.setRange(min, max);
    axis.setTickCount(ticks);
    axis.draw(&scene, &themes);
    QCOMPARE(labelsOf(scene).join(QLatin1Char(' ')), texts);
}

void KvValueAxisTest::gridIsOffAtFirst()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvAxisYValues axis;
    axis.draw(&scene, &themes);
    QCOMPARE(itemsOf<KvLineRunItem>(&scene).size(), 1);
    axis.setGridVisible(true);
    axis.draw(&scene, &themes);
    QCOMPARE(itemsOf<KvLineRunItem>(&scene).size(), 3);
    QCOMPARE(itemsOf<KvLineRunItem>(&scene).last()->lines().size(), 11);
}

STATREPORT_TEST_MAIN(KvValueAxisTest)
#include "KvValueAxisTest.moc"
