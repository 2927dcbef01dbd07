// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartMeasurements.h"
#include "charts/KvChartView.h"
#include "charts/KvLegend.h"
#include "charts/KvLineChart.h"
#include "charts/KvLineSerie.h"
#include "charts/KvSeriesPalette.h"
#include "charts/trend/KvStatisticsTrendNodeCfg.h"
#include "charts/trend/KvStatisticsTrendWidget.h"

#include <cmath>

using namespace kvCharts;

namespace {
using Cfg = KvStatisticsTrendNodeCfg;
}

/** Which series the measured values give. */
class KvStatisticsTrendWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void byObject();
    void byMeasurement();
    void anotherGrouping();
    void oneUnitForAGroup_data();
    void oneUnitForAGroup();
    void theFirstRecordSaysWhatIsMeasured();
    void equalNamesMerge();
    void equalObjectNamesShareAPlace();
    void countersAreLeftOut();
    void nothingMeasured();
    void oneRecordHasNoTrendLine();
    void everySeriesShowsItsTrendAndNoLimits();
    void groupingSlotRefills();
    void handlesManyValues();

private:
    KvLineChart *chart() const { return qobject_cast<KvLineChart *>(m_widget->chartView()->chart()); }
    QStringList names() const
    {
        QStringList texts;
        for (const KvLineSerie *serie : chart()->series())
            texts.append(serie->name());
        return texts;
    }
    /** The points of a series as "category=value". */
    QStringList points(int index) const
    {
        QStringList texts;
        for (const KvLineSerie::Point &point : chart()->series().at(index)->points())
            texts.append(point.category + QLatin1Char('=') + QString::number(point.value));
        return texts;
    }
    void group(Cfg::GroupBy groupBy, const QVector<ChartObject> &objects)
    {
        m_cfg->setGroupBy(groupBy);
        m_host->setObjects(objects);
    }

    std::unique_ptr<ChartMeasurements> m_host;
    std::unique_ptr<Cfg> m_cfg;
    std::unique_ptr<KvStatisticsTrendWidget> m_widget;
};

void KvStatisticsTrendWidgetTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<ChartMeasurements>();
    m_cfg = std::make_unique<Cfg>(nullptr);
    m_widget = std::make_unique<KvStatisticsTrendWidget>(nullptr, m_cfg.get());
}

void KvStatisticsTrendWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsTrendWidgetTest::byObject()
{
    group(Cfg::ByObject, {ChartMeasurements::line("edge", 3.0), ChartMeasurements::line("gap", 1.0),
                          ChartMeasurements::circle("hole", 2.0)});
    QCOMPARE(names(), QStringList({"Circle/diameter(μm)", "Line/length(μm)"}));
    // The numbers of the objects, which count from 1 within each type, so the first ones share a place.
    QCOMPARE(chart()->categories(), QStringList({"1", "2"}));
    QCOMPARE(points(0), QStringList({"1=2"}));
    QCOMPARE(points(1), QStringList({"1=3", "2=1"}));
    QStringList legend;
    for (const KvLegend::Item &item : chart()->legend()->items())
        legend.append(item.text);
    QCOMPARE(legend, names());
    for (int i = 0; i < 2; ++i)
        QCOMPARE(chart()->series().at(i)->color(), seriesColor(i));
}

void KvStatisticsTrendWidgetTest::byMeasurement()
{
    group(Cfg::ByMeasurement, {ChartMeasurements::line("edge", 3.0), ChartMeasurements::line("gap", 1.0),
                               ChartMeasurements::circle("hole", 2.0)});
    QCOMPARE(names(), QStringList({"diameter(μm)", "length(μm)"}));
    QCOMPARE(chart()->categories(), QStringList({"hole", "edge", "gap"}));
    QCOMPARE(points(0), QStringList({"hole=2"}));
    QCOMPARE(points(1), QStringList({"edge=3", "gap=1"}));
}

void KvStatisticsTrendWidgetTest::anotherGrouping()
{
    group(static_cast<Cfg::GroupBy>(2), {ChartMeasurements::line("edge", 3.0)});
    QVERIFY(chart()->series().isEmpty());
    QVERIFY(chart()->categories().isEmpty());
}

void KvStatisticsTrendWidgetTest::oneUnitForAGroup_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QVariantList>("values");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QStringList>("expected");
    QTest::newRow("micrometres") << 1 << QVariantList{5, 8.5} << "x/v(μm)" << QStringList{"1=5", "2=8.5"};
    // (3 + 1 + 4) / 2
    QTest::newRow("between two units")
        << 1 << QVariantList{500.0, 5000.0} << "x/v(mm)" << QStringList{"1=0.5", "2=5"};
    QTest::newRow("square millimetres")
        << 2 << QVariantList{1500000.0, 4e6} << "x/v(mm²)" << QStringList{"1=1.5", "2=4"};
    QTest::newRow("degrees") << 3 << QVariantList{90.0} << "x/v(deg(°))" << QStringList{"1=90"};
    QTest::newRow("pieces") << 4 << QVariantList{3} << "x/v(pcs)" << QStringList{"1=3"};
    QTest::newRow("percent") << 5 << QVariantList{12.5} << "x/v(%)" << QStringList{"1=12.5"};
    QTest::newRow("nothing known") << 0 << QVariantList{5000.0} << "x/v()" << QStringList{"1=5000"};
    QTest::newRow("a text counts 0") << 1 << QVariantList{QStringLiteral("12.5"), 4.0} << "x/v(μm)"
                                     << QStringList{"1=0", "2=4"};
}

void KvStatisticsTrendWidgetTest::oneUnitForAGroup()
{
    QFETCH(int, kind);
    QFETCH(QVariantList, values);
    QVector<ChartObject> objects;
    for (const QVariant &value : values)
        objects.append({ChartMeasurements::Line, "x", "o", {{"v", value, kind}}});
    group(Cfg::ByObject, objects);
    QCOMPARE(names().size(), 1);
    QTEST(names().first(), "name");
    QTEST(points(0), "expected");
}

void KvStatisticsTrendWidgetTest::theFirstRecordSaysWhatIsMeasured()
{
    // The rectangle's area comes first, so the line's length is converted as an area, too.
    group(Cfg::ByMeasurement, {{ChartMeasurements::Rectangle, "Rectangle", "r", {{"size", 1e6, 2}}},
                               {ChartMeasurements::Line, "Line", "l", {{"size", 4e6, 1}}}});
    QCOMPARE(names(), QStringList({"size(mm²)"}));
    QCOMPARE(points(0), QStringList({"r=1", "l=4"}));
}

void KvStatisticsTrendWidgetTest::equalNamesMerge()
{
    group(Cfg::ByObject, {{ChartMeasurements::Line, "a", "l", {{"b/c", 1.0, 1}}},
                          {ChartMeasurements::Circle, "a/b", "c", {{"c", 2.0, 1}}},
                          {ChartMeasurements::Rectangle, "z", "r", {{"c", 3.0, 1}}}});
    QCOMPARE(names(), QStringList({"a/b/c(μm)", "z/c(μm)"}));
    QCOMPARE(points(0), QStringList({"1=1", "1=2"}));
    QCOMPARE(chart()->series().at(0)->color(), seriesColor(0));
    QCOMPARE(chart()->series().at(1)->color(), seriesColor(1));
    QCOMPARE(chart()->legend()->items().size(), 2);
}

void KvStatisticsTrendWidgetTest::equalObjectNamesShareAPlace()
{
    group(Cfg::ByMeasurement, {ChartMeasurements::line("o", 1.0), ChartMeasurements::line("O", 2.0),
                               ChartMeasurements::circle("o", 3.0), ChartMeasurements::line("o", 4.0)});
    QCOMPARE(chart()->categories(), QStringList({"o", "O"}));
    QCOMPARE(points(0), QStringList({"o=3"}));
    QCOMPARE(points(1), QStringList({"o=1", "O=2", "o=4"}));
}

void KvStatisticsTrendWidgetTest::countersAreLeftOut()
{
    const QVector<ChartObject> objects{ChartMeasurements::counter("n", 3), ChartMeasurements::line("l", 2.0)};
    group(Cfg::ByMeasurement, objects);
    QCOMPARE(names(), QStringList({"length(μm)"}));
    group(Cfg::ByObject, objects);
    QCOMPARE(names(), QStringList({"Line/length(μm)"}));
}

void KvStatisticsTrendWidgetTest::nothingMeasured()
{
    group(Cfg::ByObject, {ChartMeasurements::line("l", 2.0), ChartMeasurements::line("l", 3.0)});
    QVERIFY(!chart()->parts().isEmpty());
    m_host->setObjects({});
    QVERIFY(chart()->series().isEmpty());
    QVERIFY(chart()->parts().isEmpty());
    QVERIFY(chart()->legend()->items().isEmpty());
    m_widget->grab();
}

void KvStatisticsTrendWidgetTest::oneRecordHasNoTrendLine()
{
    const auto reaches = [this]() { return chart()->itemsBoundingRect().right(); };
    group(Cfg::ByObject, {ChartMeasurements::line("l", 2.0)});
    QCOMPARE(points(0), QStringList({"1=2"}));
    // A trend line would stand out of the plot by 50 on either side.
    QVERIFY(reaches() < 1049);
    group(Cfg::ByObject, {ChartMeasurements::line("l", 2.0), ChartMeasurements::line("l", 2.0)});
    QVERIFY(reaches() >= 1049);
    QVERIFY(std::isfinite(chart()->sceneRect().width()));
}

void KvStatisticsTrendWidgetTest::everySeriesShowsItsTrendAndNoLimits()
{
    group(Cfg::ByObject, {ChartMeasurements::line("l", 2.0), ChartMeasurements::circle("c", 3.0)});
    QCOMPARE(chart()->series().size(), 2);
    for (const KvLineSerie *serie : chart()->series()) {
        QVERIFY(serie->showTrend());
        QVERIFY(!serie->showLimits());
    }
}

void KvStatisticsTrendWidgetTest::groupingSlotRefills()
{
    m_host->setObjects({ChartMeasurements::line("l", 2.0)});
    m_widget->slotGroupByChanged(Cfg::ByMeasurement);
    QCOMPARE(names(), QStringList({"length(μm)"}));
    QCOMPARE(chart()->categories(), QStringList({"l"}));
    m_widget->slotGroupByChanged(Cfg::ByObject);
    QCOMPARE(names(), QStringList({"Line/length(μm)"}));
    QCOMPARE(chart()->categories(), QStringList({"1"}));
}

void KvStatisticsTrendWidgetTest::handlesManyValues()
{
    QVector<ChartObject> objects;
    for (int i = 0; i < 20000; ++i)
        objects.append(ChartMeasurements::line(QStringLiteral("l"), 1.0 + i % 7));
    QElapsedTimer stopwatch;
    stopwatch.start();
    group(Cfg::ByObject, objects);
    QCOMPARE(chart()->series().first()->points().size(), 20000);
    QCOMPARE(chart()->categories().size(), 20000);
    QVERIFY2(stopwatch.elapsed() < 20000, "a long series takes far longer than it should");
}

STATREPORT_TEST_MAIN(KvStatisticsTrendWidgetTest)
#include "KvStatisticsTrendWidgetTest.moc"
