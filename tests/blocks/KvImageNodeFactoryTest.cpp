// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/image/KvImageNodeCfg.h"
#include "blocks/image/KvImageNodeFactory.h"
#include "blocks/image/KvImageWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "gui/acss.h"
#include "templates/KvTemplateContext.h"

class KvImageNodeFactoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasNameTitleAndIcon();
    void makesConfigurations();
    void makesDisplayWidgets();
    void refusesOtherConfigurations();
};

void KvImageNodeFactoryTest::hasNameTitleAndIcon()
{
    const KvImageNodeFactory factory;
    QCOMPARE(factory.name(), QStringLiteral("Image View"));
    QCOMPARE(factory.title(), QStringLiteral("Image View"));
    const QSize size(24, 24);
    const QImage icon = factory.icon().pixmap(size).toImage();
    QVERIFY(!icon.isNull());
    QCOMPARE(icon,
             acss::createIcon(6, QStringLiteral("Icons/ToolIconImageView.svg"), size).pixmap(size).toImage());
}

void KvImageNodeFactoryTest::makesConfigurations()
{
    KvTemplateContext context(nullptr);
    KvImageNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> first(factory.createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> second(factory.createConfig(&context));
    QVERIFY(qobject_cast<KvImageNodeCfg *>(first.get()));
    QCOMPARE(first->context(), &context);
    QVERIFY(first != second);
}

void KvImageNodeFactoryTest::makesDisplayWidgets()
{
    KvTemplateContext context(nullptr);
    KvImageNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(&context));
    QWidget parent;
    KvBaseDisplayWidget *widget = factory.createDisplayWidget(&parent, cfg.get());
    QVERIFY(dynamic_cast<KvImageWidget *>(widget));
    QCOMPARE(widget->subWidgetAt(0)->parentWidget(), &parent);
    QCOMPARE(widget->displayName(), QStringLiteral("Image View"));
}

void KvImageNodeFactoryTest::refusesOtherConfigurations()
{
    KvImageNodeFactory factory;
    KvTextDocumentNodeCfg text(nullptr);
    QVERIFY(!factory.createDisplayWidget(nullptr, &text));
    QVERIFY(!factory.createDisplayWidget(nullptr, nullptr));
}

STATREPORT_TEST_MAIN(KvImageNodeFactoryTest)
#include "KvImageNodeFactoryTest.moc"
