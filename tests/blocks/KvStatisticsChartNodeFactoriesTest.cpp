// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartBlocks.h"
#include "MarkingTranslator.h"
#include "blocks/KvReportBlocks.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "gui/acss.h"
#include "resources/KvReportResources.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateContext.h"

#include <QLabel>

/** What the palette and files call the charts, and what comes out of their factories. */
class KvStatisticsChartNodeFactoriesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvReportResources::ensure(); }
    void namesTitlesAndIcons_data();
    void namesTitlesAndIcons();
    void titlesAreTranslated_data() { namesTitlesAndIcons_data(); }
    void titlesAreTranslated();
    void makesOwnConfigurations_data() { ChartBlocks::addBlockRows(); }
    void makesOwnConfigurations();
    void makesDisplayWidgets_data() { ChartBlocks::addBlockRows(); }
    void makesDisplayWidgets();
    void refusesOtherConfigurations_data() { ChartBlocks::addBlockRows(); }
    void refusesOtherConfigurations();
    void standAmongTheStatistics();
};

void KvStatisticsChartNodeFactoriesTest::namesTitlesAndIcons_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("iconPath");
    QTest::newRow("box") << "MinMedMaxBox"
                         << "Min / Median / Max Box"
                         << "Icons/ToolIconMinMax.svg";
    QTest::newRow("trend") << "Trend"
                           << "Trend"
                           << "Icons/ToolIconTrend.svg";
    QTest::newRow("pie") << "Counters"
                         << "Counters"
                         << "Icons/ToolIconPie.svg";
}

void KvStatisticsChartNodeFactoriesTest::namesTitlesAndIcons()
{
    QFETCH(QString, name);
    QFETCH(QString, title);
    QFETCH(QString, iconPath);
    const auto factory = ChartBlocks::factory(name);
    QCOMPARE(factory->name(), name);
    QCOMPARE(factory->title(), title);
    const QSize size(24, 24);
    const QImage icon = factory->icon().pixmap(size).toImage();
    QVERIFY(!icon.isNull());
    QCOMPARE(icon, acss::createIcon(6, iconPath, size).pixmap(size).toImage());
    QVERIFY(icon !=
            acss::createIcon(6, QStringLiteral("Icons/ToolIconText.svg"), size).pixmap(size).toImage());
}

void KvStatisticsChartNodeFactoriesTest::titlesAreTranslated()
{
    QFETCH(QString, name);
    QFETCH(QString, title);
    MarkingTranslator translator(QStringLiteral("KvBaseEditorNodeFactory"));
    QCoreApplication::installTranslator(&translator);
    const auto factory = ChartBlocks::factory(name);
    const auto cfg = ChartBlocks::makeConfig(name, nullptr);
    const auto widget = ChartBlocks::makeWidget(name, cfg.get());
    const std::unique_ptr<QWidget> panel(widget->createOptionsWidget(nullptr, true));
    const QString displayName = widget->displayName();
    QCoreApplication::removeTranslator(&translator);
    const QString marked = QStringLiteral("«%1»").arg(title);
    QCOMPARE(factory->name(), name); // files hold the untranslated one
    QCOMPARE(factory->title(), marked);
    QCOMPARE(displayName, marked);
    QCOMPARE(panel->findChild<QLabel *>(QStringLiteral("sideHeader"))->text(), marked);
}

void KvStatisticsChartNodeFactoriesTest::makesOwnConfigurations()
{
    QFETCH(QString, block);
    KvTemplateContext context(nullptr);
    const auto factory = ChartBlocks::factory(block);
    const std::unique_ptr<KvBaseEditorNodeCfg> first(factory->createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> second(factory->createConfig(&context));
    QVERIFY(first != second);
    QCOMPARE(first->context(), &context);
    QVERIFY(!first->parent());
    // Not one class for all.
    for (const QString &other : ChartBlocks::names()) {
        const std::unique_ptr<KvBaseDisplayWidget> widget(
            ChartBlocks::factory(other)->createDisplayWidget(nullptr, first.get()));
        QCOMPARE(widget != nullptr, other == block);
    }
}

void KvStatisticsChartNodeFactoriesTest::makesDisplayWidgets()
{
    QFETCH(QString, block);
    KvTemplateContext context(nullptr);
    const auto factory = ChartBlocks::factory(block);
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory->createConfig(&context));
    QWidget parent;
    const std::unique_ptr<KvBaseDisplayWidget> widget(factory->createDisplayWidget(&parent, cfg.get()));
    QVERIFY(widget);
    QCOMPARE(widget->displayName(), factory->title());
    QCOMPARE(dynamic_cast<KvStatisticsChartWidget *>(widget.get())->chartView()->accessibleName(),
             factory->title());
    QCOMPARE(widget->subWidgetCount(), 1);
    QCOMPARE(widget->subWidgetAt(0), dynamic_cast<QWidget *>(widget.get()));
    QCOMPARE(widget->subWidgetAt(0)->parentWidget(), &parent);
    QVERIFY(!widget->subWidgetAt(1));
    QVERIFY(!widget->subWidgetAt(-1));
}

void KvStatisticsChartNodeFactoriesTest::refusesOtherConfigurations()
{
    QFETCH(QString, block);
    KvTextDocumentNodeCfg cfg(nullptr);
    QVERIFY(!ChartBlocks::factory(block)->createDisplayWidget(nullptr, &cfg));
    QVERIFY(!ChartBlocks::factory(block)->createDisplayWidget(nullptr, nullptr));
}

void KvStatisticsChartNodeFactoriesTest::standAmongTheStatistics()
{
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    QStringList statistics;
    for (const KvBlockType &type : registry.blockTypes()) {
        if (type.group.title == QLatin1String("Statistics"))
            statistics.append(type.factory->name());
    }
    QCOMPARE(statistics, QStringList({"Statistics Table", "MinMedMaxBox", "Trend", "Counters"}));
    QCOMPARE(registry.blockTypes().size(), 8);
}

STATREPORT_TEST_MAIN(KvStatisticsChartNodeFactoriesTest)
#include "KvStatisticsChartNodeFactoriesTest.moc"
