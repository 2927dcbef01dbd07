// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvAxisXCategories.h"
#include "charts/KvAxisYValues.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLegend.h"
#include "charts/KvLineChart.h"
#include "charts/KvLineParts.h"
#include "charts/KvLineSerie.h"
#include "charts/KvLineSeriesItem.h"
#include "charts/KvSeriesPalette.h"

#include <QElapsedTimer>

#include <limits>

using namespace kvCharts;

class KvLineChartTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void axes();
    void seriesOfEqualNamesMerge();
    void categories();
    void clears();
    void rebuilds();
    void limitsWidenTheRange();
    void nothingToDraw();
    void emptyRebuildKeepsTheAxes();
    void findsSeriesAtOnce();
    void drawsManyPointsAsOneItem();
    void looksLikeSingleItems();
    void everythingIsFinite_data();
    void everythingIsFinite();
};

namespace {

QString name(const char *latin)
{
    return QString::fromLatin1(latin);
}

const KvAxisXCategories *categoryAxis(const KvChart &chart)
{
    return qobject_cast<const KvAxisXCategories *>(chart.axisX());
}

const KvAxisYValues *valueAxis(const KvChart &chart)
{
    return qobject_cast<const KvAxisYValues *>(chart.axisY());
}

void addPoint(KvLineChart *chart, const char *serie, const char *category, double value)
{
    KvLineSerie *target = chart->addSerie(name(serie));
    chart->addCategory(name(category));
    target->addPoint(name(category), value);
}

/** How long 20000 look-ups take in a chart of some series: the shortest of some runs, in nanoseconds. */
qint64 findingTime(int seriesCount)
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    const QSignalBlocker quietLegend(chart.legend()); // it would draw all anew for each entry
    QStringList names;
    for (int i = 0; i < seriesCount; ++i) {
        names.append(QString::number(i));
        chart.addSerie(names.last());
    }
    qint64 least = std::numeric_limits<qint64>::max();
    for (int run = 0; run < 3; ++run) {
        QElapsedTimer stopwatch;
        stopwatch.start();
        for (int i = 0; i < 20000; ++i)
            chart.addSerie(names.at(i % seriesCount));
        least = qMin(least, stopwatch.nsecsElapsed());
    }
    return least;
}

} // namespace

void KvLineChartTest::axes()
{
    const KvChartThemes themes;
    const KvLineChart chart(&themes);
    QVERIFY(categoryAxis(chart));
    QVERIFY(valueAxis(chart));
    QVERIFY(chart.series().isEmpty());
    QVERIFY(chart.categories().isEmpty());
}

void KvLineChartTest::seriesOfEqualNamesMerge()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    KvLineSerie *length = chart.addSerie(name("Length(mm)"));
    length->addPoint(name("1"), 2.0);
    length->setShowTrend(true);
    KvLineSerie *area = chart.addSerie(name("Area"));
    QCOMPARE(chart.addSerie(name("Length(mm)")), length);
    QCOMPARE(length->points().size(), 1); // unchanged
    QVERIFY(length->showTrend());
    QCOMPARE(chart.series(), QVector<KvLineSerie *>({length, area}));
    QCOMPARE(length->color(), seriesColor(0));
    QCOMPARE(area->color(), seriesColor(1));
    QVERIFY(!area->showTrend());
    QVERIFY(!area->showLimits());
    QCOMPARE(chart.legend()->items().size(), 2);
    QCOMPARE(chart.legend()->items().at(1).text, name("Area"));
    QCOMPARE(chart.legend()->items().at(1).color, seriesColor(1));
    QVERIFY(chart.addSerie(name("length(mm)")) != length);
}

void KvLineChartTest::categories()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    addPoint(&chart, "a", "x", 1.0);
    chart.addCategory(name("y"));
    chart.addCategory(name("x"));
    chart.addCategory(name("X"));
    QCOMPARE(chart.categories(), QStringList({name("x"), name("y"), name("X")}));
    QCOMPARE(categoryAxis(chart)->categories(), chart.categories());
    QSignalSpy spy(chart.axisX(), SIGNAL(changed()));
    chart.addCategory(name("x")); // refreshes all the same
    QCOMPARE(spy.count(), 1);
}

void KvLineChartTest::clears()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    addPoint(&chart, "a", "x", 1.0);
    chart.refresh();
    const QPointer<KvLineSerie> serie = chart.series().first();
    chart.clearSeries();
    QVERIFY(serie.isNull());
    QVERIFY(chart.series().isEmpty());
    QVERIFY(chart.categories().isEmpty());
    QVERIFY(chart.parts().isEmpty());
    QVERIFY(chart.legend()->items().isEmpty());
    QCOMPARE(chart.addSerie(name("a"))->points().size(), 0);
    QCOMPARE(chart.series().first()->color(), seriesColor(0));
}

void KvLineChartTest::rebuilds()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    chart.beginUpdate();
    addPoint(&chart, "a", "x", 3.0);
    addPoint(&chart, "a", "y", 47.0);
    addPoint(&chart, "b", "z", 25.0);
    chart.addSerie(name("empty"));
    QVERIFY(chart.parts().isEmpty());
    chart.endUpdate();
    QCOMPARE(valueAxis(chart)->minimum(), 0.0);
    QCOMPARE(valueAxis(chart)->maximum(), 50.0);
    QCOMPARE(chart.parts().size(), 3);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(qobject_cast<KvLineParts *>(chart.parts().at(i))->serie(), chart.series().at(i));
    const auto items = itemsOf<KvLineSeriesItem>(&chart);
    QCOMPARE(items.size(), 2);
    const QVector<QPointF> a = items.at(0)->points();
    QVERIFY((a.at(0) - QPointF(500.0 / 3, 940)).manhattanLength() < 1e-6);
    QVERIFY((a.at(1) - QPointF(500, 60)).manhattanLength() < 1e-6);
    QVERIFY((items.at(1)->points().first() - QPointF(2500.0 / 3, 500)).manhattanLength() < 1e-6);
}

void KvLineChartTest::limitsWidenTheRange()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    addPoint(&chart, "a", "x", 40.0);
    addPoint(&chart, "a", "y", 60.0);
    chart.series().first()->setLimits(0.0, 100.0);
    chart.addSerie(name("no points"))->setLimits(-5000.0, 5000.0);
    chart.series().last()->setShowLimits(true);
    chart.refresh();
    QCOMPARE(valueAxis(chart)->minimum(), 40.0);
    QCOMPARE(valueAxis(chart)->maximum(), 60.0);
    chart.series().first()->setShowLimits(true);
    chart.refresh();
    QCOMPARE(valueAxis(chart)->minimum(), 0.0);
    QCOMPARE(valueAxis(chart)->maximum(), 100.0);
    chart.series().first()->setLimits(70.0,
                                      30.0); // inside: a lower limit only lowers, an upper one only raises
    chart.refresh();
    QCOMPARE(valueAxis(chart)->minimum(), 40.0);
    QCOMPARE(valueAxis(chart)->maximum(), 60.0);
}

void KvLineChartTest::nothingToDraw()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    chart.refresh();
    const QRectF rect = chart.sceneRect();
    const int items = chart.items().size();
    chart.addCategory(name("x")); // no series
    QVERIFY(chart.parts().isEmpty());
    chart.clearSeries();
    chart.addSerie(name("a"))->addPoint(name("x"), 1.0); // no categories
    chart.refresh();
    QVERIFY(chart.parts().isEmpty());
    chart.clearSeries();
    chart.refresh();
    QCOMPARE(chart.sceneRect(), rect);
    QCOMPARE(chart.items().size(), items);
}

void KvLineChartTest::emptyRebuildKeepsTheAxes()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    addPoint(&chart, "a", "x", 3.0);
    addPoint(&chart, "a", "y", 47.0);
    chart.refresh();
    chart.clearSeries();
    chart.refresh();
    QCOMPARE(categoryAxis(chart)->categories(), QStringList({name("x"), name("y")}));
    QCOMPARE(valueAxis(chart)->maximum(), 50.0);
}

// With 250 times as many series a search through them would take far longer, whatever else the machine does.
void KvLineChartTest::findsSeriesAtOnce()
{
    const qint64 few = findingTime(20);
    const qint64 many = findingTime(5000);
    QVERIFY2(many < 20 * few, qPrintable(QStringLiteral("%1 ns, %2 ns").arg(many).arg(few)));
}

void KvLineChartTest::drawsManyPointsAsOneItem()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    chart.beginUpdate();
    for (int i = 0; i < 100000; ++i) {
        const QString category = QString::number(i);
        KvLineSerie *serie = chart.addSerie(QString::number(i % 3));
        chart.addCategory(category);
        serie->addPoint(category, i % 17);
    }
    chart.endUpdate();
    QCOMPARE(chart.categories().size(), 100000);
    QCOMPARE(itemsOf<KvLineSeriesItem>(&chart).size(), 3);
    QVERIFY(chart.items().size() < 30);
}

void KvLineChartTest::looksLikeSingleItems()
{
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    QVector<QVector<QPointF>> points(2);
    QStringList names;
    chart.beginUpdate();
    for (int i = 0; i < 20; ++i) {
        names.append(QString::number(i));
        for (int s = 0; s < 2; ++s) {
            const double value = (i * 37 + s * 11) % 48 + (i == 0 && s == 0 ? 0 : 1);
            chart.addSerie(QString(QLatin1Char('a')).repeated(s + 1))->addPoint(names.last(), value);
            points[s].append(QPointF(i * 50 + 25, 1000 - value * 20));
        }
        chart.addCategory(names.last());
    }
    chart.endUpdate();
    QCOMPARE(valueAxis(chart)->minimum(), 0.0);
    QCOMPARE(valueAxis(chart)->maximum(), 50.0);
    chart.legend()->clearItems(); // drawn by single items anyway
    QGraphicsScene single;
    single.setBackgroundBrush(chart.backgroundBrush());
    const ItemByItem::AxisLook look{ItemByItem::cosmeticPen(themes.colors().at(6)),
                                    ItemByItem::cosmeticPen(themes.colors().at(7)), themes.colors().at(3),
                                    false};
    ItemByItem::addCategoryAxisX(&single, look, names);
    ItemByItem::addValueAxisY(&single, look, 0, 50, 11);
    for (int s = 0; s < 2; ++s)
        ItemByItem::addSeries(&single, points.at(s), seriesColor(s));
    QVERIFY(ItemByItem::sameRect(chart.sceneRect(), single.itemsBoundingRect().adjusted(-50, -50, 50, 50)));
    QCOMPARE(ItemByItem::placedTexts(&chart), ItemByItem::placedTexts(&single));
    QVERIFY(ItemByItem::alike(ItemByItem::picture(&chart, chart.sceneRect()),
                              ItemByItem::picture(&single, chart.sceneRect())));
}

void KvLineChartTest::everythingIsFinite_data()
{
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<bool>("oneCategory");
    using Values = QVector<double>;
    QTest::newRow("no points") << Values{} << false;
    QTest::newRow("one point") << Values{5} << false;
    QTest::newRow("equal x") << Values{1, 2, 3} << true;
    QTest::newRow("equal values") << Values{7, 7, 7} << false;
    QTest::newRow("zeros") << Values{0, 0} << false;
    QTest::newRow("not a number") << Values{1, qQNaN(), 3} << false;
    QTest::newRow("infinite") << Values{qInf(), -qInf()} << false;
    QTest::newRow("huge") << Values{1e300, -1e300} << false;
    QTest::newRow("tiny") << Values{1e-300, 2e-300} << false;
}

void KvLineChartTest::everythingIsFinite()
{
    QFETCH(QVector<double>, values);
    QFETCH(bool, oneCategory);
    const KvChartThemes themes;
    KvLineChart chart(&themes);
    KvLineSerie *serie = chart.addSerie(name("a"));
    serie->setShowTrend(true);
    for (int i = 0; i < values.size(); ++i) {
        const QString category = oneCategory ? name("x") : QString::number(i);
        chart.addCategory(category);
        serie->addPoint(category, values.at(i));
    }
    chart.refresh();
    const QList<QGraphicsItem *> items = chart.items();
    for (const QGraphicsItem *item : items) {
        const QRectF rect = item->sceneBoundingRect();
        QVERIFY(qIsFinite(rect.left()) && qIsFinite(rect.top()));
        QVERIFY(qIsFinite(rect.width()) && qIsFinite(rect.height()));
    }
    QVERIFY(qIsFinite(chart.sceneRect().width()) && qIsFinite(chart.sceneRect().height()));
    QVERIFY(chart.sceneRect().height() < 2000);
}

STATREPORT_TEST_MAIN(KvLineChartTest)
#include "KvLineChartTest.moc"
