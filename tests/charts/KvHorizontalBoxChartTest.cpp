// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYCategories.h"
#include "charts/KvChartThemes.h"
#include "charts/KvHorizontalBox.h"
#include "charts/KvHorizontalBoxChart.h"
#include "charts/KvLineRunItem.h"

using namespace kvCharts;

class KvHorizontalBoxChartTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void axes();
    void twoEntries();
    void oneValue();
    void emptyRebuildKeepsTheAxes();
    void clears();
    void rebuildsOncePerUpdate();
    void entriesWithoutNumbers();
};

namespace {

QVector<const KvHorizontalBox *> boxes(const KvChart &chart)
{
    QVector<const KvHorizontalBox *> result;
    for (const KvBaseChartPart *part : chart.parts())
        result.append(qobject_cast<const KvHorizontalBox *>(part));
    return result;
}

QString name(const char *latin)
{
    return QString::fromLatin1(latin);
}

const KvAxisYCategories *categoryAxis(const KvChart &chart)
{
    return qobject_cast<const KvAxisYCategories *>(chart.axisY());
}

const KvAxisXValues *valueAxis(const KvChart &chart)
{
    return qobject_cast<const KvAxisXValues *>(chart.axisX());
}

} // namespace

void KvHorizontalBoxChartTest::axes()
{
    const KvChartThemes themes;
    const KvHorizontalBoxChart chart(&themes);
    QVERIFY(valueAxis(chart));
    QVERIFY(categoryAxis(chart));
}

void KvHorizontalBoxChartTest::twoEntries()
{
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    chart.addBox(name("setosa"), 10, 20, 30, 40, 60, Qt::red);
    chart.addBox(name("virginica"), 0, 25, 50, 75, 100, Qt::green);
    QCOMPARE(chart.boxCount(), 2);
    QCOMPARE(categoryAxis(chart)->categories(), QStringList({name("setosa"), name("virginica")}));
    QCOMPARE(valueAxis(chart)->minimum(), 0.0);
    QCOMPARE(valueAxis(chart)->maximum(), 100.0);
    const auto parts = boxes(chart);
    QCOMPARE(parts.size(), 2);
    QCOMPARE(parts.at(0)->extent().top, 125.0);
    QCOMPARE(parts.at(0)->extent().bottom, 375.0);
    QCOMPARE(parts.at(1)->extent().top, 625.0);
    QCOMPARE(parts.at(1)->extent().bottom, 875.0);
    const QVector<double> xs{100, 200, 300, 400, 600};
    const QStringList labels{name("10"), name("20"), name("30"), name("40"), name("60")};
    for (int i = 0; i < 5; ++i) {
        QCOMPARE(parts.at(0)->points().at(static_cast<std::size_t>(i)).x, xs.at(i));
        QCOMPARE(parts.at(0)->points().at(static_cast<std::size_t>(i)).label, labels.at(i));
    }
    QCOMPARE(parts.at(0)->brush().color(), QColor(Qt::red));
    QCOMPARE(parts.at(1)->brush().color(), QColor(Qt::green));
}

void KvHorizontalBoxChartTest::oneValue()
{
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    chart.addBox(name("five"), 5, 5, 5, 5, 5, Qt::red);
    QCOMPARE(valueAxis(chart)->minimum(), 4.5);
    QCOMPARE(valueAxis(chart)->maximum(), 5.5);
    for (const KvHorizontalBox::Point &point : boxes(chart).first()->points())
        QCOMPARE(point.x, 500.0);
    QCOMPARE(boxes(chart).first()->extent().top, 250.0);
    QCOMPARE(boxes(chart).first()->extent().bottom, 750.0);
}

void KvHorizontalBoxChartTest::emptyRebuildKeepsTheAxes()
{
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    chart.addBox(name("setosa"), 10, 20, 30, 40, 60, Qt::red);
    const double maximum = valueAxis(chart)->maximum();
    chart.clearBoxes();
    chart.refresh();
    QVERIFY(chart.parts().isEmpty());
    QCOMPARE(categoryAxis(chart)->categories(), QStringList{name("setosa")});
    QCOMPARE(valueAxis(chart)->maximum(), maximum);
}

void KvHorizontalBoxChartTest::clears()
{
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    chart.addBox(name("setosa"), 10, 20, 30, 40, 60, Qt::red);
    const int items = chart.items().size();
    chart.clearBoxes();
    QCOMPARE(chart.boxCount(), 0);
    QVERIFY(chart.parts().isEmpty());
    QCOMPARE(chart.items().size(), items); // until the next redraw
}

void KvHorizontalBoxChartTest::rebuildsOncePerUpdate()
{
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    QSignalSpy spy(chart.axisY(), SIGNAL(changed()));
    chart.beginUpdate();
    for (int i = 0; i < 10; ++i)
        chart.addBox(QString::number(i), 0, 1, 2, 3, 4 + i, Qt::red);
    QVERIFY(chart.parts().isEmpty());
    chart.endUpdate();
    QCOMPARE(chart.parts().size(), 10);
    QCOMPARE(spy.count(), 1);
}

void KvHorizontalBoxChartTest::entriesWithoutNumbers()
{
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    chart.addBox(name("none"), qQNaN(), 1, 2, 3, qInf(), Qt::red);
    QVERIFY(chart.parts().isEmpty());
    QCOMPARE(valueAxis(chart)->maximum(), 10.0);
    chart.addBox(name("some"), 0, 25, 50, 75, 100, Qt::green);
    QCOMPARE(chart.parts().size(), 1);
    QCOMPARE(boxes(chart).first()->extent().top, 625.0); // the second place all the same
    QCOMPARE(valueAxis(chart)->maximum(), 100.0);
    QVERIFY(qIsFinite(chart.sceneRect().width()) && qIsFinite(chart.sceneRect().height()));
}

STATREPORT_TEST_MAIN(KvHorizontalBoxChartTest)
#include "KvHorizontalBoxChartTest.moc"
