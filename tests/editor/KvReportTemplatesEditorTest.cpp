// SPDX-License-Identifier: MIT
#include "editor/KvReportTemplatesEditor.h"
#include "blocks/FakeMeasurements.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "editor/KvEditorToolCombo.h"
#include "editor/KvEditorToolWidget.h"
#include "editor/KvEditorToolsList.h"
#include "kernel/ZtAppSettings.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "support/BracketTranslator.h"
#include "support/FileDialogAnswerer.h"
#include "support/StatReportTest.h"
#include "templates/KvTemplateModel.h"

#include <QStandardPaths>
#include <QTextDocument>

class KvReportTemplatesEditorTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void titleIsTranslated();
    void templatesAreBesideTheProgram();
    void printsGoToTheDocuments();
    void foldersAreRemembered_data();
    void foldersAreRemembered();
    void fileTypeIsRtp();
    void paletteHoldsAllBlocks();
    void statisticsAreAGroup();
    void loadsTheDemo();
    void textsKeepTheirKeys();
    void aTextBeingTypedIsSaved();
    void savingRemembersItsFolderOnly();
    void printingRemembersItsFolderOnly();
};

void KvReportTemplatesEditorTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString()); // forgets all values
}

void KvReportTemplatesEditorTest::titleIsTranslated()
{
    FakeMeasurements measurements;
    const KvReportTemplatesEditor editor(measurements.kernelData());
    QCOMPARE(editor.windowTitle(), QStringLiteral("Report template editor - [new]"));
    const BracketTranslator translator(QStringLiteral("KvReportTemplatesEditor"));
    QTRY_COMPARE(editor.windowTitle(), QStringLiteral("[Report template editor] - [new]"));
    QCOMPARE(editor.templateFileFilter(), QStringLiteral("[Report template file (*.rtp)]"));
}

void KvReportTemplatesEditorTest::templatesAreBesideTheProgram()
{
    FakeMeasurements measurements;
    const KvReportTemplatesEditor editor(measurements.kernelData());
    QCOMPARE(editor.templatesDirectory(),
             QDir::toNativeSeparators(QCoreApplication::applicationDirPath() + QStringLiteral("/Templates")));
}

void KvReportTemplatesEditorTest::printsGoToTheDocuments()
{
    FakeMeasurements measurements;
    const KvReportTemplatesEditor editor(measurements.kernelData());
    QCOMPARE(editor.printDirectory(), QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation));
}

void KvReportTemplatesEditorTest::foldersAreRemembered_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<bool>("ofTemplates");
    QTest::newRow("templates") << QStringLiteral("ReportTemplatesPath") << true;
    QTest::newRow("prints") << QStringLiteral("ReportPdfPath") << false;
}

void KvReportTemplatesEditorTest::foldersAreRemembered()
{
    QFETCH(QString, key);
    QFETCH(bool, ofTemplates);
    FakeMeasurements measurements;
    KvReportTemplatesEditor editor(measurements.kernelData());
    if (ofTemplates)
        editor.setTemplatesDirectory(QStringLiteral("/some/folder"));
    else
        editor.setPrintDirectory(QStringLiteral("/some/folder"));
    QCOMPARE(ZtAppSettings::value(key).toString(), QStringLiteral("/some/folder"));
    ZtAppSettings::setValue(key, QStringLiteral("/another"));
    QCOMPARE(ofTemplates ? editor.templatesDirectory() : editor.printDirectory(), QStringLiteral("/another"));
}

void KvReportTemplatesEditorTest::fileTypeIsRtp()
{
    FakeMeasurements measurements;
    const KvReportTemplatesEditor editor(measurements.kernelData());
    QCOMPARE(editor.templateFileSuffix(), QStringLiteral("rtp"));
    QCOMPARE(editor.templateFileFilter(), QStringLiteral("Report template file (*.rtp)"));
}

void KvReportTemplatesEditorTest::paletteHoldsAllBlocks()
{
    FakeMeasurements measurements;
    const KvReportTemplatesEditor editor(measurements.kernelData());
    QStringList titles;
    for (const KvEditorToolWidget *tool : editor.toolsList()->findChildren<KvEditorToolWidget *>())
        titles.append(tool->text());
    QCOMPARE(titles,
             QStringList({QStringLiteral("Image View"), QStringLiteral("Camera Image View"),
                          QStringLiteral("Text Document"), QStringLiteral("Measurements Table"),
                          QStringLiteral("Statistics Table"), QStringLiteral("Min / Median / Max Box"),
                          QStringLiteral("Trend"), QStringLiteral("Counters")}));
}

void KvReportTemplatesEditorTest::statisticsAreAGroup()
{
    FakeMeasurements measurements;
    const KvReportTemplatesEditor editor(measurements.kernelData());
    const auto groups = editor.toolsList()->findChildren<KvEditorToolCombo *>();
    QCOMPARE(groups.size(), 1);
    QCOMPARE(groups.first()->title(), QStringLiteral("Statistics"));
    QVERIFY(!groups.first()->isOpen());
    QStringList titles;
    for (const KvEditorToolWidget *tool : groups.first()->findChildren<KvEditorToolWidget *>())
        titles.append(tool->text());
    QCOMPARE(titles,
             QStringList({QStringLiteral("Statistics Table"), QStringLiteral("Min / Median / Max Box"),
                          QStringLiteral("Trend"), QStringLiteral("Counters")}));
}

void KvReportTemplatesEditorTest::loadsTheDemo()
{
    FakeMeasurements measurements;
    KvReportTemplatesEditor editor(measurements.kernelData());
    const QString path = sourcePath(QStringLiteral("examples/templates/demo.rtp"));
    const FileDialogAnswerer answerer(path);
    editor.slotOpenTemplate();
    QCOMPARE(editor.windowTitle(), QStringLiteral("Report template editor - ") + path);
    QVERIFY(editor.templateModel()->nodeCount() > 0);
}

void KvReportTemplatesEditorTest::textsKeepTheirKeys()
{
    FakeMeasurements measurements;
    KvReportTemplatesEditor editor(measurements.kernelData());
    editor.show();
    editor.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&editor));
    KvReportNode *node = editor.templateModel()->createNode(QStringLiteral("Text Document"), -1);
    QVERIFY(node);
    editor.pagedView()->selectNode(node);
    QTest::keyClicks(editor.pagedView(), QStringLiteral("xyz"));
    QTest::keyClick(editor.pagedView(), Qt::Key_Home);
    QTest::keyClick(editor.pagedView(), Qt::Key_Delete);
    QCOMPARE(editor.templateModel()->nodeCount(), 1);
    QTextDocument text;
    text.setHtml(static_cast<KvTextDocumentNodeCfg *>(node->config())->text());
    QCOMPARE(text.toPlainText(), QStringLiteral("yz"));
    // Nothing is left to delete behind the last letter; the block stays nevertheless.
    QTest::keyClick(editor.pagedView(), Qt::Key_End);
    QTest::keyClick(editor.pagedView(), Qt::Key_Delete);
    QCOMPARE(editor.templateModel()->nodeCount(), 1);
    QTest::keyClick(editor.pagedView(), Qt::Key_Escape);
    QVERIFY(!editor.pagedView()->selectedNode());
}

void KvReportTemplatesEditorTest::aTextBeingTypedIsSaved()
{
    FakeMeasurements measurements;
    KvReportTemplatesEditor editor(measurements.kernelData());
    editor.show();
    editor.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&editor));
    KvReportNode *node = editor.templateModel()->createNode(QStringLiteral("Text Document"), -1);
    editor.pagedView()->selectNode(node);
    QTest::keyClicks(editor.pagedView(), QStringLiteral("Plate 17"));
    QCOMPARE(editor.windowTitle(), QStringLiteral("Report template editor - *[new]"));
    const QString path = temporaryPath(QStringLiteral("typed.rtp"));
    const FileDialogAnswerer answerer(path);
    QVERIFY(editor.slotSaveTemplate());
    QVERIFY(!editor.templateModel()->isModified());
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QVERIFY(file.readAll().contains("Plate 17"));
}

void KvReportTemplatesEditorTest::savingRemembersItsFolderOnly()
{
    FakeMeasurements measurements;
    KvReportTemplatesEditor editor(measurements.kernelData());
    const FileDialogAnswerer answerer(temporaryPath(QStringLiteral("a")));
    QVERIFY(editor.slotSaveTemplate());
    QCOMPARE(ZtAppSettings::value(QStringLiteral("ReportTemplatesPath")).toString(),
             QFileInfo(temporaryPath(QStringLiteral("a.rtp"))).absolutePath());
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("ReportPdfPath")));
    QVERIFY(QFile::exists(temporaryPath(QStringLiteral("a.rtp"))));
}

void KvReportTemplatesEditorTest::printingRemembersItsFolderOnly()
{
    FakeMeasurements measurements;
    KvReportTemplatesEditor editor(measurements.kernelData());
    const FileDialogAnswerer answerer(temporaryPath(QStringLiteral("p")));
    editor.slotPrintReport();
    QCOMPARE(ZtAppSettings::value(QStringLiteral("ReportPdfPath")).toString(),
             QFileInfo(temporaryPath(QStringLiteral("p.pdf"))).absolutePath());
    QVERIFY(!ZtAppSettings::contains(QStringLiteral("ReportTemplatesPath")));
    QVERIFY(QFile::exists(temporaryPath(QStringLiteral("p.pdf"))));
}

STATREPORT_TEST_MAIN(KvReportTemplatesEditorTest)
#include "KvReportTemplatesEditorTest.moc"
