// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "SceneItems.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLegend.h"
#include "charts/KvPie.h"
#include "charts/KvPieChart.h"
#include "charts/KvSeriesPalette.h"

#include <QGraphicsRectItem>

using namespace kvCharts;

class KvPieChartTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void slices();
    void texts_data();
    void texts();
    void paletteColors();
    void theSixteenthSlice();
    void noSlicesButLegend_data();
    void noSlicesButLegend();
    void clears();
    void rebuildsOncePerUpdate();
};

namespace {

QVector<const KvPie *> pies(const KvChart &chart)
{
    QVector<const KvPie *> result;
    for (const KvBaseChartPart *part : chart.parts())
        result.append(qobject_cast<const KvPie *>(part));
    return result;
}

QString name(const char *latin)
{
    return QString::fromLatin1(latin);
}

} // namespace

void KvPieChartTest::slices()
{
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.addSlice(name("a"), 1.0, Qt::blue, Qt::red);
    chart.addSlice(name("b"), 3.0, QColor(), Qt::green);
    QCOMPARE(chart.sliceCount(), 2);
    const auto parts = pies(chart);
    QCOMPARE(parts.size(), 2);
    QCOMPARE(parts.at(0)->startAngle(), 0.0);
    QCOMPARE(parts.at(0)->spanAngle(), 90.0);
    QCOMPARE(parts.at(0)->pen().color(), QColor(Qt::blue));
    QCOMPARE(parts.at(0)->brush().color(), QColor(Qt::red));
    QCOMPARE(parts.at(1)->startAngle(), 90.0);
    QCOMPARE(parts.at(1)->spanAngle(), 270.0);
    QCOMPARE(parts.at(1)->pen().color(), QColor(Qt::white));
    QCOMPARE(chart.legend()->items().size(), 2);
    QCOMPARE(chart.legend()->items().at(1).text, name("b"));
    QCOMPARE(chart.legend()->items().at(1).color, QColor(Qt::green));
    QCOMPARE(chart.items().size(), 8); // 2 slices, 2 labels; group, 2 markers, texts
}

void KvPieChartTest::texts_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<QString>("text");
    QTest::newRow("whole") << 5.0 << name("Grain - 5");
    QTest::newRow("fraction") << 0.5 << name("Grain - 0.5");
    QTest::newRow("six digits") << 1.23456789 << name("Grain - 1.23457");
    QTest::newRow("million") << 1e6 << name("Grain - 1e+06");
}

void KvPieChartTest::texts()
{
    QFETCH(double, value);
    QFETCH(QString, text);
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.addSlice(name("Grain"), value, QColor(), QColor());
    QCOMPARE(pies(chart).first()->text(), text);
}

void KvPieChartTest::paletteColors()
{
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.addSlice(name("a"), 1.0, QColor(), QColor());
    chart.addSlice(name("b"), 1.0, QColor(), Qt::black);
    chart.addSlice(name("c"), 1.0, QColor(), QColor());
    // By the number of slices before, whatever their colours.
    QCOMPARE(pies(chart).at(0)->brush().color(), seriesColor(0));
    QCOMPARE(pies(chart).at(1)->brush().color(), QColor(Qt::black));
    QCOMPARE(pies(chart).at(2)->brush().color(), seriesColor(2));
}

void KvPieChartTest::theSixteenthSlice()
{
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.beginUpdate();
    for (int i = 0; i < 17; ++i)
        chart.addSlice(QString::number(i), 1.0, QColor(), QColor());
    chart.endUpdate();
    QCOMPARE(pies(chart).at(15)->brush().color(), seriesColor(0));
    QVERIFY(!chart.legend()->items().at(15).color.isValid());
    const auto markers = itemsOf<QGraphicsRectItem>(&chart);
    QCOMPARE(markers.size(), 17);
    QCOMPARE(markers.at(14)->brush().color(), seriesColor(14));
    QCOMPARE(markers.at(15)->brush().color().rgb(), QColor(Qt::black).rgb());
    QCOMPARE(pies(chart).at(16)->brush().color(), seriesColor(16));
    chart.refresh();
    QCOMPARE(pies(chart).at(15)->brush().color(), seriesColor(0));
}

void KvPieChartTest::noSlicesButLegend_data()
{
    QTest::addColumn<double>("first");
    QTest::addColumn<double>("second");
    QTest::newRow("zeros") << 0.0 << 0.0;
    QTest::newRow("sum zero") << 1.0 << -1.0;
    QTest::newRow("not a number") << 1.0 << qQNaN();
}

void KvPieChartTest::noSlicesButLegend()
{
    QFETCH(double, first);
    QFETCH(double, second);
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.beginUpdate();
    chart.addSlice(name("a"), first, QColor(), QColor());
    chart.addSlice(name("b"), second, QColor(), QColor());
    chart.endUpdate();
    QVERIFY(chart.parts().isEmpty());
    QCOMPARE(chart.legend()->items().size(), 2);
}

void KvPieChartTest::clears()
{
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.addSlice(name("a"), 1.0, QColor(), QColor());
    chart.clearSlices();
    QVERIFY(chart.parts().isEmpty());
    QVERIFY(chart.legend()->items().isEmpty());
    QVERIFY(chart.items().isEmpty()); // the legend redrew
    QCOMPARE(chart.sceneRect(), QRectF(-50, -50, 100, 100));
    chart.addSlice(name("b"), 1.0, QColor(), QColor());
    QCOMPARE(pies(chart).size(), 1);
    QCOMPARE(pies(chart).first()->brush().color(), seriesColor(0));
}

void KvPieChartTest::rebuildsOncePerUpdate()
{
    const KvChartThemes themes;
    KvPieChart chart(&themes);
    chart.beginUpdate();
    chart.addSlice(name("a"), 1.0, QColor(), QColor());
    QVERIFY(chart.parts().isEmpty());
    QCOMPARE(chart.legend()->items().size(), 1);
    chart.endUpdate();
    QCOMPARE(chart.parts().size(), 1);
}

STATREPORT_TEST_MAIN(KvPieChartTest)
#include "KvPieChartTest.moc"
