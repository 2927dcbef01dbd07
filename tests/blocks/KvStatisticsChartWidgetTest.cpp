// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartBlocks.h"
#include "ChartMeasurements.h"
#include "ConfigArgument.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "TableProbe.h"
#include "charts/KvChartThemes.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>

using kvCharts::KvChartThemes;

namespace {

constexpr int kUsableWidth = 724; // 952 - 2 x 114

const QColor kDark(QStringLiteral("#262626"));
const QColor kLight(QStringLiteral("#FFFFFF"));

QVector<ChartObject> someObjects()
{
    return {ChartMeasurements::line("l1", 1.0), ChartMeasurements::line("l2", 2.0),
            ChartMeasurements::counter("n1", 3), ChartMeasurements::counter("n2", 5)};
}

/** Another chart: more to say in the legend and at the axes, so other proportions. */
QVector<ChartObject> manyObjects()
{
    QVector<ChartObject> objects;
    for (int i = 0; i < 12; ++i) {
        objects.append(ChartMeasurements::counter(QStringLiteral("a counter with a long name %1").arg(i), i));
        objects.append({ChartMeasurements::Line,
                        QStringLiteral("Line"),
                        QStringLiteral("l%1").arg(i),
                        {{QStringLiteral("a value with a long name %1").arg(i), 1.0 + i, 1}}});
    }
    return objects;
}

/** Counts what a chart tells layout and window. */
struct ChartSpies
{
    ChartSpies(const KvBaseDisplayWidget &chart, const KvTemplateContext *context)
        : changed(chart.displaySignals(), SIGNAL(signalWidgetChanged()))
                  , pieces(chart.displaySignals(), SIGNAL(signalSubWidgetsChanged()))
                           , config(chart.displaySignals(),
                                    SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg *)))
                                    , modified(context, SIGNAL(signalTemplateModified()))
    {}

    QSignalSpy changed;
    QSignalSpy pieces;
    QSignalSpy config;
    QSignalSpy modified;
};

} // namespace

/** What all charts do alike on a page, in a window and at a panel. */
class KvStatisticsChartWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSlotsInOrder_data();
    void declaresSlotsInOrder();
    void standsAsWideAsThePageSays_data();
    void standsAsWideAsThePageSays();
    void everyWidthIsDrawnAndKept_data() { ChartBlocks::addBlockRows(); }
    void everyWidthIsDrawnAndKept();
    void oddWidthsAreDrawnWithinBounds_data();
    void oddWidthsAreDrawnWithinBounds();
    void narrowPagesAreSurvived_data() { ChartBlocks::addBlockRows(); }
    void narrowPagesAreSurvived();
    void dataChangesTheProportions_data() { ChartBlocks::addBlockRows(); }
    void dataChangesTheProportions();
    void followsThePageWidth_data() { ChartBlocks::addBlockRows(); }
    void followsThePageWidth();
    void alignsTheChart_data();
    void alignsTheChart();
    void updatesOncePerReport_data() { ChartBlocks::addBlockRows(); }
    void updatesOncePerReport();
    void optionSlotsAnnounceRealChanges_data() { ChartBlocks::addBlockRows(); }
    void optionSlotsAnnounceRealChanges();
    void theSameOptionIsNotAnnounced_data() { ChartBlocks::addBlockRows(); }
    void theSameOptionIsNotAnnounced();
    void thePanelDrivesTheChart_data() { ChartBlocks::addBlockRows(); }
    void thePanelDrivesTheChart();
    void theThemeIsAnnouncedOnce_data() { ChartBlocks::addBlockRows(); }
    void theThemeIsAnnouncedOnce();
    void theGroupingIsAnnouncedOnce_data();
    void theGroupingIsAnnouncedOnce();
    void panelsWithoutPlacement_data() { ChartBlocks::addBlockRows(); }
    void panelsWithoutPlacement();
    void panelsOutliveTheirChart_data() { ChartBlocks::addBlockRows(); }
    void panelsOutliveTheirChart();
    void aThemeChangeRecoloursAll_data() { ChartBlocks::addBlockRows(); }
    void aThemeChangeRecoloursAll();
    void blockStyleDoesNotReachTheChart_data();
    void blockStyleDoesNotReachTheChart();
    void mouseAndKeysBelongToThePage_data() { ChartBlocks::addBlockRows(); }
    void mouseAndKeysBelongToThePage();
    void fillsAWindowWithoutAPage_data() { ChartBlocks::addBlockRows(); }
    void fillsAWindowWithoutAPage();
    void withoutDataSourceNothingIsShown_data() { ChartBlocks::addBlockRows(); }
    void withoutDataSourceNothingIsShown();

private:
    void make(const QString &block)
    {
        m_widget.reset();
        m_cfg = ChartBlocks::makeConfig(block, m_context.get());
        m_widget = ChartBlocks::makeWidget(block, m_cfg.get());
        QVERIFY(m_widget);
    }
    kvCharts::KvChartView *view() const { return m_widget->chartView(); }
    template <typename... Arguments>
    bool call(const char *slot, Arguments... arguments)
    {
        return QMetaObject::invokeMethod(m_widget.get(), slot, Qt::DirectConnection, arguments...);
    }
    bool setWidth(int percent) { return call("slotWidthChanged", Q_ARG(int, percent)); }
    bool setAlignment(Qt::Alignment alignment)
    {
        return call("slotAlignmentChanged", Q_ARG(Qt::Alignment, alignment));
    }
    bool setTheme(KvChartThemes::ThemeType theme)
    {
        return call("slotThemeChanged", Q_ARG(kvCharts::KvChartThemes::ThemeType, theme));
    }
    /** The height that the chart's proportions give it at a width. */
    int heightAt(int width) const
    {
        const QRectF rect = view()->chartRect();
        return static_cast<int>(rect.height() * width / rect.width());
    }

    std::unique_ptr<ChartMeasurements> m_host;
    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvStatisticsChartNodeCfg> m_cfg;
    std::unique_ptr<KvStatisticsChartWidget> m_widget;
};

void KvStatisticsChartWidgetTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<ChartMeasurements>();
    m_host->setObjects(someObjects());
    m_context = std::make_unique<KvTemplateContext>(m_host->kernelData());
}

void KvStatisticsChartWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_context.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsChartWidgetTest::declaresSlotsInOrder_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<QStringList>("slotList");
    for (const QString &block : ChartBlocks::names()) {
        QStringList slotList{"slotWidthChanged(int)", "slotAlignmentChanged(Qt::Alignment)",
                             "slotThemeChanged(kvCharts::KvChartThemes::ThemeType)", "updateValues()"};
        if (ChartBlocks::isGrouped(block))
            slotList.insert(2,
                            QStringLiteral("slotGroupByChanged(KvStatistics%1NodeCfg::GroupBy)").arg(block));
        QTest::newRow(qPrintable(block)) << block << slotList;
    }
}

void KvStatisticsChartWidgetTest::declaresSlotsInOrder()
{
    QFETCH(QString, block);
    make(block);
    QTEST(ownMethods(*m_widget->metaObject(), QMetaMethod::Slot), "slotList");
    QVERIFY(ownMethods(*m_widget->metaObject(), QMetaMethod::Signal).isEmpty());
}

void KvStatisticsChartWidgetTest::standsAsWideAsThePageSays_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("usable");
    QTest::addColumn<int>("width");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s, default", qPrintable(block)) << block << 952 << 75 << 724 << 543;
        QTest::addRow("%s, all", qPrintable(block)) << block << 952 << 100 << 724 << 724;
        QTest::addRow("%s, half", qPrintable(block)) << block << 1000 << 50 << 760 << 380;
        // Single precision: 600 x 0.12 is 72, in double precision it would be 71.
        QTest::addRow("%s, small page", qPrintable(block)) << block << 600 << 100 << 456 << 456;
        QTest::addRow("%s, narrow", qPrintable(block)) << block << 1000 << 1 << 760 << 7;
    }
}

void KvStatisticsChartWidgetTest::standsAsWideAsThePageSays()
{
    QFETCH(QString, block);
    QFETCH(int, pageWidth);
    QFETCH(int, percent);
    QFETCH(int, usable);
    QFETCH(int, width);
    m_context->setPageWidth(pageWidth);
    make(block);
    QVERIFY(setWidth(percent));
    QCOMPARE(view()->minimumWidth(), width);
    QCOMPARE(view()->maximumWidth(), width);
    QCOMPARE(view()->minimumHeight(), heightAt(width));
    QCOMPARE(view()->maximumHeight(), heightAt(width));
    QCOMPARE(m_widget->sizeHint(), QSize(usable, qMax(20, heightAt(width))));
}

void KvStatisticsChartWidgetTest::everyWidthIsDrawnAndKept()
{
    QFETCH(QString, block);
    make(block);
    ChartSpies spies(*m_widget, m_context.get());
    for (int percent = 1; percent <= 100; ++percent) {
        if (percent == 75)
            continue;
        spies.config.clear();
        QVERIFY(setWidth(percent));
        QCOMPARE(m_cfg->widthPercent(), percent);
        QCOMPARE(spies.config.count(), 1);
        // To the pixel where a hundredth is no whole number of pixels.
        QVERIFY(qAbs(view()->minimumWidth() - kUsableWidth * percent / 100) <= 1);
    }
}

void KvStatisticsChartWidgetTest::oddWidthsAreDrawnWithinBounds_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("width");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s, too wide", qPrintable(block)) << block << 300 << 724;
        QTest::addRow("%s, none", qPrintable(block)) << block << 0 << 7;
        QTest::addRow("%s, negative", qPrintable(block)) << block << -5 << 7;
    }
}

void KvStatisticsChartWidgetTest::oddWidthsAreDrawnWithinBounds()
{
    QFETCH(QString, block);
    QFETCH(int, percent);
    QFETCH(int, width);
    make(block);
    m_cfg->setWidthPercent(percent);
    m_widget = ChartBlocks::makeWidget(block, m_cfg.get());
    QCOMPARE(view()->minimumWidth(), width);
    QCOMPARE(m_widget->sizeHint().width(), kUsableWidth);
    QCOMPARE(m_cfg->widthPercent(), percent); // what the file said stays there
}

void KvStatisticsChartWidgetTest::narrowPagesAreSurvived()
{
    QFETCH(QString, block);
    make(block);
    for (const int pageWidth : {0, -100, 1, 7, 40}) {
        m_context->setPageWidth(pageWidth);
        QCOMPARE(m_widget->subWidgetAt(0), m_widget.get());
        QVERIFY(m_widget->sizeHint().height() >= 20);
        QVERIFY(m_widget->sizeHint().width() >= 0);
        m_host->setObjects(someObjects());
        m_widget->grab();
    }
}

void KvStatisticsChartWidgetTest::dataChangesTheProportions()
{
    QFETCH(QString, block);
    make(block);
    // As on a page: a frame that takes the hint.
    m_widget->resize(m_widget->sizeHint());
    const QRectF before = view()->chartRect();
    m_host->setObjects(manyObjects());
    QVERIFY(view()->chartRect() != before);
    QCOMPARE(view()->minimumWidth(), 543);
    QCOMPARE(view()->maximumHeight(), heightAt(543));
    QCOMPARE(m_widget->sizeHint(), QSize(kUsableWidth, heightAt(543)));
    m_widget->resize(m_widget->sizeHint());
    m_widget->grab();
    QCOMPARE(m_widget->height(), m_widget->sizeHint().height());
    QCOMPARE(view()->size(), QSize(543, heightAt(543)));
}

void KvStatisticsChartWidgetTest::followsThePageWidth()
{
    QFETCH(QString, block);
    make(block);
    QCOMPARE(view()->minimumWidth(), 543);
    m_context->setPageWidth(600);
    QCOMPARE(m_widget->subWidgetAt(0), m_widget.get()); // as every rebuild of the pages asks
    QCOMPARE(view()->minimumWidth(), 342);
    QCOMPARE(m_widget->sizeHint(), QSize(456, heightAt(342)));
    // The first, wider chart must not hold the widget open.
    m_widget->resize(m_widget->sizeHint());
    QCOMPARE(m_widget->width(), 456);
}

void KvStatisticsChartWidgetTest::alignsTheChart_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("x");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s, left", qPrintable(block)) << block << 1 << 0;
        QTest::addRow("%s, centre", qPrintable(block)) << block << 132 << 90; // (724 - 543) / 2
        QTest::addRow("%s, right", qPrintable(block)) << block << 2 << 181;
    }
}

void KvStatisticsChartWidgetTest::alignsTheChart()
{
    QFETCH(QString, block);
    QFETCH(int, alignment);
    QFETCH(int, x);
    make(block);
    m_widget->resize(m_widget->sizeHint());
    QVERIFY(setAlignment(alignment == 1 ? Qt::AlignRight : Qt::AlignLeft));
    QVERIFY(setAlignment(Qt::Alignment(alignment)));
    QCOMPARE(int(m_cfg->alignment()), alignment);
    // At once, without an event loop.
    QCOMPARE(view()->geometry(), QRect(x, 0, 543, heightAt(543)));

    // A widget made of such a configuration stands there from the start.
    const auto second = ChartBlocks::makeWidget(block, m_cfg.get());
    second->resize(second->sizeHint());
    second->grab();
    QCOMPARE(second->chartView()->x(), x);
}

void KvStatisticsChartWidgetTest::updatesOncePerReport()
{
    QFETCH(QString, block);
    make(block);
    const ChartSpies spies(*m_widget, m_context.get());
    const QSignalSpy scene(view()->chart(), SIGNAL(sceneRectChanged(QRectF)));
    m_host->setObjects(manyObjects());
    QCOMPARE(spies.changed.count(), 1);
    QCOMPARE(scene.count(), 1); // one rebuild, whatever there is to show
    // New measurements are no change of the template.
    QCOMPARE(spies.modified.count(), 0);
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.pieces.count(), 0);
}

void KvStatisticsChartWidgetTest::optionSlotsAnnounceRealChanges()
{
    QFETCH(QString, block);
    make(block);
    const ChartSpies spies(*m_widget, m_context.get());
    QVERIFY(setWidth(50));
    QCOMPARE(m_cfg->widthPercent(), 50);
    QVERIFY(setAlignment(Qt::AlignRight));
    QCOMPARE(int(m_cfg->alignment()), 2);
    QVERIFY(setTheme(KvChartThemes::Light));
    QCOMPARE(m_cfg->themeIndex(), 1);
    QCOMPARE(spies.config.count(), 3);
    QCOMPARE(spies.modified.count(), 3);
    QCOMPARE(spies.changed.count(), 3);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(configArgument(spies.config, i), m_cfg.get());
}

void KvStatisticsChartWidgetTest::theSameOptionIsNotAnnounced()
{
    QFETCH(QString, block);
    make(block);
    const ChartSpies spies(*m_widget, m_context.get());
    QVERIFY(setWidth(75));
    QVERIFY(setTheme(KvChartThemes::Dark));
    QCOMPARE(spies.changed.count(), 0);
    // The same alignment lays the page out again, but is no change of the template.
    QVERIFY(setAlignment(Qt::AlignHCenter | Qt::AlignVCenter));
    QCOMPARE(spies.changed.count(), 1);
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 0);
}

void KvStatisticsChartWidgetTest::thePanelDrivesTheChart()
{
    QFETCH(QString, block);
    make(block);
    QWidget parent;
    QWidget *panel = m_widget->createOptionsWidget(&parent, true);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(PanelProbe::show(&parent));
    const ChartSpies spies(*m_widget, m_context.get());
    QTest::keyClick(panel->findChild<QSpinBox *>(), Qt::Key_Down);
    QCOMPARE(m_cfg->widthPercent(), 74);
    QCOMPARE(view()->minimumWidth(), 535); // 724 x 0.74
    QPushButton *left = PanelProbe::controls<QPushButton>(panel).first();
    PanelProbe::click(left);
    QCOMPARE(int(m_cfg->alignment()), 1);
    QCOMPARE(spies.changed.count(), 2);
    PanelProbe::click(left);
    QCOMPARE(spies.config.count(), 2);
    QCOMPARE(spies.modified.count(), 2);
    QCOMPARE(spies.changed.count(), 3);
}

void KvStatisticsChartWidgetTest::theThemeIsAnnouncedOnce()
{
    QFETCH(QString, block);
    make(block);
    const std::unique_ptr<QWidget> panel(m_widget->createOptionsWidget(nullptr, true));
    QVERIFY(PanelProbe::show(panel.get()));
    const ChartSpies spies(*m_widget, m_context.get());
    PanelProbe::click(PanelProbe::button<QRadioButton>(panel.get(), QStringLiteral("Light")));
    QCOMPARE(m_cfg->themeIndex(), 1);
    QCOMPARE(spies.config.count(), 1);
    QCOMPARE(spies.modified.count(), 1);
    QCOMPARE(spies.changed.count(), 1);
}

void KvStatisticsChartWidgetTest::theGroupingIsAnnouncedOnce_data()
{
    QTest::addColumn<QString>("block");
    QTest::newRow("box") << "MinMedMaxBox";
    QTest::newRow("trend") << "Trend";
}

void KvStatisticsChartWidgetTest::theGroupingIsAnnouncedOnce()
{
    QFETCH(QString, block);
    make(block);
    const std::unique_ptr<QWidget> panel(m_widget->createOptionsWidget(nullptr, true));
    QVERIFY(PanelProbe::show(panel.get()));
    const ChartSpies spies(*m_widget, m_context.get());
    QRadioButton *measurement = PanelProbe::button<QRadioButton>(panel.get(), QStringLiteral("Measurement"));
    PanelProbe::click(measurement);
    QCOMPARE(int(ChartBlocks::grouped(m_cfg.get())->groupBy()), 0);
    QCOMPARE(spies.config.count(), 1);
    QCOMPARE(configArgument(spies.config, 0), m_cfg.get());
    QCOMPARE(spies.modified.count(), 1);
    QCOMPARE(spies.changed.count(), 1);
    PanelProbe::click(measurement);
    QCOMPARE(spies.config.count(), 1);
}

void KvStatisticsChartWidgetTest::panelsWithoutPlacement()
{
    QFETCH(QString, block);
    make(block);
    const std::unique_ptr<QWidget> panel(m_widget->createOptionsWidget(nullptr, false));
    QVERIFY(panel);
    QVERIFY(!panel->findChild<QSpinBox *>());
    QVERIFY(panel->findChildren<QPushButton *>().isEmpty());
    QCOMPARE(panel->findChildren<QRadioButton *>().size(), ChartBlocks::isGrouped(block) ? 4 : 2);
}

void KvStatisticsChartWidgetTest::panelsOutliveTheirChart()
{
    QFETCH(QString, block);
    make(block);
    const std::unique_ptr<QWidget> panel(m_widget->createOptionsWidget(nullptr, true));
    QVERIFY(PanelProbe::show(panel.get()));
    m_widget.reset();
    PanelProbe::click(PanelProbe::button<QRadioButton>(panel.get(), QStringLiteral("Light")));
    QTest::keyClick(panel->findChild<QSpinBox *>(), Qt::Key_Down);
    QCOMPARE(m_cfg->widthPercent(), 75); // nobody listens any more
}

void KvStatisticsChartWidgetTest::aThemeChangeRecoloursAll()
{
    QFETCH(QString, block);
    make(block);
    const auto picture = [](KvStatisticsChartWidget *widget) {
        widget->resize(widget->sizeHint());
        return widget->grab().toImage();
    };
    const QImage dark = picture(m_widget.get());
    QCOMPARE(view()->scene()->backgroundBrush(), QBrush(kDark));
    QVERIFY(setTheme(KvChartThemes::Light));
    QCOMPARE(view()->scene()->backgroundBrush(), QBrush(kLight));
    // Down to the last text: as a chart that has never been dark.
    const auto fresh = ChartBlocks::makeWidget(block, m_cfg.get());
    QCOMPARE(picture(m_widget.get()), picture(fresh.get()));
    // A theme set past the slot, as a file does it.
    m_cfg->setTheme(0);
    QCOMPARE(picture(m_widget.get()), dark);
}

void KvStatisticsChartWidgetTest::blockStyleDoesNotReachTheChart_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<int>("theme");
    QTest::addColumn<QColor>("background");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s, Dark", qPrintable(block)) << block << 0 << kDark;
        QTest::addRow("%s, Light", qPrintable(block)) << block << 1 << kLight;
    }
}

void KvStatisticsChartWidgetTest::blockStyleDoesNotReachTheChart()
{
    QFETCH(QString, block);
    QFETCH(int, theme);
    QFETCH(QColor, background);
    make(block);
    m_cfg->setTheme(theme);
    const QImage image = TableProbe::pagePicture(m_widget.get(), true);
    QCOMPARE(image.pixelColor(4, 4), QColor(Qt::white));
    QCOMPARE(image.pixelColor(8 + 40, 8 + 40), QColor(Qt::white)); // beside the chart
    QCOMPARE(image.pixelColor(8 + 90 + 2, 8 + 2), background);
    QCOMPARE(image.pixelColor(8 + 90 + 540, 8 + heightAt(543) - 3), background);
    // Something is drawn, in the middle of it.
    const QRect middle(8 + 90 + 40, 8 + 40, 463, heightAt(543) - 80);
    QSet<QRgb> colors;
    for (int y = middle.top(); y < middle.bottom(); y += 3) {
        for (int x = middle.left(); x < middle.right(); x += 3)
            colors.insert(image.pixel(x, y));
    }
    QVERIFY(colors.size() > 3);
}

void KvStatisticsChartWidgetTest::mouseAndKeysBelongToThePage()
{
    QFETCH(QString, block);
    make(block);
    m_widget->resize(m_widget->sizeHint());
    m_widget->grab();
    QVERIFY(!m_widget->childAt(m_widget->rect().center()));
    QCOMPARE(m_widget->focusPolicy(), Qt::NoFocus);
    QCOMPARE(view()->focusPolicy(), Qt::NoFocus);
    QWheelEvent wheel(QPointF(300, 100), QPointF(300, 100), QPoint(), QPoint(0, -120), Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    wheel.accept();
    QCoreApplication::sendEvent(m_widget.get(), &wheel);
    QVERIFY(!wheel.isAccepted());
}

void KvStatisticsChartWidgetTest::fillsAWindowWithoutAPage()
{
    QFETCH(QString, block);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QWidget window;
    QVBoxLayout layout(&window);
    layout.setContentsMargins(0, 0, 0, 0);
    const auto widget = ChartBlocks::makeWidget(block, cfg.get());
    layout.addWidget(widget->subWidgetAt(0));
    for (const QSize &size : {QSize(640, 480), QSize(300, 700)}) {
        window.resize(size);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QTRY_COMPARE(widget->size(), size);
        QCOMPARE(widget->chartView()->geometry(), QRect(QPoint(0, 0), size));
        // All of the chart is to be seen.
        const QRectF shown = widget->chartView()->mapToScene(QRect(QPoint(0, 0), size)).boundingRect();
        QVERIFY(shown.contains(widget->chartView()->chartRect().adjusted(1, 1, -1, -1)));
    }
    m_host->setObjects(manyObjects());
    QCOMPARE(widget->chartView()->geometry(), QRect(0, 0, 300, 700));
    const QRectF shown = widget->chartView()->mapToScene(QRect(0, 0, 300, 700)).boundingRect();
    QVERIFY(shown.contains(widget->chartView()->chartRect().adjusted(1, 1, -1, -1)));

    // The theme is chosen there, too; there is no template to mark.
    const QSignalSpy config(widget->displaySignals(),
                            SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg *)));
    QVERIFY(QMetaObject::invokeMethod(widget.get(), "slotThemeChanged",
                                      Q_ARG(kvCharts::KvChartThemes::ThemeType, KvChartThemes::Light)));
    QCOMPARE(config.count(), 1);
    QCOMPARE(widget->grab().toImage().pixelColor(150, 2), kLight);
}

void KvStatisticsChartWidgetTest::withoutDataSourceNothingIsShown()
{
    QFETCH(QString, block);
    m_host->setObjects({});
    KvStatisticsEngine::instance().setKernelData(nullptr);
    make(block);
    QVERIFY(view()->chart()->parts().isEmpty());
    m_widget->resize(m_widget->sizeHint());
    m_widget->grab();
}

STATREPORT_TEST_MAIN(KvStatisticsChartWidgetTest)
#include "KvStatisticsChartWidgetTest.moc"
