// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvTemplateCheck.h"
#include "blocks/KvReportBlocks.h"
#include "templates/KvBlockRegistry.h"

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

QStringList lines(const char *utf8)
{
    return text(utf8).split(QLatin1Char('|'), Qt::SkipEmptyParts);
}

QString templatePath(const QString &name)
{
    return StatReportTest::sourcePath(QStringLiteral("tests/cli/templates/%1.rtp").arg(name));
}

} // namespace

class KvTemplateCheckTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase() { registerReportBlocks(m_blocks); }
    void findsFaults_data();
    void findsFaults();
    void findsWarnings_data();
    void findsWarnings();
    void everyTemplateIsLookedAt();
    void saysWhatCannotBeRead();
    void startsAfresh();

private:
    KvBlockTypeList m_blocks;
};

void KvTemplateCheckTest::findsFaults_data()
{
    QTest::addColumn<QString>("fault");
    const auto add = [](const char *name, const char *fault) { QTest::newRow(name) << text(fault); };
    add("empty", "t.rtp:1:1: is no JSON: illegal value");
    add("truncated", "t.rtp:3:1: is no JSON: unterminated object");
    add("no-value", "t.rtp:3:11: is no JSON: illegal number");
    add("garbage-at-the-end", "t.rtp:1:14: is no JSON: garbage at the end of the document");
    // The place is the one behind the number.
    add("number-too-large", "t.rtp:1:16: is no JSON: illegal number");
    add("no-object", "t.rtp: is no template: the JSON document is no object");
    // 1024 levels are read; the place is the one behind the bracket that begins one more.
    add("nested-5000-deep", "t.rtp:1:1026: is no JSON: too deeply nested document");
    add("nested-objects", "t.rtp:1:5122: is no JSON: too deeply nested document");
    // Behind the "%" that begins it.
    add("binary", "t.rtp:1:2: is no JSON: illegal value");
    add("block-without-settings", "t.rtp: nodes[1].config: is missing, not an object");
    add("block-settings-no-object", "t.rtp: nodes[0].config: is an array, not an object");
    add("text-block-without-text", "t.rtp: nodes[0].config: \"text\" is missing");
    add("text-block-with-number", "t.rtp: nodes[0].config: \"text\" is a number, not a string");
}

void KvTemplateCheckTest::findsFaults()
{
    QFETCH(QString, fault);
    KvTemplateCheck check(m_blocks);
    QVERIFY(!check.run(templatePath(QLatin1String(QTest::currentDataTag())), text("t.rtp")));
    QCOMPARE(check.fault().text(), fault);
}

void KvTemplateCheckTest::findsWarnings_data()
{
    QTest::addColumn<QStringList>("contents");
    QTest::addColumn<QStringList>("warnings");
    const auto add = [](const char *name, const char *contents, const char *warnings) {
        QTest::newRow(name) << lines(contents) << lines(warnings);
    };
    add("nothing", "",
        "config: is missing; the page keeps its defaults|nodes: is missing, not an array; there are no "
        "blocks");
    add("all-sections",
        "page width 952 px|header|footer|pageNumbering|block \"Text Document\"|block \"Measurement table\"",
        "");
    add("page-settings-no-object", "", "config: is an array; the page keeps its defaults");
    const char *width = "config.pageWidth: is no whole number of pixels above 0";
    for (const char *name : {"page-width-zero", "page-width-negative", "page-width-fraction",
                             "page-width-text", "page-width-huge", "page-width-null"})
        add(name, "", width);
    const char *margin = "config.marginWidth: is no fraction of the page width from 0 to 0.5";
    for (const char *name : {"margin-negative", "margin-half", "margin-text", "margin-huge"})
        add(name, "", margin);
    add("margin-zero", "page width 10 px", "");
    add("sections-of-wrong-types", "",
        "header: is a string, not an object; it is off|footer.enabled: is a number, not a boolean; it is off|"
        "pageNumbering.text: is missing, not a string; the section is off");
    add("section-texts-of-wrong-types", "",
        "header.text: is a number, not a string; the section is off|footer.text: is null, not a string; the "
        "section is off|pageNumbering: is null, not an object; it is off");
    add("sections-off", "", "");
    add("nodes-no-list", "", "nodes: is an object, not an array; there are no blocks");
    add("blocks-that-are-skipped", "block \"Text Document\"",
        "nodes[0].name: is missing, not a string; the block is skipped|"
        "nodes[1].name: is missing, not a string; the block is skipped|"
        "nodes[2].name: is a number, not a string; the block is skipped|"
        "nodes[3]: there is no block type \"Pie chart\"; the block is skipped");
    add("table-settings-of-wrong-types", "block \"Measurement table\"",
        "nodes[0].config.alignment: is a string, not a number; it is ignored|"
        "nodes[0].config.columns: is an array, not a string; it is ignored|"
        "nodes[0].config.orderAscending: is a string, not a boolean; it is ignored|"
        "nodes[0].config.orderColumn: is a number, not a string; it is ignored|"
        "nodes[0].config.widthPercent: is a boolean, not a number; it is ignored");
    add("unknown-settings", "block \"Measurement table\"", "");
    add("unknown-keywords", "header|block \"Text Document\"",
        "header.text: unknown keyword ${creation_date_iso}; it stays as it is|"
        "footer.text: unknown keyword ${}; it stays as it is|"
        "nodes[0].config.text: unknown keyword ${A}; it stays as it is|"
        "nodes[0].config.text: unknown keyword ${B}; it stays as it is");
}

void KvTemplateCheckTest::findsWarnings()
{
    QFETCH(QStringList, contents);
    QFETCH(QStringList, warnings);
    KvTemplateCheck check(m_blocks);
    const bool isUsable = check.run(templatePath(QLatin1String(QTest::currentDataTag())), text("t.rtp"));
    QVERIFY2(isUsable, qPrintable(check.fault().text()));
    QCOMPARE(check.warnings(), warnings);
    QCOMPARE(check.contents(), contents);
    QVERIFY(check.fault().isNull());
}

void KvTemplateCheckTest::everyTemplateIsLookedAt()
{
    QFile source(sourcePath(QStringLiteral("tests/cli/KvTemplateCheckTest.cpp")));
    QVERIFY(source.open(QIODevice::ReadOnly));
    const QByteArray code = source.readAll();
    const QDir folder(sourcePath(QStringLiteral("tests/cli/templates")));
    const QFileInfoList files = folder.entryInfoList(QDir::Files);
    QVERIFY(!files.isEmpty());
    for (const QFileInfo &file : files)
        QVERIFY2(code.contains('"' + file.completeBaseName().toUtf8() + '"'), qPrintable(file.fileName()));
}

void KvTemplateCheckTest::saysWhatCannotBeRead()
{
    KvTemplateCheck check(m_blocks);
    QVERIFY(!check.run(templatePath(QStringLiteral("there-is-no-such")), text("named so")));
    QCOMPARE(check.fault().text(), text("named so: cannot be opened: No such file or directory"));
    QVERIFY(!check.run(QDir::tempPath(), text("folder")));
    QVERIFY2(check.fault().text().startsWith(text("folder: cannot be opened: ")),
             qPrintable(check.fault().text()));

    const QString path = temporaryPath(QStringLiteral("large.rtp"));
    QFile large(path);
    QVERIFY(large.open(QIODevice::WriteOnly));
    // A hole: it takes no room on the disk.
    QVERIFY(large.resize(256LL * 1024 * 1024 + 1));
    QVERIFY(!check.run(path, text("large.rtp")));
    QCOMPARE(check.fault().text(), text("large.rtp: is larger than 256 MB"));
    QVERIFY(large.remove());
}

void KvTemplateCheckTest::startsAfresh()
{
    KvTemplateCheck check(m_blocks);
    QVERIFY(!check.run(templatePath(QStringLiteral("truncated")), text("a")));
    QVERIFY(check.run(templatePath(QStringLiteral("nothing")), text("b")));
    QVERIFY(check.fault().isNull());
    QCOMPARE(check.warnings().size(), 2);
    QVERIFY(check.run(templatePath(QStringLiteral("margin-zero")), text("c")));
    QCOMPARE(check.warnings(), QStringList());
    QCOMPARE(check.contents(), QStringList{text("page width 10 px")});
}

STATREPORT_TEST_MAIN(KvTemplateCheckTest)
#include "KvTemplateCheckTest.moc"
