// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/cameraimage/KvCameraImageNodeCfg.h"
#include "blocks/cameraimage/KvCameraImageNodeFactory.h"
#include "blocks/cameraimage/KvCameraImageWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "gui/acss.h"
#include "templates/KvTemplateContext.h"

class KvCameraImageNodeFactoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasNameTitleAndIcon();
    void makesConfigurations();
    void makesDisplayWidgets();
    void refusesOtherConfigurations();
};

void KvCameraImageNodeFactoryTest::hasNameTitleAndIcon()
{
    const KvCameraImageNodeFactory factory;
    QCOMPARE(factory.name(), QStringLiteral("Camera Image View"));
    QCOMPARE(factory.title(), QStringLiteral("Camera Image View"));
    const QSize size(24, 24);
    const QImage icon = factory.icon().pixmap(size).toImage();
    QVERIFY(!icon.isNull());
    QCOMPARE(icon, acss::createIcon(6, QStringLiteral("Icons/ToolIconCameraImageView.svg"), size)
                       .pixmap(size)
                       .toImage());
}

void KvCameraImageNodeFactoryTest::makesConfigurations()
{
    KvTemplateContext context(nullptr);
    KvCameraImageNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> first(factory.createConfig(&context));
    const std::unique_ptr<KvBaseEditorNodeCfg> second(factory.createConfig(&context));
    QVERIFY(qobject_cast<KvCameraImageNodeCfg *>(first.get()));
    QCOMPARE(first->context(), &context);
    QVERIFY(first != second);
}

void KvCameraImageNodeFactoryTest::makesDisplayWidgets()
{
    KvTemplateContext context(nullptr);
    KvCameraImageNodeFactory factory;
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(&context));
    QWidget parent;
    KvBaseDisplayWidget *widget = factory.createDisplayWidget(&parent, cfg.get());
    QVERIFY(dynamic_cast<KvCameraImageWidget *>(widget));
    QCOMPARE(widget->subWidgetAt(0)->parentWidget(), &parent);
    QCOMPARE(widget->displayName(), QStringLiteral("Camera Image View"));
}

void KvCameraImageNodeFactoryTest::refusesOtherConfigurations()
{
    KvCameraImageNodeFactory factory;
    KvTextDocumentNodeCfg text(nullptr);
    QVERIFY(!factory.createDisplayWidget(nullptr, &text));
    QVERIFY(!factory.createDisplayWidget(nullptr, nullptr));
}

STATREPORT_TEST_MAIN(KvCameraImageNodeFactoryTest)
#include "KvCameraImageNodeFactoryTest.moc"
