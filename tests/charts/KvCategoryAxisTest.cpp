// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvAxisXCategories.h"
#include "charts/KvAxisYCategories.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"
#include <QGraphicsTextItem>

using namespace kvCharts;

class KvCategoryAxisTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void ignoresNumbers();
    void announcesCategoriesAlways();
    void sharesTheList();
    void measuresAnewForANewList();
    void looksLikeSingleItems_data();
    void looksLikeSingleItems();
    void noCategories_data();
    void noCategories();
    void readsFromTheTop();
    void labelFont();
    void fewItemsForManyLabels();
};

namespace {

const QStringList &leaves()
{
    static const QStringList list{QStringLiteral("setosa"), QStringLiteral("versicolor"),
                                  QStringLiteral("virginica \u03bc"), QStringLiteral("two\nlines"),
                                  QString()};
    return list;
}

} // namespace

void KvCategoryAxisTest::ignoresNumbers()
{
    KvAxisXCategories axis;
    QSignalSpy spy(&axis, SIGNAL(changed()));
    axis.setRange(1.0, 2.0);
    axis.setTickCount(4);
    axis.autoRange(0.0, 100.0);
    QCOMPARE(spy.count(), 0);
    QCOMPARE(axis.minimum(), 0.0);
    QCOMPARE(axis.maximum(), 0.0);
    axis.setGridVisible(true);
    axis.setGridVisible(true);
    QCOMPARE(spy.count(), 1);
}

void KvCategoryAxisTest::announcesCategoriesAlways()
{
    KvAxisYCategories axis;
    QVERIFY(axis.categories().isEmpty());
    QSignalSpy spy(&axis, SIGNAL(changed()));
    axis.setCategories(leaves());
    QCOMPARE(spy.count(), 1);
    axis.setCategories(leaves());
    QCOMPARE(spy.count(), 2);
    axis.setCategories(axis.categories());
    QCOMPARE(spy.count(), 3);
    QCOMPARE(axis.categories(), leaves());
}

void KvCategoryAxisTest::sharesTheList()
{
    KvAxisXCategories axis;
    axis.setCategories(leaves());
    QVERIFY(axis.categories().isSharedWith(leaves()));
    QStringList own = leaves();
    own.append(QStringLiteral("more"));
    axis.setCategories(own);
    own.removeFirst(); // the axis keeps its own
    QCOMPARE(axis.categories().size(), 6);
}

void KvCategoryAxisTest::measuresAnewForANewList()
{
    const KvChartThemes themes;
    KvAxisXCategories axis;
    axis.setCategories({QStringLiteral("i")});
    QGraphicsScene first;
    axis.draw(&first, &themes);
    axis.setCategories({QStringLiteral("a much longer one")});
    QGraphicsScene second;
    axis.draw(&second, &themes);
    QGraphicsScene third;
    axis.draw(&third, &themes);
    const auto width = [](const QGraphicsScene &scene) {
        return itemsOf<KvTextRunItem>(&scene).first()->boundingRect().width();
    };
    QVERIFY(width(second) > width(first) + 50);
    QCOMPARE(width(third), width(second));
}

void KvCategoryAxisTest::looksLikeSingleItems_data()
{
    QTest::addColumn<bool>("alongX");
    QTest::addColumn<int>("theme");
    QTest::addColumn<bool>("grid");
    for (const bool alongX : {true, false}) {
        for (const int theme : {0, 1}) {
            for (const bool grid : {true, false})
                QTest::addRow("%s %d %d", alongX ? "x" : "y", theme, grid) << alongX << theme << grid;
        }
    }
}

void KvCategoryAxisTest::looksLikeSingleItems()
{
    QFETCH(bool, alongX);
    QFETCH(int, theme);
    QFETCH(bool, grid);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    KvAxisXCategories x;
    KvAxisYCategories y;
    x.setCategories(leaves());
    y.setCategories(leaves());
    KvBaseAxis *axis = alongX ? static_cast<KvBaseAxis *>(&x) : &y;
    axis->setGridVisible(grid);
    QGraphicsScene combined;
    axis->draw(&combined, &themes);
    const ItemByItem::AxisLook look{ItemByItem::cosmeticPen(themes.colors().at(6)),
                                    ItemByItem::cosmeticPen(themes.colors().at(7)), themes.colors().at(3),
                                    grid};
    QGraphicsScene single;
    const auto add = alongX ? ItemByItem::addCategoryAxisX : ItemByItem::addCategoryAxisY;
    add(&single, look, leaves());
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    const QRectF source(-150, -50, 1250, 1250);
    QCOMPARE(ItemByItem::placedTexts(&combined), ItemByItem::placedTexts(&single));
    QCOMPARE(ItemByItem::placedLines(&combined), ItemByItem::placedLines(&single));
    QVERIFY(ItemByItem::alike(ItemByItem::picture(&combined, source), ItemByItem::picture(&single, source)));
}

void KvCategoryAxisTest::noCategories_data()
{
    QTest::addColumn<bool>("alongX");
    QTest::addColumn<QLineF>("tick");
    QTest::newRow("x") << true << QLineF(0, 1000, 0, 1005);
    QTest::newRow("y") << false << QLineF(-5, 1000, 0, 1000);
}

void KvCategoryAxisTest::noCategories()
{
    QFETCH(bool, alongX);
    QFETCH(QLineF, tick);
    const KvChartThemes themes;
    KvAxisXCategories x;
    KvAxisYCategories y;
    KvBaseAxis *axis = alongX ? static_cast<KvBaseAxis *>(&x) : &y;
    axis->setGridVisible(true);
    QGraphicsScene scene;
    axis->draw(&scene, &themes);
    QCOMPARE(scene.items().size(), 2);
    QCOMPARE(itemsOf<KvLineRunItem>(&scene).first()->lines(), QVector<QLineF>{tick});
}

void KvCategoryAxisTest::readsFromTheTop()
{
    const KvChartThemes themes;
    KvAxisYCategories axis;
    axis.setCategories({QStringLiteral("first"), QStringLiteral("second")});
    QGraphicsScene scene;
    axis.draw(&scene, &themes);
    const QVector<KvPlacedText> texts = itemsOf<KvTextRunItem>(&scene).first()->texts();
    const auto middle = [](const KvPlacedText &text) {
        return text.topLeft.y() + text.extent.size.height() / 2;
    };
    QCOMPARE(middle(texts.at(0)), 250.0);
    QCOMPARE(middle(texts.at(1)), 750.0);
    QCOMPARE(texts.at(0).topLeft.x() + texts.at(0).extent.size.width(), -5.0);
}

void KvCategoryAxisTest::labelFont()
{
    const KvChartThemes themes;
    KvAxisYCategories axis;
    axis.setCategories({QStringLiteral("two\nlines")}); // an item of its own
    QGraphicsScene scene;
    axis.draw(&scene, &themes);
    const QGraphicsTextItem *label = itemsOf<QGraphicsTextItem>(&scene).first();
    QCOMPARE(label->font().family(), QStringLiteral("Segoe UI"));
    QCOMPARE(label->font().pointSizeF(), 11.0);
    QCOMPARE(label->font().weight(), 50);
}

void KvCategoryAxisTest::fewItemsForManyLabels()
{
    const KvChartThemes themes;
    KvAxisXCategories axis;
    QStringList categories;
    for (int i = 0; i < 5000; ++i)
        categories.append(QString::number(i));
    axis.setCategories(categories);
    axis.setGridVisible(true);
    QGraphicsScene scene;
    axis.draw(&scene, &themes);
    QCOMPARE(scene.items().size(), 4); // axis, ticks, grid, labels
}

STATREPORT_TEST_MAIN(KvCategoryAxisTest)
#include "KvCategoryAxisTest.moc"
