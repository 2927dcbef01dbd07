// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartMeasurements.h"
#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYCategories.h"
#include "charts/KvChartView.h"
#include "charts/KvHorizontalBox.h"
#include "charts/KvHorizontalBoxChart.h"
#include "charts/KvSeriesPalette.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeCfg.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxWidget.h"

using namespace kvCharts;

namespace {

using Cfg = KvStatisticsMinMedMaxBoxNodeCfg;

QVector<ChartObject> lines(const QVariantList &lengths)
{
    QVector<ChartObject> objects;
    for (const QVariant &length : lengths)
        objects.append(ChartMeasurements::line(QStringLiteral("l"), length));
    return objects;
}

ChartObject area(const QString &name, const QVariant &squareMicrometres)
{
    return {
        ChartMeasurements::Rectangle, QStringLiteral("Rectangle"), name, {{"area", squareMicrometres, 2}}};
}

} // namespace

/** Which boxes the measured values give. */
class KvStatisticsMinMedMaxBoxWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void summaries_data();
    void summaries();
    void oneValue();
    void oneUnitForAllOfAKind();
    void eachKindHasItsUnit();
    void groupings_data();
    void groupings();
    void countersAreLeftOut();
    void colors();
    void emptyKeepsTheAxes();
    void negativeAreasHaveNoBox();
    void groupingSlotRefills();

private:
    KvHorizontalBoxChart *chart() const
    {
        return qobject_cast<KvHorizontalBoxChart *>(m_widget->chartView()->chart());
    }
    const KvHorizontalBox *box(int index) const
    {
        return qobject_cast<const KvHorizontalBox *>(chart()->parts().at(index));
    }
    QStringList labels(int index) const
    {
        QStringList texts;
        for (const KvHorizontalBox::Point &point : box(index)->points())
            texts.append(point.label);
        return texts;
    }
    QStringList categories() const
    {
        return qobject_cast<KvAxisYCategories *>(chart()->axisY())->categories();
    }
    const KvBaseAxis *valueAxis() const { return qobject_cast<const KvBaseAxis *>(chart()->axisX()); }

    std::unique_ptr<ChartMeasurements> m_host;
    std::unique_ptr<Cfg> m_cfg;
    std::unique_ptr<KvStatisticsMinMedMaxBoxWidget> m_widget;
};

void KvStatisticsMinMedMaxBoxWidgetTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<ChartMeasurements>();
    m_cfg = std::make_unique<Cfg>(nullptr);
    m_widget = std::make_unique<KvStatisticsMinMedMaxBoxWidget>(nullptr, m_cfg.get());
}

void KvStatisticsMinMedMaxBoxWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsMinMedMaxBoxWidgetTest::summaries_data()
{
    QTest::addColumn<QVariantList>("lengths");
    QTest::addColumn<QStringList>("expected"); // minimum, lower quartile, median, upper quartile, maximum
    QTest::newRow("four") << QVariantList{4.0, 2.0, 1.0, 3.0} << QStringList{"1", "2", "3", "4", "4"};
    QTest::newRow("nine") << QVariantList{9.0, 8.0, 7.0, 6.0, 5.0, 4.0, 3.0, 2.0, 1.0}
                          << QStringList{"1", "4", "5", "8", "9"};
    QTest::newRow("whole numbers") << QVariantList{10, 20} << QStringList{"10", "20", "20", "20", "20"};
    QTest::newRow("fractions") << QVariantList{1.25, 1.5, 2.125}
                               << QStringList{"1.25", "1.5", "1.5", "2.125", "2.125"};
    // A text counts as 0, which makes nanometres of the one end: (2 + 1 + 3) / 2 is micrometres still.
    QTest::newRow("a text") << QVariantList{QStringLiteral("12.5"), 4.0}
                            << QStringList{"0", "4", "4", "4", "4"};
}

void KvStatisticsMinMedMaxBoxWidgetTest::summaries()
{
    QFETCH(QVariantList, lengths);
    m_host->setObjects(lines(lengths));
    QCOMPARE(categories(), QStringList({QStringLiteral("Line/length(μm)")}));
    QCOMPARE(chart()->parts().size(), 1);
    QTEST(labels(0), "expected");
    const double lo = valueAxis()->minimum();
    const double hi = valueAxis()->maximum();
    for (const KvHorizontalBox::Point &point : box(0)->points())
        QCOMPARE(point.x, (point.label.toDouble() - lo) * 1000 / (hi - lo));
}

void KvStatisticsMinMedMaxBoxWidgetTest::oneValue()
{
    m_host->setObjects(lines({5.0}));
    QCOMPARE(labels(0), QStringList({"5", "5", "5", "5", "5"}));
    QCOMPARE(valueAxis()->minimum(), 4.5);
    QCOMPARE(valueAxis()->maximum(), 5.5);
    for (const KvHorizontalBox::Point &point : box(0)->points())
        QCOMPARE(point.x, 500.0);
}

void KvStatisticsMinMedMaxBoxWidgetTest::oneUnitForAllOfAKind()
{
    // Micrometres for the one, millimetres for the other: of both ends (3 + 1 + 4) / 2 is millimetres.
    m_host->setObjects({ChartMeasurements::line("l", 500.0), ChartMeasurements::circle("c", 5000.0)});
    QCOMPARE(categories(), QStringList({"Circle/diameter(mm)", "Line/length(mm)"}));
    QCOMPARE(labels(0).first(), QStringLiteral("5"));
    QCOMPARE(labels(1).first(), QStringLiteral("0.5"));
    QVERIFY(valueAxis()->minimum() <= 0.5 && valueAxis()->maximum() >= 5.0);
    QVERIFY(valueAxis()->maximum() < 10.0);
}

void KvStatisticsMinMedMaxBoxWidgetTest::eachKindHasItsUnit()
{
    m_host->setObjects({ChartMeasurements::line("l", 5000.0),
                        area("r", 40.0),
                        {ChartMeasurements::Circle, "Circle", "c", {{"angle", 90.0, 3}, {"none", 7.0, 9}}}});
    QCOMPARE(categories(), QStringList({QStringLiteral("Circle/angle(deg(°))"), "Circle/none()",
                                        "Line/length(mm)", QStringLiteral("Rectangle/area(μm²)")}));
    const QStringList values{"90", "7", "5", "40"};
    for (int i = 0; i < 4; ++i)
        QCOMPARE(labels(i).at(2), values.at(i));
}

void KvStatisticsMinMedMaxBoxWidgetTest::groupings_data()
{
    QTest::addColumn<int>("groupBy");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("by measurement") << 0 << QStringList{"diameter(μm)", "length(μm)"};
    QTest::newRow("by object") << 1
                               << QStringList{"Circle/diameter(μm)", "Line/length(μm)",
                                              "Rectangle/length(μm)"};
    QTest::newRow("another") << 2 << QStringList();
}

void KvStatisticsMinMedMaxBoxWidgetTest::groupings()
{
    QFETCH(int, groupBy);
    QFETCH(QStringList, names);
    m_cfg->setGroupBy(static_cast<Cfg::GroupBy>(groupBy));
    m_host->setObjects({ChartMeasurements::line("l", 2.0),
                        ChartMeasurements::circle("c", 3.0),
                        {ChartMeasurements::Rectangle, "Rectangle", "r", {{"length", 4.0, 1}}}});
    QCOMPARE(categories(), names);
    QCOMPARE(chart()->boxCount(), names.size());
}

void KvStatisticsMinMedMaxBoxWidgetTest::countersAreLeftOut()
{
    m_host->setObjects({ChartMeasurements::counter("n", 3), ChartMeasurements::line("l", 2.0)});
    for (const Cfg::GroupBy groupBy : {Cfg::ByMeasurement, Cfg::ByObject}) {
        m_cfg->setGroupBy(groupBy);
        m_widget->updateValues();
        QCOMPARE(chart()->boxCount(), 1);
    }
}

void KvStatisticsMinMedMaxBoxWidgetTest::colors()
{
    m_host->setObjects(
        {ChartMeasurements::line("l", 2.0), ChartMeasurements::circle("c", 3.0), area("r", 4.0)});
    QCOMPARE(chart()->parts().size(), 3);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(box(i)->brush().color(), seriesColor(i));
    QCOMPARE(box(0)->extent().top, 1000.0 / 3 * 0.25);
    QCOMPARE(box(2)->extent().bottom, 1000.0 / 3 * 2.75);
}

void KvStatisticsMinMedMaxBoxWidgetTest::emptyKeepsTheAxes()
{
    m_host->setObjects(lines({10.0, 20.0}));
    const double lo = valueAxis()->minimum();
    const double hi = valueAxis()->maximum();
    m_host->setObjects({});
    QCOMPARE(chart()->boxCount(), 0);
    QVERIFY(chart()->parts().isEmpty());
    QCOMPARE(categories(), QStringList({QStringLiteral("Line/length(μm)")}));
    QCOMPARE(valueAxis()->minimum(), lo);
    QCOMPARE(valueAxis()->maximum(), hi);
}

void KvStatisticsMinMedMaxBoxWidgetTest::negativeAreasHaveNoBox()
{
    m_host->setObjects({area("r", -4.0), ChartMeasurements::line("l", 2.0)});
    QCOMPARE(chart()->boxCount(), 2);
    QCOMPARE(chart()->parts().size(), 1);
    QCOMPARE(labels(0).first(), QStringLiteral("2"));
    m_widget->grab();
}

void KvStatisticsMinMedMaxBoxWidgetTest::groupingSlotRefills()
{
    m_host->setObjects(lines({1.0}));
    m_widget->slotGroupByChanged(Cfg::ByMeasurement);
    QCOMPARE(categories(), QStringList({QStringLiteral("length(μm)")}));
    m_widget->slotGroupByChanged(Cfg::ByObject);
    QCOMPARE(categories(), QStringList({QStringLiteral("Line/length(μm)")}));
}

STATREPORT_TEST_MAIN(KvStatisticsMinMedMaxBoxWidgetTest)
#include "KvStatisticsMinMedMaxBoxWidgetTest.moc"
