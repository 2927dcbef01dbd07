// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "SceneItems.h"
#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYValues.h"
#include "charts/KvChart.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLegend.h"
#include "support/MetaMethods.h"
#include <QGraphicsTextItem>

using namespace kvCharts;

class KvChartTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void slotsInOrder();
    void emptyChart();
    void drawsInOrder();
    void sceneRectIsWidened();
    void partsRedraw();
    void aReplacedAxisIsKept();
    void removesParts();
    void deletesWhatItOwns();
    void updateLock();
    void surplusEndUpdate();
    void noRedrawWhileRebuilding();
    void themeSetsOnlyTheBackground();
    void legendTitle();
    void valueToScene();
};

namespace {

/// Draws a rectangle and writes into a log that it did.
class LoggingPart : public KvBaseChartPart
{
public:
    LoggingPart(const QString &name, QStringList *log)
        : m_name(name)
        , m_log(log)
    {}
    ~LoggingPart() override { m_log->append(QStringLiteral("~") + m_name); }

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override
    {
        m_log->append(m_name);
        scene->addRect(QRectF(100, 200, 300, 400), QPen(Qt::NoPen), themes->colors().at(1));
    }

private:
    QString m_name;
    QStringList *m_log;
};

class CountingChart : public KvChart
{
public:
    using KvChart::KvChart;

    int rebuilds = 0;
    KvBaseChartPart *touched = nullptr;

protected:
    void rebuild() override
    {
        ++rebuilds;
        if (touched)
            emit touched->changed();
    }
};

QString name(const char *latin)
{
    return QString::fromLatin1(latin);
}

} // namespace

void KvChartTest::slotsInOrder()
{
    QCOMPARE(ownMethods(KvChart::staticMetaObject, QMetaMethod::Slot),
             QStringList({name("partChanged()"), name("slotThemeChanged()")}));
    QVERIFY(ownMethods(KvChart::staticMetaObject, QMetaMethod::Signal).isEmpty());
}

void KvChartTest::emptyChart()
{
    const KvChartThemes themes;
    KvChart chart(&themes);
    QCOMPARE(chart.backgroundBrush().style(), Qt::SolidPattern);
    QCOMPARE(chart.backgroundBrush().color(), QColor(0x26, 0x26, 0x26));
    QVERIFY(chart.axisX() == nullptr);
    QVERIFY(chart.axisY() == nullptr);
    QVERIFY(chart.legend() != nullptr);
    chart.partChanged();
    QVERIFY(chart.items().isEmpty());
    QCOMPARE(chart.sceneRect(), QRectF(-50, -50, 100, 100));
    chart.addRect(0, 0, 500, 500);
    chart.refresh(); // does not keep a rectangle from before
    QCOMPARE(chart.sceneRect(), QRectF(-50, -50, 100, 100));
}

void KvChartTest::drawsInOrder()
{
    const KvChartThemes themes;
    QStringList log;
    {
        KvChart chart(&themes);
        chart.addPart(new LoggingPart(name("a"), &log));
        chart.addPart(new LoggingPart(name("b"), &log));
        chart.setAxisY(new LoggingPart(name("y"), &log));
        chart.setAxisX(new LoggingPart(name("x"), &log));
        log.clear();
        chart.setLegendTitle(name("title")); // drawn after the axes
        QCOMPARE(log, QStringList({name("x"), name("y"), name("a"), name("b")}));
        const QList<QGraphicsItem *> items = chart.items(Qt::AscendingOrder);
        QCOMPARE(items.size(), 5);
        QVERIFY(dynamic_cast<QGraphicsTextItem *>(items.at(2)));
        QCOMPARE(chart.parts().size(), 2);
    }
}

void KvChartTest::sceneRectIsWidened()
{
    const KvChartThemes themes;
    QStringList log;
    KvChart chart(&themes);
    QSignalSpy spy(&chart, SIGNAL(sceneRectChanged(QRectF)));
    chart.addPart(new LoggingPart(name("a"), &log));
    QCOMPARE(chart.sceneRect(), QRectF(50, 150, 400, 500));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.first().first().toRectF(), QRectF(50, 150, 400, 500));
}

void KvChartTest::partsRedraw()
{
    const KvChartThemes themes;
    QStringList log;
    KvChart chart(&themes);
    auto *part = new LoggingPart(name("a"), &log);
    chart.addPart(part);
    QCOMPARE(log.size(), 1);
    emit part->changed();
    QCOMPARE(log.size(), 2);
    QCOMPARE(chart.items().size(), 1); // the items of the drawing before are gone
    chart.legend()->addItem(name("entry"), Qt::red);
    QCOMPARE(log.size(), 3);
    chart.setAxisX(nullptr);
    QCOMPARE(log.size(), 4);
    auto *axis = new KvAxisXValues;
    chart.setAxisX(axis);
    QCOMPARE(log.size(), 5);
    axis->setRange(0.0, 3.0);
    QCOMPARE(log.size(), 6);
    chart.setAxisX(axis); // connected once
    axis->setRange(0.0, 4.0);
    QCOMPARE(log.size(), 8);
    auto *axisY = new KvAxisYValues;
    chart.setAxisY(axisY);
    QCOMPARE(chart.axisY(), axisY);
    QCOMPARE(log.size(), 9);
    axisY->setTickCount(3);
    QCOMPARE(log.size(), 10);
    chart.setAxisY(nullptr);
    QCOMPARE(log.size(), 11);
    axisY->setTickCount(4); // let go of only with the chart
    QCOMPARE(log.size(), 12);
}

void KvChartTest::aReplacedAxisIsKept()
{
    const KvChartThemes themes;
    QStringList log;
    {
        KvChart chart(&themes);
        auto *first = new LoggingPart(name("first"), &log);
        auto *second = new LoggingPart(name("second"), &log);
        chart.setAxisX(first);
        chart.setAxisX(second);
        QCOMPARE(chart.axisX(), second);
        log.clear();
        emit first->changed(); // still redraws, without being drawn
        QCOMPARE(log, QStringList{name("second")});
        log.clear();
    }
    log.sort();
    QCOMPARE(log, QStringList({name("~first"), name("~second")}));
}

void KvChartTest::removesParts()
{
    const KvChartThemes themes;
    QStringList log;
    KvChart chart(&themes);
    chart.addPart(new LoggingPart(name("a"), &log));
    chart.addPart(new LoggingPart(name("b"), &log));
    log.clear();
    chart.removeAllParts();
    QCOMPARE(log, QStringList({name("~a"), name("~b")}));
    QVERIFY(chart.parts().isEmpty());
    QCOMPARE(chart.items().size(), 2); // until the next redraw
    chart.partChanged();
    QVERIFY(chart.items().isEmpty());
}

void KvChartTest::deletesWhatItOwns()
{
    const KvChartThemes themes;
    QStringList log;
    QPointer<KvLegend> legend;
    {
        KvChart chart(&themes);
        legend = chart.legend();
        chart.setAxisX(new LoggingPart(name("x"), &log));
        chart.setAxisY(new LoggingPart(name("y"), &log));
        chart.addPart(new LoggingPart(name("a"), &log));
        log.clear();
    }
    QVERIFY(legend.isNull());
    QCOMPARE(log, QStringList({name("~x"), name("~y"), name("~a")}));
}

void KvChartTest::updateLock()
{
    const KvChartThemes themes;
    CountingChart chart(&themes);
    chart.refresh();
    QCOMPARE(chart.rebuilds, 1);
    chart.beginUpdate();
    chart.beginUpdate();
    chart.refresh();
    QCOMPARE(chart.rebuilds, 1);
    chart.endUpdate();
    QCOMPARE(chart.rebuilds, 1);
    chart.refresh();
    QCOMPARE(chart.rebuilds, 1);
    chart.endUpdate();
    QCOMPARE(chart.rebuilds, 2);
}

void KvChartTest::surplusEndUpdate()
{
    const KvChartThemes themes;
    CountingChart chart(&themes);
    chart.endUpdate(); // one too many
    chart.refresh();
    QCOMPARE(chart.rebuilds, 0);
    chart.beginUpdate(); // back at 0, but that is no end of an update
    QCOMPARE(chart.rebuilds, 0);
    chart.refresh();
    QCOMPARE(chart.rebuilds, 1);
    chart.beginUpdate();
    chart.endUpdate();
    QCOMPARE(chart.rebuilds, 2);
}

void KvChartTest::noRedrawWhileRebuilding()
{
    const KvChartThemes themes;
    QStringList log;
    CountingChart chart(&themes);
    auto *part = new LoggingPart(name("a"), &log);
    chart.addPart(part);
    log.clear();
    chart.touched = part;
    chart.refresh();
    QCOMPARE(log, QStringList{name("a")}); // once, after the rebuild
}

void KvChartTest::themeSetsOnlyTheBackground()
{
    KvChartThemes themes;
    QStringList log;
    KvChart chart(&themes);
    chart.addPart(new LoggingPart(name("a"), &log));
    log.clear();
    themes.setTheme(KvChartThemes::Light);
    QCOMPARE(chart.backgroundBrush().color(), QColor(Qt::white));
    QVERIFY(log.isEmpty());
    const auto fill = [&chart] { return itemsOf<QGraphicsRectItem>(&chart).first()->brush().color().name(); };
    QCOMPARE(fill(), name("#ffffff"));
    chart.partChanged();
    QCOMPARE(fill(), name("#313131"));
}

void KvChartTest::legendTitle()
{
    const KvChartThemes themes;
    KvChart chart(&themes);
    chart.setLegendTitle(name("Title"));
    QCOMPARE(chart.legend()->title(), name("Title"));
    QCOMPARE(itemsOf<QGraphicsTextItem>(&chart).size(), 1);
}

void KvChartTest::valueToScene()
{
    QCOMPARE(KvChart::valueToScene(2.5, 2.0, 4.0), 250.0);
}

STATREPORT_TEST_MAIN(KvChartTest)
#include "KvChartTest.moc"
