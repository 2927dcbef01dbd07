// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "SceneItems.h"
#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYCategories.h"
#include "charts/KvChartThemes.h"
#include "charts/KvHorizontalBox.h"
#include "charts/KvHorizontalBoxChart.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"

#include <QGraphicsRectItem>

using namespace kvCharts;

class KvHorizontalBoxChartTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void axes();
    void twoEntries();
    void oneValue();
    void boxesTakeTheMiddleOfTheirBands_data();
    void boxesTakeTheMiddleOfTheirBands();
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

QStringList texts(const KvTextRunItem *run)
{
    QStringList result;
    for (const KvPlacedText &placed : run->texts())
        result.append(placed.text);
    return result;
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

    // All that is drawn: the ticks of the value axis, the name, the labels side by side with leader lines.
    const auto runs = itemsOf<KvTextRunItem>(&chart);
    QCOMPARE(runs.size(), 3);
    QCOMPARE(texts(runs.at(0)),
             QStringList({name("4.5"), name("4.75"), name("5"), name("5.25"), name("5.5")}));
    QCOMPARE(texts(runs.at(1)), QStringList{name("five")});
    const QVector<KvPlacedText> labels = runs.at(2)->texts();
    QCOMPARE(texts(runs.at(2)), QStringList({name("5"), name("5"), name("5"), name("5"), name("5")}));
    const double width = labels.first().extent.size.width();
    const double step = width + 6;
    // The last one goes four steps to the right, so all come back by two.
    for (int i = 0; i < 5; ++i)
        QCOMPARE(labels.at(i).topLeft, QPointF(500 - width / 2 + (i - 2) * step, 761));
    const QVector<QLineF> leaders = itemsOf<KvLineRunItem>(&chart).last()->lines();
    QCOMPARE(leaders.size(), 5);
    for (int i = 0; i < 5; ++i)
        QCOMPARE(leaders.at(i), QLineF(500 + (i - 2) * step, 759, 500, 753));
}

void KvHorizontalBoxChartTest::boxesTakeTheMiddleOfTheirBands_data()
{
    QTest::addColumn<int>("count");
    QTest::newRow("one") << 1;
    QTest::newRow("three") << 3;
    QTest::newRow("twelve") << 12;
}

void KvHorizontalBoxChartTest::boxesTakeTheMiddleOfTheirBands()
{
    QFETCH(int, count);
    const KvChartThemes themes;
    KvHorizontalBoxChart chart(&themes);
    chart.beginUpdate();
    for (int i = 0; i < count; ++i)
        chart.addBox(QString::number(i), 0, 25, 50, 75, 100, Qt::red);
    chart.endUpdate();
    const double band = 1000.0 / count;
    const auto rects = itemsOf<QGraphicsRectItem>(&chart);
    QCOMPARE(rects.size(), count);
    for (int i = 0; i < count; ++i) {
        QVERIFY(qAbs(rects.at(i)->rect().top() - (i + 0.25) * band) < 1e-6);
        QVERIFY(qAbs(rects.at(i)->rect().bottom() - (i + 0.75) * band) < 1e-6);
        QCOMPARE(rects.at(i)->rect().left(), 250.0);
        QCOMPARE(rects.at(i)->rect().right(), 750.0);
    }
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
    // Nothing but the axes is left of the picture.
    QVERIFY(itemsOf<QGraphicsRectItem>(&chart).isEmpty());
    const auto runs = itemsOf<KvTextRunItem>(&chart);
    QCOMPARE(runs.size(), 2);
    QVERIFY(texts(runs.at(0)).contains(name("60")));
    QCOMPARE(texts(runs.at(1)), QStringList{name("setosa")});
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
