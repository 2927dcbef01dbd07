// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartMeasurements.h"
#include "charts/common/KvChartValueGroup.h"
#include "data/KvStatisticsUnitConverter.h"

namespace {

using Cfg = KvStatisticsGroupedChartNodeCfg;
using Unit = KvStatisticsUnitConverter;

/** Name of each group, with the names of the objects in it. */
QStringList collected(int groupBy)
{
    QStringList texts;
    for (const KvChartValueGroup &group :
         KvChartValueGroup::collect(KvStatisticsEngine::instance(), static_cast<Cfg::GroupBy>(groupBy))) {
        QStringList objects;
        for (const KvMeasuredValue &record : group.records)
            objects.append(record.objectName);
        texts.append(group.name + QStringLiteral(": ") + objects.join(QLatin1Char(' ')));
    }
    return texts;
}

ChartObject object(int type, const QString &typeName, const QString &name, const QString &valueName)
{
    return {type, typeName, name, {{valueName, 1.0, 1}}};
}

} // namespace

class KvChartValueGroupTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void nothingMeasured();
    void groupsByMeasurement();
    void groupsByObject();
    void otherGroupings_data();
    void otherGroupings();
    void countersAreLeftOut();
    void orderIsThatOfTheNames();
    void titles_data();
    void titles();
    void theFirstRecordSaysWhatIsMeasured();

private:
    std::unique_ptr<ChartMeasurements> m_host = std::make_unique<ChartMeasurements>();
};

void KvChartValueGroupTest::nothingMeasured()
{
    m_host->setObjects({});
    QCOMPARE(collected(0), QStringList());
    QCOMPARE(collected(1), QStringList());
}

void KvChartValueGroupTest::groupsByMeasurement()
{
    m_host->setObjects({ChartMeasurements::circle("c1", 5.0), ChartMeasurements::line("l1", 1.0),
                        ChartMeasurements::line("l2", 2.0),
                        object(ChartMeasurements::Rectangle, "Rectangle", "r1", "length")});
    // A rectangle has the least type id, so it is measured first, whatever the names say.
    QCOMPARE(collected(0), QStringList({"diameter: c1", "length: r1 l1 l2"}));
}

void KvChartValueGroupTest::groupsByObject()
{
    m_host->setObjects({ChartMeasurements::circle("c1", 5.0), ChartMeasurements::line("l1", 1.0),
                        ChartMeasurements::line("l2", 2.0),
                        object(ChartMeasurements::Rectangle, "Rectangle", "r1", "length")});
    QCOMPARE(collected(1),
             QStringList({"Circle/diameter: c1", "Line/length: l1 l2", "Rectangle/length: r1"}));
}

void KvChartValueGroupTest::otherGroupings_data()
{
    QTest::addColumn<int>("groupBy");
    QTest::newRow("two") << 2;
    QTest::newRow("negative") << -1;
}

void KvChartValueGroupTest::otherGroupings()
{
    QFETCH(int, groupBy);
    m_host->setObjects({ChartMeasurements::line("l1", 1.0)});
    QCOMPARE(collected(groupBy), QStringList());
}

void KvChartValueGroupTest::countersAreLeftOut()
{
    m_host->setObjects({ChartMeasurements::counter("n1", 3), ChartMeasurements::line("l1", 1.0)});
    QCOMPARE(collected(0), QStringList({"length: l1"}));
    QCOMPARE(collected(1), QStringList({"Line/length: l1"}));

    // Other objects that have a value of the same name: a line stands before a counter, a circle behind it.
    m_host->setObjects({ChartMeasurements::counter("n1", 3),
                        object(ChartMeasurements::Line, "Line", "l1", "count"),
                        object(ChartMeasurements::Circle, "Circle", "c1", "share")});
    QCOMPARE(collected(0), QStringList({"count: l1"}));
    QCOMPARE(collected(1), QStringList({"Circle/share: c1", "Line/count: l1"}));
}

void KvChartValueGroupTest::orderIsThatOfTheNames()
{
    m_host->setObjects({object(ChartMeasurements::Line, "b", "1", "y"),
                        object(ChartMeasurements::Circle, "A", "2", "x"),
                        object(ChartMeasurements::Rectangle, "a", "3", "B")});
    QCOMPARE(collected(0), QStringList({"B: 3", "x: 2", "y: 1"}));
    QCOMPARE(collected(1), QStringList({"A/x: 2", "a/B: 3", "b/y: 1"}));
}

void KvChartValueGroupTest::titles_data()
{
    QTest::addColumn<int>("unit");
    QTest::addColumn<QString>("title");
    QTest::newRow("none") << int(Unit::NoUnit) << "length()";
    QTest::newRow("micrometres") << int(Unit::Micrometre) << QStringLiteral("length(μm)");
    QTest::newRow("square millimetres") << int(Unit::SquareMillimetre) << QStringLiteral("length(mm²)");
}

void KvChartValueGroupTest::titles()
{
    QFETCH(int, unit);
    m_host->setObjects({ChartMeasurements::line("l1", 1.0)});
    const auto groups = KvChartValueGroup::collect(KvStatisticsEngine::instance(), Cfg::ByMeasurement);
    QTEST(groups.first().title(unit), "title");
}

void KvChartValueGroupTest::theFirstRecordSaysWhatIsMeasured()
{
    m_host->setObjects({{ChartMeasurements::Rectangle, "Rectangle", "r", {{"size", 4.0, 2}}},
                        {ChartMeasurements::Line, "Line", "l", {{"size", 4.0, 1}}}});
    const auto groups = KvChartValueGroup::collect(KvStatisticsEngine::instance(), Cfg::ByMeasurement);
    QCOMPARE(groups.size(), 1);
    QCOMPARE(groups.first().measureKind(), 2);
    QCOMPARE(groups.first().records.size(), 2);
}

STATREPORT_TEST_MAIN(KvChartValueGroupTest)
#include "KvChartValueGroupTest.moc"
