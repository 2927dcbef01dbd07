// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLegend.h"
#include "charts/KvTextRunItem.h"
#include <QGraphicsItemGroup>
#include <QGraphicsTextItem>

using namespace kvCharts;

class KvLegendTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void announcesChanges();
    void empty();
    void titleAlone();
    void entries_data();
    void entries();
    void titleAboveEntries();
    void colors_data();
    void colors();
    void wrapsRows();
    void itemFont();
    void looksLikeSingleItems_data();
    void looksLikeSingleItems();
};

namespace {

QString text(const char *latin)
{
    return QString::fromLatin1(latin);
}

} // namespace

void KvLegendTest::announcesChanges()
{
    KvLegend legend;
    QVERIFY(legend.title().isEmpty());
    QSignalSpy spy(&legend, SIGNAL(changed()));
    legend.addItem(text("a"), Qt::red);
    QCOMPARE(spy.count(), 1);
    legend.setTitle(text("t"));
    legend.setTitle(text("t"));
    QCOMPARE(spy.count(), 3);
    legend.clearItems();
    legend.clearItems();
    QCOMPARE(spy.count(), 5);
    QCOMPARE(legend.title(), text("t"));
    QVERIFY(legend.items().isEmpty());
}

void KvLegendTest::empty()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvLegend().draw(&scene, &themes);
    QVERIFY(scene.items().isEmpty());
}

void KvLegendTest::titleAlone()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvLegend legend;
    legend.setTitle(text("Sepal length"));
    legend.draw(&scene, &themes);
    QCOMPARE(scene.items().size(), 1);
    const QGraphicsTextItem *title = itemsOf<QGraphicsTextItem>(&scene).first();
    QCOMPARE(title->toPlainText(), text("Sepal length"));
    QCOMPARE(title->font().family(), text("Segoe UI"));
    QCOMPARE(title->font().pointSizeF(), 14.0);
    QCOMPARE(title->font().weight(), 75);
    const QSizeF size = title->boundingRect().size();
    QCOMPARE(title->pos(), QPointF(500 - size.width() / 2, -size.height()));
}

void KvLegendTest::entries_data()
{
    QTest::addColumn<QStringList>("names");
    QTest::newRow("one") << QStringList{text("setosa")};
    QTest::newRow("three") << QStringList{text("setosa"), text("versicolor"), text("virginica")};
}

void KvLegendTest::entries()
{
    QFETCH(QStringList, names);
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvLegend legend;
    for (const QString &name : qAsConst(names))
        legend.addItem(name, Qt::red);
    legend.draw(&scene, &themes);
    const auto markers = itemsOf<QGraphicsRectItem>(&scene);
    const QVector<KvPlacedText> texts = itemsOf<KvTextRunItem>(&scene).first()->texts();
    const QGraphicsItemGroup *group = itemsOf<QGraphicsItemGroup>(&scene).first();
    QCOMPARE(markers.size(), names.size());
    QCOMPARE(texts.size(), names.size());
    double x = 0;
    for (int i = 0; i < names.size(); ++i) {
        QGraphicsTextItem textItem(names.at(i));
        textItem.setFont(ItemByItem::font(12.0));
        const QSizeF size = textItem.boundingRect().size();
        QCOMPARE(texts.at(i).text, names.at(i));
        QCOMPARE(texts.at(i).extent.size, size);
        QCOMPARE(markers.at(i)->rect(), QRectF(x, 0, 7, 7));
        QCOMPARE(markers.at(i)->pen().widthF(), 1.0);
        QVERIFY(markers.at(i)->pen().isCosmetic());
        QCOMPARE(texts.at(i).topLeft, QPointF(x + 16, 4 - size.height() / 2));
        x += size.width() + 16 + 32;
    }
    const QSizeF groupSize = group->boundingRect().size();
    QCOMPARE(group->pos(), QPointF(500 - groupSize.width() / 2, -groupSize.height()));
    // Half the marker's pen reaches to the left, the last text to the right.
    QCOMPARE(groupSize.width(), x - 32 + 0.5);
}

void KvLegendTest::titleAboveEntries()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvLegend legend;
    legend.addItem(text("setosa"), Qt::red);
    legend.setTitle(text("Title"));
    legend.draw(&scene, &themes);
    const double groupHeight = itemsOf<QGraphicsItemGroup>(&scene).first()->boundingRect().height();
    const QGraphicsTextItem *title = itemsOf<QGraphicsTextItem>(&scene).first();
    QCOMPARE(title->toPlainText(), text("Title"));
    QCOMPARE(title->pos().y() + title->boundingRect().height(), -6 - groupHeight);
}

void KvLegendTest::colors_data()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<QString>("textColor");
    QTest::newRow("dark") << 0 << text("#ffffff");
    QTest::newRow("light") << 1 << text("#313131");
}

void KvLegendTest::colors()
{
    QFETCH(int, theme);
    QFETCH(QString, textColor);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    QGraphicsScene scene;
    KvLegend legend;
    legend.setTitle(text("Title"));
    legend.addItem(text("a"), Qt::green);
    legend.addItem(text("b"), QColor()); // paints black
    legend.draw(&scene, &themes);
    QCOMPARE(itemsOf<QGraphicsTextItem>(&scene).first()->defaultTextColor().name(), textColor);
    QCOMPARE(itemsOf<KvTextRunItem>(&scene).first()->color().name(), textColor);
    const auto markers = itemsOf<QGraphicsRectItem>(&scene);
    QCOMPARE(markers.at(0)->brush().color(), QColor(Qt::green));
    QCOMPARE(markers.at(0)->pen().color(), QColor(Qt::green));
    QCOMPARE(markers.at(0)->brush().style(), Qt::SolidPattern);
    QVERIFY(!markers.at(1)->brush().color().isValid());
    QVERIFY(!markers.at(1)->pen().color().isValid());
}

void KvLegendTest::wrapsRows()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvLegend legend;
    for (int i = 0; i < 40; ++i)
        legend.addItem(text("entry"), Qt::red);
    legend.draw(&scene, &themes);
    const QSizeF size = itemsOf<KvTextRunItem>(&scene).first()->texts().first().extent.size;
    const int perRow = static_cast<int>(800 / (size.width() + 48)) + 1;
    const auto markers = itemsOf<QGraphicsRectItem>(&scene);
    for (int i = 0; i < markers.size(); ++i) {
        QCOMPARE(markers.at(i)->rect().x(), (i % perRow) * (size.width() + 48));
        QCOMPARE(markers.at(i)->rect().y(), (i / perRow) * (size.height() + 10));
    }
}

void KvLegendTest::itemFont()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvLegend legend;
    legend.addItem(text("two\nlines"), Qt::red); // an item of its own
    legend.draw(&scene, &themes);
    const QGraphicsTextItem *item = itemsOf<QGraphicsTextItem>(&scene).first();
    QCOMPARE(item->font().family(), text("Segoe UI"));
    QCOMPARE(item->font().pointSizeF(), 12.0);
    QCOMPARE(item->font().weight(), 50);
    QVERIFY(item->parentItem() == itemsOf<QGraphicsItemGroup>(&scene).first());
}

void KvLegendTest::looksLikeSingleItems_data()
{
    QTest::addColumn<QStringList>("names");
    QTest::addColumn<QString>("title");
    QTest::addColumn<int>("theme");
    QStringList many;
    for (int i = 0; i < 30; ++i)
        many.append(QString::number(i * i * i));
    const QString wide(120, QLatin1Char('w'));
    for (const int theme : {0, 1}) {
        QTest::addRow("title alone %d", theme)
            << QStringList{} << text("Sepal length, petal length") << theme;
        QTest::addRow("one row %d", theme)
            << QStringList{text("setosa"), text("virginica")} << QString() << theme;
        QTest::addRow("many rows %d", theme) << many << text("Sepal length") << theme;
        QTest::addRow("wider than a row %d", theme)
            << QStringList{text("setosa"), wide, text("virginica")} << wide << theme;
        QTest::addRow("uneven heights %d", theme)
            << QStringList{text("two\nlines"), QStringLiteral("\u6f22 \u03bc"), QString(), wide, text("last")}
            << text("Title") << theme;
    }
}

void KvLegendTest::looksLikeSingleItems()
{
    QFETCH(QStringList, names);
    QFETCH(QString, title);
    QFETCH(int, theme);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    KvLegend legend;
    QVector<ItemByItem::LegendEntry> entries;
    for (const QString &name : qAsConst(names)) {
        entries.append({name, entries.size() % 2 == 0 ? Qt::red : Qt::cyan});
        legend.addItem(name, entries.last().color);
    }
    legend.setTitle(title);
    QGraphicsScene combined;
    legend.draw(&combined, &themes);
    QGraphicsScene single;
    ItemByItem::addLegend(&single, entries, title, themes.colors().at(2));
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    QCOMPARE(ItemByItem::placedTexts(&combined), ItemByItem::placedTexts(&single));
    combined.setBackgroundBrush(themes.colors().at(0));
    single.setBackgroundBrush(themes.colors().at(0));
    const QRectF source(50, -500, 900, 900);
    QVERIFY(ItemByItem::alike(ItemByItem::picture(&combined, source), ItemByItem::picture(&single, source)));
}

STATREPORT_TEST_MAIN(KvLegendTest)
#include "KvLegendTest.moc"
