// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeFactory.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "gui/acss.h"
#include "templates/KvTemplateContext.h"

class KvTextDocumentNodeFactoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void nameAndTitleAreTheSame();
    void hasTheTextIcon();
    void makesEmptyConfigurations();
    void makesWidgetsAsWideAsThePage_data();
    void makesWidgetsAsWideAsThePage();
    void refusesOtherConfigurations();
};

void KvTextDocumentNodeFactoryTest::initTestCase()
{
    acss::addIconSearchPath(QStringLiteral(":/blocktest"));
}

void KvTextDocumentNodeFactoryTest::nameAndTitleAreTheSame()
{
    const KvTextDocumentNodeFactory factory;
    QCOMPARE(factory.name(), QStringLiteral("Text Document"));
    QCOMPARE(factory.title(), QStringLiteral("Text Document"));
}

void KvTextDocumentNodeFactoryTest::hasTheTextIcon()
{
    const QSize size(24, 24);
    const QImage icon = KvTextDocumentNodeFactory().icon().pixmap(size).toImage();
    QVERIFY(!icon.isNull());
    const QIcon expected = acss::createIcon(6, QStringLiteral("Icons/ToolIconText.svg"), size);
    QCOMPARE(icon, expected.pixmap(size).toImage());
    const QIcon other = acss::createIcon(6, QStringLiteral("Icons/ToolIconTable.svg"), size);
    QVERIFY(icon != other.pixmap(size).toImage());
}

void KvTextDocumentNodeFactoryTest::makesEmptyConfigurations()
{
    KvTemplateContext context(nullptr);
    KvTextDocumentNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> first(factory.createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> second(factory.createConfig(&context));
    QVERIFY(first != second);
    const auto *cfg = qobject_cast<KvTextDocumentNodeCfg *>(first.get());
    QVERIFY(cfg);
    QCOMPARE(cfg->context(), &context);
    QVERIFY(!cfg->parent());
    QCOMPARE(cfg->text(), QString());
}

void KvTextDocumentNodeFactoryTest::makesWidgetsAsWideAsThePage_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<float>("margin");
    QTest::addColumn<int>("width");
    QTest::newRow("default") << 952 << 0.12f << 724; // margins of 114
    QTest::newRow("600") << 600 << 0.12f << 456;     // 72
    QTest::newRow("1000") << 1000 << 0.12f << 760;   // 120
    QTest::newRow("no margin") << 952 << 0.0f << 952;
    QTest::newRow("wide margin") << 952 << 0.4f << 192; // 380
}

void KvTextDocumentNodeFactoryTest::makesWidgetsAsWideAsThePage()
{
    QFETCH(int, pageWidth);
    QFETCH(float, margin);
    QFETCH(int, width);
    KvTemplateContext context(nullptr);
    context.setPageWidth(pageWidth);
    context.setMarginWidth(margin);
    KvTextDocumentNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(&context));
    QWidget parent;
    KvBaseDisplayWidget *display = factory.createDisplayWidget(&parent, cfg.get());
    auto *widget = dynamic_cast<KvTextDocumentNodeWidget *>(display);
    QVERIFY(widget);
    QCOMPARE(widget->parentWidget(), &parent);
    QCOMPARE(widget->document()->textWidth(), qreal(width));
    QCOMPARE(widget->width(), width);
}

void KvTextDocumentNodeFactoryTest::refusesOtherConfigurations()
{
    KvTextDocumentNodeFactory factory;
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QVERIFY(!factory.createDisplayWidget(nullptr, &cfg));
    QVERIFY(!factory.createDisplayWidget(nullptr, nullptr));
}

STATREPORT_TEST_MAIN(KvTextDocumentNodeFactoryTest)
#include "KvTextDocumentNodeFactoryTest.moc"
