// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "MarkingTranslator.h"
#include "blocks/KvReportBlocks.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"
#include "blocks/statisticstable/KvStatisticsStatsTableNodeFactory.h"
#include "blocks/statisticstable/KvStatisticsStatsTableWidget.h"
#include "gui/acss.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateContext.h"

class KvStatisticsStatsTableNodeFactoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void hasNameAndTitle();
    void onlyTheTitleIsTranslated();
    void hasTheTableIcon();
    void makesConfigurationsWithDefaults();
    void makesDisplayWidgets();
    void refusesOtherConfigurations();
    void isTheFirstOfTheStatistics();
};

void KvStatisticsStatsTableNodeFactoryTest::initTestCase()
{
    acss::addIconSearchPath(QStringLiteral(":/blocktest"));
}

void KvStatisticsStatsTableNodeFactoryTest::hasNameAndTitle()
{
    const KvStatisticsStatsTableNodeFactory factory;
    QCOMPARE(factory.name(), QStringLiteral("Statistics Table"));
    QCOMPARE(factory.title(), QStringLiteral("Statistics Table"));
}

void KvStatisticsStatsTableNodeFactoryTest::onlyTheTitleIsTranslated()
{
    MarkingTranslator translator(QStringLiteral("KvBaseEditorNodeFactory"));
    QCoreApplication::installTranslator(&translator);
    const KvStatisticsStatsTableNodeFactory factory;
    QCoreApplication::removeTranslator(&translator);
    QCOMPARE(factory.name(), QStringLiteral("Statistics Table"));
    QCOMPARE(factory.title(), QStringLiteral("«Statistics Table»"));
}

void KvStatisticsStatsTableNodeFactoryTest::hasTheTableIcon()
{
    const QSize size(24, 24);
    const QImage icon = KvStatisticsStatsTableNodeFactory().icon().pixmap(size).toImage();
    const QIcon expected = acss::createIcon(6, QStringLiteral("Icons/ToolIconTable.svg"), size);
    QVERIFY(!icon.isNull());
    QCOMPARE(icon, expected.pixmap(size).toImage());
    const QIcon other = acss::createIcon(6, QStringLiteral("Icons/ToolIconText.svg"), size);
    QVERIFY(icon != other.pixmap(size).toImage());
}

void KvStatisticsStatsTableNodeFactoryTest::makesConfigurationsWithDefaults()
{
    KvTemplateContext context(nullptr);
    KvStatisticsStatsTableNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> first(factory.createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> second(factory.createConfig(&context));
    QVERIFY(first != second);
    const auto *cfg = qobject_cast<KvStatisticsStatsTableNodeCfg *>(first.get());
    QVERIFY(cfg);
    QCOMPARE(cfg->context(), &context);
    QVERIFY(!cfg->parent());
    QCOMPARE(cfg->widthPercent(), 75);
    QCOMPARE(int(cfg->alignment()), 4);
    QCOMPARE(cfg->columns().size(), 6);
}

void KvStatisticsStatsTableNodeFactoryTest::makesDisplayWidgets()
{
    KvTemplateContext context(nullptr);
    KvStatisticsStatsTableNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(&context));
    QWidget parent;
    const std::unique_ptr<KvBaseDisplayWidget> widget(factory.createDisplayWidget(&parent, cfg.get()));
    QVERIFY(dynamic_cast<KvStatisticsStatsTableWidget *>(widget.get()));
    QCOMPARE(widget->displayName(), QStringLiteral("Statistics Table"));
    QVERIFY(widget->subWidgetAt(0));
    QCOMPARE(widget->subWidgetAt(0)->parentWidget(), &parent);
}

void KvStatisticsStatsTableNodeFactoryTest::refusesOtherConfigurations()
{
    KvStatisticsStatsTableNodeFactory factory;
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QVERIFY(!factory.createDisplayWidget(nullptr, &cfg));
    QVERIFY(!factory.createDisplayWidget(nullptr, nullptr));
}

void KvStatisticsStatsTableNodeFactoryTest::isTheFirstOfTheStatistics()
{
    KvBlockTypeList blocks;
    registerReportBlocks(blocks);
    const QVector<KvBlockType> types = blocks.blockTypes();
    QVERIFY(types.size() >= 5);
    for (int i = 0; i < 4; ++i)
        QCOMPARE(types.at(i).group.title, QString());
    QCOMPARE(types.at(4).factory->name(), QStringLiteral("Statistics Table"));
    QCOMPARE(types.at(4).group.title, QStringLiteral("Statistics"));
    QCOMPARE(types.at(4).group.iconPath, QStringLiteral("Icons/ToolIconStats.svg"));
}

STATREPORT_TEST_MAIN(KvStatisticsStatsTableNodeFactoryTest)
#include "KvStatisticsStatsTableNodeFactoryTest.moc"
