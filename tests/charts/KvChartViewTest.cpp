// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvAxisXValues.h"
#include "charts/KvChart.h"
#include "charts/KvChartThemes.h"
#include "charts/KvChartView.h"
#include "support/MetaMethods.h"

using namespace kvCharts;

class KvChartViewTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void construction();
    void slotInOrder();
    void replacesTheChart();
    void deletesItsChart();
    void fixedWidthKeepsTheRatio_data();
    void fixedWidthKeepsTheRatio();
    void fitsTheScene();
};

namespace {

/// Covers an area, so that the scene rectangle is that area widened by 50.
class AreaPart : public KvBaseChartPart
{
public:
    explicit AreaPart(const QRectF &area)
        : m_area(area)
    {}
    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes * /*themes*/) override
    {
        scene->addRect(m_area, QPen(Qt::NoPen));
    }

private:
    QRectF m_area;
};

} // namespace

void KvChartViewTest::construction()
{
    const KvChartThemes themes;
    QWidget parent;
    auto *view = new KvChartView(&themes, &parent);
    QCOMPARE(view->parentWidget(), &parent);
    QVERIFY(view->chart() != nullptr);
    QCOMPARE(view->scene(), view->chart());
    QVERIFY(view->renderHints() & QPainter::Antialiasing);
    QVERIFY(view->renderHints() & QPainter::SmoothPixmapTransform);
    QCOMPARE(view->frameShape(), QFrame::NoFrame);
    QCOMPARE(view->horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(view->verticalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(view->cacheMode(), QGraphicsView::CacheNone);
}

void KvChartViewTest::slotInOrder()
{
    QCOMPARE(ownMethods(KvChartView::staticMetaObject, QMetaMethod::Slot),
             QStringList(QStringLiteral("slotSceneRectChanged(QRectF)")));
}

void KvChartViewTest::replacesTheChart()
{
    const KvChartThemes themes;
    KvChartView view(&themes);
    const QPointer<KvChart> first = view.chart();
    auto *second = new KvChart(&themes);
    view.setChart(second);
    QVERIFY(first.isNull());
    QCOMPARE(view.chart(), second);
    QCOMPARE(view.scene(), second);
    view.setChart(second); // the same one stays
    QCOMPARE(view.chart(), second);
    view.setChart(nullptr);
    QCOMPARE(view.chartRect(), QRectF());
    view.setFixedWidthKeepRatio(50);
    QCOMPARE(view.minimumWidth(), 50);
}

void KvChartViewTest::deletesItsChart()
{
    const KvChartThemes themes;
    QPointer<KvChart> chart;
    {
        const KvChartView view(&themes);
        chart = view.chart();
    }
    QVERIFY(chart.isNull());
}

void KvChartViewTest::fixedWidthKeepsTheRatio_data()
{
    QTest::addColumn<QSizeF>("area");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("height");
    QTest::newRow("truncated") << QSizeF(1000, 1075) << 400 << 427; // 427.27
    QTest::newRow("even") << QSizeF(1000, 1000) << 300 << 300;
    QTest::newRow("nearly one more") << QSizeF(900, 899) << 500 << 499;
}

void KvChartViewTest::fixedWidthKeepsTheRatio()
{
    QFETCH(QSizeF, area);
    QFETCH(int, width);
    QFETCH(int, height);
    const KvChartThemes themes;
    KvChartView view(&themes);
    view.chart()->addPart(new AreaPart(QRectF(QPointF(-20, -30), area)));
    QCOMPARE(view.chartRect(), QRectF(-70, -80, area.width() + 100, area.height() + 100));
    view.setFixedWidthKeepRatio(width);
    QCOMPARE(view.minimumSize(), QSize(width, height));
    QCOMPARE(view.maximumSize(), QSize(width, height));
}

void KvChartViewTest::fitsTheScene()
{
    const KvChartThemes themes;
    KvChartView view(&themes);
    view.resize(300, 500);
    view.show();
    const auto isFitted = [&view] {
        const QRectF shown = view.mapToScene(view.viewport()->rect()).boundingRect();
        const QRectF chart = view.chartRect();
        // The whole chart, centred, with little besides it in the narrower direction.
        return shown.contains(chart) &&
               (shown.center() - chart.center()).manhattanLength() < 0.02 * chart.width() &&
               shown.width() < chart.width() * 1.05;
    };
    view.chart()->addPart(new AreaPart(QRectF(0, 0, 1000, 1000)));
    QVERIFY(isFitted());
    view.chart()->addPart(new AreaPart(QRectF(0, 0, 3000, 2000)));
    QVERIFY(isFitted());
    view.resize(400, 600);
    QVERIFY(isFitted());
    QVERIFY(qFuzzyCompare(view.transform().m11(), view.transform().m22())); // keeps the ratio
    view.setChart(new KvChart(&themes));
    view.chart()->addPart(new AreaPart(QRectF(0, 0, 800, 700)));
    QVERIFY(isFitted());
    auto *drawnBefore = new KvChart(&themes);
    drawnBefore->addPart(new AreaPart(QRectF(0, 0, 5000, 4000)));
    view.setChart(drawnBefore);
    QVERIFY(isFitted());
}

STATREPORT_TEST_MAIN(KvChartViewTest)
#include "KvChartViewTest.moc"
