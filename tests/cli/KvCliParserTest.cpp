// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvCliParser.h"

namespace {

KvCliParseResult parse(const QString &line)
{
    return KvCliParser::parse(
        QStringLiteral("statreport %1").arg(line).split(QLatin1Char(' '), Qt::SkipEmptyParts));
}

} // namespace

class KvCliParserTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void refusesWrongUsage_data();
    void refusesWrongUsage();
    void remembersHowToWriteErrors();
    void showsTheOverview_data();
    void showsTheOverview();
    void showsTheHelpOfACommand_data();
    void showsTheHelpOfACommand();
    void showsTheVersion_data();
    void showsTheVersion();
    void readsRender();
    void readsStats();
    void readsStatsDefaults();
    void readsCheck();
    void readsBlocks_data();
    void readsBlocks();
    void readsDigits_data();
    void readsDigits();
};

void KvCliParserTest::refusesWrongUsage_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QString>("text");
    const auto add = [](const char *line, const char *text) {
        QTest::newRow(line) << QString::fromUtf8(line) << QString::fromUtf8(text);
    };
    add("", "a command is missing: render, stats, check or blocks");
    add("print", "unknown command \"print\"; it must be render, stats, check or blocks");
    add("Render", "unknown command \"Render\"; it must be render, stats, check or blocks");
    add("--json-errors", "a command is missing: render, stats, check or blocks");
    add("--json-errors -q print", "unknown command \"print\"; it must be render, stats, check or blocks");
    add("check a.rtp --language Klingon", "--language must be one of English, German, French, Spanish, "
                                          "Italian, Russian, Japanese, Korean, Arabic, "
                                          "ChineseSimple, ChineseTraditional, Slovakian, not \"Klingon\"");
    add("--language de", "a command is missing: render, stats, check or blocks");
    add("--language", "a command is missing: render, stats, check or blocks");
    add("render", "the template is missing");
    add("render --table t.csv -o o.pdf", "the template is missing");
    add("render a.rtp", "the file to write is missing: -o OUT.pdf");
    add("render a.rtp --table t.csv", "the file to write is missing: -o OUT.pdf");
    add("render a.rtp -o", "Missing value after '-o'.");
    add("render a.rtp b.rtp --table t.csv -o o.pdf", "unexpected argument \"b.rtp\"");
    add("render a.rtp -o o.pdf", "give the measurements: either --session or --table");
    add("render a.rtp --table t --session s -o o", "give the measurements: either --session or --table");
    add("render a.rtp --table= -o o", "give the measurements: either --session or --table");
    add("render - --table - -o o", "only one file can be read from standard input");
    add("render - --session - -o o", "only one file can be read from standard input");
    add("render a.rtp --table t -o o --format text", "Unknown option 'format'.");
    add("render a.rtp --table t -o o --group-by object", "Unknown option 'group-by'.");
    add("render a.rtp --table t -o o --decimal dot", "--decimal must be point or comma, not \"dot\"");
    add("stats", "give the measurements: either --session or --table");
    add("stats --table t --session s", "give the measurements: either --session or --table");
    add("stats --table", "Missing value after '--table'.");
    add("stats t.csv", "unexpected argument \"t.csv\"");
    add("stats --table t --image i", "Unknown option 'image'.");
    add("stats --table t -o o", "Unknown option 'o'.");
    add("stats --table t --format xml", "--format must be text, csv or json, not \"xml\"");
    add("stats --table t --format CSV", "--format must be text, csv or json, not \"CSV\"");
    add("stats --table t --group-by type", "--group-by must be object or measurement, not \"type\"");
    add("stats --table t --digits 16", "--digits must be a number from 0 to 15, not \"16\"");
    add("stats --table t --digits=-1", "--digits must be a number from 0 to 15, not \"-1\"");
    add("stats --table t --digits 2.5", "--digits must be a number from 0 to 15, not \"2.5\"");
    add("stats --table t --digits many", "--digits must be a number from 0 to 15, not \"many\"");
    add("stats --table t --digits 99999999999",
        "--digits must be a number from 0 to 15, not \"99999999999\"");
    add("stats --table t --decimal ,", "--decimal must be point or comma, not \",\"");
    // Comes before what would be shown.
    add("stats --frob --version", "Unknown option 'frob'.");
    add("stats --table t --quiet=yes", "Unexpected value after '--quiet'.");
    add("check", "the template is missing");
    add("check a.rtp b.rtp", "unexpected argument \"b.rtp\"");
    add("check a.rtp --table t", "Unknown option 'table'.");
    add("blocks a.rtp", "unexpected argument \"a.rtp\"");
    add("blocks --format csv", "--format must be text or json, not \"csv\"");
    add("blocks --frob", "Unknown option 'frob'.");
}

void KvCliParserTest::refusesWrongUsage()
{
    QFETCH(QString, line);
    QFETCH(QString, text);
    const KvCliParseResult result = parse(line);
    QCOMPARE(result.kind, KvCliParseResult::UsageError);
    QCOMPARE(result.text, text);
}

void KvCliParserTest::remembersHowToWriteErrors()
{
    QVERIFY(parse(QStringLiteral("print --json-errors")).arguments.jsonErrors);
    QVERIFY(parse(QStringLiteral("stats --frob --json-errors")).arguments.jsonErrors);
    QVERIFY(parse(QStringLiteral("check --json-errors")).arguments.jsonErrors);
    QVERIFY(parse(QStringLiteral("--json-errors")).arguments.jsonErrors);
    QCOMPARE(parse(QStringLiteral("--json-errors -q check a.rtp")).arguments.command, KvCliArguments::Check);
    QVERIFY(!parse(QStringLiteral("check")).arguments.jsonErrors);
}

void KvCliParserTest::showsTheOverview_data()
{
    QTest::addColumn<QString>("line");
    for (const char *line : {"-h", "--help", "--help render"})
        QTest::newRow(line) << QString::fromUtf8(line);
}

void KvCliParserTest::showsTheOverview()
{
    QFETCH(QString, line);
    const KvCliParseResult result = parse(line);
    QCOMPARE(result.kind, KvCliParseResult::ShowText);
    QVERIFY(result.text.startsWith(QLatin1String("Usage: statreport COMMAND [options]\n")));
    for (const char *part : {"render TEMPLATE.rtp (--session S | --table T) [--image I] -o OUT.pdf\n",
                             "stats (--session S | --table T) [--group-by object|measurement]\n",
                             "check TEMPLATE.rtp ", "blocks [--format text|json]\n", "--json-errors ",
                             "--language NAME ", "0 done, 1 the work failed, 2 wrong usage.\n"})
        QVERIFY2(result.text.contains(QLatin1String(part)), part);
}

void KvCliParserTest::showsTheHelpOfACommand_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QString>("usage");
    QTest::addColumn<QStringList>("options");
    const QStringList data{QStringLiteral("--session <file>"), QStringLiteral("--table <file>"),
                           QStringLiteral("--unit <unit>"),    QStringLiteral("--type-column <column>"),
                           QStringLiteral("--decimal <mark>"), QStringLiteral("--digits <count>")};
    QTest::newRow("render") << QStringLiteral("render -h")
                            << QStringLiteral("render [options] TEMPLATE.rtp\n")
                            << data + QStringList{QStringLiteral("--image <file>"),
                                                  QStringLiteral("-o, --output <file>")};
    QTest::newRow("stats") << QStringLiteral("stats --help") << QStringLiteral("stats [options]\n")
                           << data + QStringList{QStringLiteral("--group-by <grouping>"),
                                                 QStringLiteral("Output: text, csv or json.")};
    QTest::newRow("check") << QStringLiteral("check --help a b c")
                           << QStringLiteral("check [options] TEMPLATE.rtp\n") << QStringList();
    QTest::newRow("blocks") << QStringLiteral("blocks --help") << QStringLiteral("blocks [options]\n")
                            << QStringList{QStringLiteral("Output: text or json.")};
}

void KvCliParserTest::showsTheHelpOfACommand()
{
    QFETCH(QString, line);
    QFETCH(QString, usage);
    QFETCH(QStringList, options);
    const KvCliParseResult result = parse(line);
    QCOMPARE(result.kind, KvCliParseResult::ShowText);
    const QString firstLine = result.text.section(QLatin1Char('\n'), 0, 0) + QLatin1Char('\n');
    // The program's own name comes from how it was called.
    QVERIFY2(firstLine.endsWith(QLatin1Char(' ') + usage), qPrintable(firstLine));
    options << QStringLiteral("-h, --help") << QStringLiteral("-v, --version")
            << QStringLiteral("--json-errors") << QStringLiteral("-q, --quiet");
    // Between the usage and the options there is what the command does.
    const QString description = result.text.section(QLatin1Char('\n'), 1, 1);
    QVERIFY2(description.endsWith(QLatin1Char('.')), qPrintable(description));
    for (const QString &option : qAsConst(options))
        QVERIFY2(result.text.contains(option), qPrintable(option));
    // Each argument is explained, and there is no heading above none.
    const QString arguments = result.text.section(QStringLiteral("\nArguments:\n"), 1);
    QCOMPARE(arguments.isEmpty(), !usage.contains(QStringLiteral("TEMPLATE.rtp")));
    for (const QString &argument : arguments.split(QLatin1Char('\n'), Qt::SkipEmptyParts))
        QVERIFY2(argument.endsWith(QLatin1Char('.')), qPrintable(argument));
}

void KvCliParserTest::showsTheVersion_data()
{
    QTest::addColumn<QString>("line");
    for (const char *line : {"-v", "--version", "check -v", "blocks x --version"})
        QTest::newRow(line) << QString::fromUtf8(line);
}

void KvCliParserTest::showsTheVersion()
{
    QFETCH(QString, line);
    const KvCliParseResult result = parse(line);
    QCOMPARE(result.kind, KvCliParseResult::ShowText);
    QCOMPARE(result.text, QStringLiteral("statreport " STATREPORT_VERSION "\n"));
}

void KvCliParserTest::readsRender()
{
    const KvCliParseResult result = parse(
        QStringLiteral("render a.rtp --session s.json --image i.png --output o.pdf --unit mm --unit Area=mm2 "
                       "--type-column T --name-column N --decimal comma --digits 4 -q --json-errors"));
    QCOMPARE(result.text, QString());
    QCOMPARE(result.kind, KvCliParseResult::Run);
    const KvCliArguments &arguments = result.arguments;
    QCOMPARE(arguments.command, KvCliArguments::Render);
    QCOMPARE(arguments.templatePath, QStringLiteral("a.rtp"));
    QCOMPARE(arguments.sessionPath, QStringLiteral("s.json"));
    QCOMPARE(arguments.tablePath, QString());
    QCOMPARE(arguments.imagePath, QStringLiteral("i.png"));
    QCOMPARE(arguments.outputPath, QStringLiteral("o.pdf"));
    QCOMPARE(arguments.units, QStringList({QStringLiteral("mm"), QStringLiteral("Area=mm2")}));
    QCOMPARE(arguments.typeColumn, QStringLiteral("T"));
    QCOMPARE(arguments.nameColumn, QStringLiteral("N"));
    QCOMPARE(arguments.decimalMark, QStringLiteral("comma"));
    QCOMPARE(arguments.digits, 4U);
    QVERIFY(arguments.quiet);
    QVERIFY(arguments.jsonErrors);

    const KvCliParseResult piped = parse(QStringLiteral("render -o - a.rtp --table -"));
    QCOMPARE(piped.kind, KvCliParseResult::Run);
    QCOMPARE(piped.arguments.outputPath, QStringLiteral("-"));
    QCOMPARE(piped.arguments.tablePath, QStringLiteral("-"));
    QVERIFY(!piped.arguments.quiet);
    QVERIFY(!piped.arguments.jsonErrors);
}

void KvCliParserTest::readsStats()
{
    const KvCliParseResult csv =
        parse(QStringLiteral("stats --table t.csv --group-by measurement --format csv --decimal point"));
    QCOMPARE(csv.kind, KvCliParseResult::Run);
    QCOMPARE(csv.arguments.command, KvCliArguments::Stats);
    QCOMPARE(csv.arguments.tablePath, QStringLiteral("t.csv"));
    QVERIFY(!csv.arguments.groupByObject);
    QCOMPARE(csv.arguments.format, KvCliArguments::Csv);
    QCOMPARE(csv.arguments.decimalMark, QStringLiteral("point"));
    const KvCliParseResult json = parse(QStringLiteral("stats --session=- --group-by=object --format=json"));
    QCOMPARE(json.kind, KvCliParseResult::Run);
    QCOMPARE(json.arguments.sessionPath, QStringLiteral("-"));
    QVERIFY(json.arguments.groupByObject);
    QCOMPARE(json.arguments.format, KvCliArguments::Json);
}

void KvCliParserTest::readsStatsDefaults()
{
    const KvCliArguments arguments = parse(QStringLiteral("stats --table t.csv")).arguments;
    QVERIFY(arguments.groupByObject);
    QCOMPARE(arguments.format, KvCliArguments::Text);
    QCOMPARE(arguments.digits, 0U);
    QCOMPARE(arguments.decimalMark, QString());
    QCOMPARE(arguments.units, QStringList());
    QCOMPARE(arguments.typeColumn, QString());
    QCOMPARE(arguments.nameColumn, QString());
}

void KvCliParserTest::readsCheck()
{
    const KvCliParseResult result = parse(QStringLiteral("check -- -odd.rtp"));
    QCOMPARE(result.kind, KvCliParseResult::Run);
    QCOMPARE(result.arguments.command, KvCliArguments::Check);
    QCOMPARE(result.arguments.templatePath, QStringLiteral("-odd.rtp"));
}

void KvCliParserTest::readsBlocks_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<int>("format");
    QTest::newRow("default") << QStringLiteral("blocks") << int(KvCliArguments::Text);
    QTest::newRow("behind a language") << QStringLiteral("--language de blocks") << int(KvCliArguments::Text);
    QTest::newRow("behind a language, too")
        << QStringLiteral("--language=German -q blocks") << int(KvCliArguments::Text);
    QTest::newRow("text") << QStringLiteral("blocks --format text") << int(KvCliArguments::Text);
    QTest::newRow("json") << QStringLiteral("blocks --format json") << int(KvCliArguments::Json);
}

void KvCliParserTest::readsBlocks()
{
    QFETCH(QString, line);
    QFETCH(int, format);
    const KvCliParseResult result = parse(line);
    QCOMPARE(result.kind, KvCliParseResult::Run);
    QCOMPARE(result.arguments.command, KvCliArguments::Blocks);
    QCOMPARE(int(result.arguments.format), format);
}

void KvCliParserTest::readsDigits_data()
{
    QTest::addColumn<uint>("digits");
    for (const uint digits : {0U, 1U, 15U})
        QTest::newRow(qPrintable(QString::number(digits))) << digits;
}

void KvCliParserTest::readsDigits()
{
    QFETCH(uint, digits);
    const KvCliParseResult result = parse(QStringLiteral("stats --table t --digits %1").arg(digits));
    QCOMPARE(result.kind, KvCliParseResult::Run);
    QCOMPARE(result.arguments.digits, digits);
}

STATREPORT_TEST_MAIN(KvCliParserTest)
#include "KvCliParserTest.moc"
