// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeFactory.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "gui/acss.h"
#include "templates/KvTemplateContext.h"

class KvStatisticsMeasurementsTableNodeFactoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void nameAndTitleDiffer();
    void hasTheTableIcon();
    void makesConfigurationsWithDefaults();
    void makesDisplayWidgets();
    void refusesOtherConfigurations();
};

void KvStatisticsMeasurementsTableNodeFactoryTest::initTestCase()
{
    acss::addIconSearchPath(QStringLiteral(":/blocktest"));
}

void KvStatisticsMeasurementsTableNodeFactoryTest::nameAndTitleDiffer()
{
    const KvStatisticsMeasurementsTableNodeFactory factory;
    QCOMPARE(factory.name(), QStringLiteral("Measurement table"));
    QCOMPARE(factory.title(), QStringLiteral("Measurements Table"));
}

void KvStatisticsMeasurementsTableNodeFactoryTest::hasTheTableIcon()
{
    const QSize size(24, 24);
    const QImage icon = KvStatisticsMeasurementsTableNodeFactory().icon().pixmap(size).toImage();
    const QIcon expected = acss::createIcon(6, QStringLiteral("Icons/ToolIconTable.svg"), size);
    QVERIFY(!icon.isNull());
    QCOMPARE(icon, expected.pixmap(size).toImage());
    const QIcon other = acss::createIcon(6, QStringLiteral("Icons/ToolIconText.svg"), size);
    QVERIFY(icon != other.pixmap(size).toImage());
}

void KvStatisticsMeasurementsTableNodeFactoryTest::makesConfigurationsWithDefaults()
{
    KvTemplateContext context(nullptr);
    KvStatisticsMeasurementsTableNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> first(factory.createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> second(factory.createConfig(&context));
    QVERIFY(first != second);
    const auto *cfg = qobject_cast<KvStatisticsMeasurementsTableNodeCfg *>(first.get());
    QVERIFY(cfg);
    QCOMPARE(cfg->context(), &context);
    QVERIFY(!cfg->parent());
    QCOMPARE(cfg->widthPercent(), 75);
    QCOMPARE(int(cfg->alignment()), 132);
    QCOMPARE(cfg->columns().size(), 4);
}

void KvStatisticsMeasurementsTableNodeFactoryTest::makesDisplayWidgets()
{
    KvTemplateContext context(nullptr);
    KvStatisticsMeasurementsTableNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(&context));
    QWidget parent;
    const std::unique_ptr<KvBaseDisplayWidget> widget(factory.createDisplayWidget(&parent, cfg.get()));
    QVERIFY(dynamic_cast<KvStatisticsMeasurementsTableWidget *>(widget.get()));
    QCOMPARE(widget->displayName(), QStringLiteral("Measurements Table"));
    QVERIFY(widget->subWidgetAt(0));
    QCOMPARE(widget->subWidgetAt(0)->parentWidget(), &parent);
}

void KvStatisticsMeasurementsTableNodeFactoryTest::refusesOtherConfigurations()
{
    KvStatisticsMeasurementsTableNodeFactory factory;
    KvTextDocumentNodeCfg cfg(nullptr);
    QVERIFY(!factory.createDisplayWidget(nullptr, &cfg));
    QVERIFY(!factory.createDisplayWidget(nullptr, nullptr));
}

STATREPORT_TEST_MAIN(KvStatisticsMeasurementsTableNodeFactoryTest)
#include "KvStatisticsMeasurementsTableNodeFactoryTest.moc"
