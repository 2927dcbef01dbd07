// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartMeasurements.h"
#include "charts/KvChartView.h"
#include "charts/KvLegend.h"
#include "charts/KvPie.h"
#include "charts/KvPieChart.h"
#include "charts/KvSeriesPalette.h"
#include "charts/counterpie/KvStatisticsCounterPieNodeCfg.h"
#include "charts/counterpie/KvStatisticsCounterPieWidget.h"

#include <QGraphicsTextItem>

using namespace kvCharts;

/** Which slices the counters give. */
class KvStatisticsCounterPieWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void slicesAreInProportion();
    void slicesComeInRecordOrder();
    void onlyCountsAreShown();
    void textsCountNothing();
    void nothingCounted();
    void allCountsZero();
    void oneCounterIsAFullCircle();
    void theSixteenthCounter();
    void equalNamesAreSlicesOfTheirOwn();
    void followsTheCounters();

private:
    KvPieChart *chart() const { return qobject_cast<KvPieChart *>(m_widget->chartView()->chart()); }
    const KvPie *slice(int index) const { return qobject_cast<const KvPie *>(chart()->parts().at(index)); }
    QStringList sliceTexts() const
    {
        QStringList texts;
        for (int i = 0; i < chart()->parts().size(); ++i)
            texts.append(slice(i)->text());
        return texts;
    }
    QStringList legendTexts() const
    {
        QStringList texts;
        for (const KvLegend::Item &item : chart()->legend()->items())
            texts.append(item.text);
        return texts;
    }

    std::unique_ptr<ChartMeasurements> m_host;
    std::unique_ptr<KvStatisticsCounterPieNodeCfg> m_cfg;
    std::unique_ptr<KvStatisticsCounterPieWidget> m_widget;
};

void KvStatisticsCounterPieWidgetTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<ChartMeasurements>();
    m_cfg = std::make_unique<KvStatisticsCounterPieNodeCfg>(nullptr);
    m_widget = std::make_unique<KvStatisticsCounterPieWidget>(nullptr, m_cfg.get());
}

void KvStatisticsCounterPieWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsCounterPieWidgetTest::slicesAreInProportion()
{
    m_host->setObjects({ChartMeasurements::counter("cells", 1), ChartMeasurements::counter("pores", 2.0),
                        ChartMeasurements::counter("dust", 5)});
    QCOMPARE(sliceTexts(), QStringList({"cells - 1", "pores - 2", "dust - 5"}));
    QCOMPARE(legendTexts(), QStringList({"cells", "pores", "dust"}));
    const double starts[] = {0, 45, 135};
    const double spans[] = {45, 90, 225};
    for (int i = 0; i < 3; ++i) {
        QCOMPARE(slice(i)->startAngle(), starts[i]);
        QCOMPARE(slice(i)->spanAngle(), spans[i]);
        QCOMPARE(slice(i)->brush().color(), seriesColor(i));
        QCOMPARE(slice(i)->pen().color(), QColor(Qt::white));
        QCOMPARE(chart()->legend()->items().at(i).color, seriesColor(i));
    }
}

void KvStatisticsCounterPieWidgetTest::slicesComeInRecordOrder()
{
    // By the names of types and values they would come in another order.
    ChartObject first = ChartMeasurements::counter("first", 1);
    first.typeName = QStringLiteral("Z");
    ChartObject second = ChartMeasurements::counter("another", 1);
    second.typeName = QStringLiteral("A");
    m_host->setObjects({first, second});
    QCOMPARE(sliceTexts(), QStringList({"first - 1", "another - 1"}));
}

void KvStatisticsCounterPieWidgetTest::onlyCountsAreShown()
{
    // Neither other objects nor a counter's share of all counts.
    m_host->setObjects({ChartMeasurements::line("l", 7.0),
                        ChartMeasurements::counter("n", 3),
                        {ChartMeasurements::Circle, "Circle", "c", {{"count", 9, 4}}}});
    QCOMPARE(sliceTexts(), QStringList({"n - 3"}));
}

void KvStatisticsCounterPieWidgetTest::textsCountNothing()
{
    m_host->setObjects(
        {ChartMeasurements::counter("a", QStringLiteral("12")), ChartMeasurements::counter("b", 2)});
    QCOMPARE(sliceTexts(), QStringList({"a - 0", "b - 2"}));
    QCOMPARE(slice(1)->spanAngle(), 360.0);
}

void KvStatisticsCounterPieWidgetTest::nothingCounted()
{
    m_host->setObjects({ChartMeasurements::line("l", 7.0)});
    QVERIFY(chart()->parts().isEmpty());
    QVERIFY(chart()->legend()->items().isEmpty());
    QVERIFY(chart()->items().isEmpty());
    QCOMPARE(chart()->sceneRect(), QRectF(-50, -50, 100, 100));
}

void KvStatisticsCounterPieWidgetTest::allCountsZero()
{
    m_host->setObjects({ChartMeasurements::counter("a", 0), ChartMeasurements::counter("b", 0)});
    QVERIFY(chart()->parts().isEmpty());
    QCOMPARE(legendTexts(), QStringList({"a", "b"}));
    QVERIFY(!chart()->items().isEmpty());
}

void KvStatisticsCounterPieWidgetTest::oneCounterIsAFullCircle()
{
    m_host->setObjects({ChartMeasurements::counter("cells", 5)});
    QCOMPARE(sliceTexts(), QStringList({"cells - 5"}));
    QCOMPARE(slice(0)->startAngle(), 0.0);
    QCOMPARE(slice(0)->spanAngle(), 360.0);
    const QGraphicsTextItem *label = nullptr;
    for (const QGraphicsItem *item : chart()->items()) {
        const auto *text = dynamic_cast<const QGraphicsTextItem *>(item);
        if (text && text->toPlainText() == QLatin1String("cells - 5"))
            label = text;
    }
    QVERIFY(label);
    QCOMPARE(label->zValue(), 1.0);
    // Half-way out to the left of the centre. The label's offset, half the room beside it and half its height
    // up, is turned by half a circle and back, so it points left and down.
    const QSizeF size = label->boundingRect().size();
    const QPointF corner = label->sceneTransform().map(QPointF(0, 0));
    QVERIFY(qAbs(corner.x() - (500 - (450 - size.width()) / 2)) < 0.01);
    QVERIFY(qAbs(corner.y() - (500 + size.height() / 2)) < 0.01);
}

void KvStatisticsCounterPieWidgetTest::theSixteenthCounter()
{
    QVector<ChartObject> counters;
    for (int i = 0; i < 17; ++i)
        counters.append(ChartMeasurements::counter(QString::number(i), 1));
    m_host->setObjects(counters);
    QCOMPARE(chart()->parts().size(), 17);
    QCOMPARE(slice(14)->brush().color(), seriesColor(14));
    QCOMPARE(slice(15)->brush().color(), seriesColor(0));
    QCOMPARE(slice(16)->brush().color(), seriesColor(16));
    QVERIFY(!chart()->legend()->items().at(15).color.isValid());
}

void KvStatisticsCounterPieWidgetTest::equalNamesAreSlicesOfTheirOwn()
{
    m_host->setObjects({ChartMeasurements::counter("n", 1), ChartMeasurements::counter("n", 1)});
    QCOMPARE(sliceTexts(), QStringList({"n - 1", "n - 1"}));
    QCOMPARE(slice(1)->startAngle(), 180.0);
}

void KvStatisticsCounterPieWidgetTest::followsTheCounters()
{
    m_host->setObjects({ChartMeasurements::counter("a", 1), ChartMeasurements::counter("b", 1)});
    m_host->setObjects({ChartMeasurements::counter("c", 4)});
    QCOMPARE(sliceTexts(), QStringList({"c - 4"}));
    QCOMPARE(legendTexts(), QStringList({"c"}));
    m_host->setObjects({});
    QVERIFY(chart()->items().isEmpty());
}

STATREPORT_TEST_MAIN(KvStatisticsCounterPieWidgetTest)
#include "KvStatisticsCounterPieWidgetTest.moc"
