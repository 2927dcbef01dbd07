// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "endtoend/StatReportProgram.h"
#include "endtoend/TemplateFile.h"

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

QStringList words(const char *line)
{
    return text(line).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

const char oldContent[] = "what was there before";

} // namespace

/** Runs in a folder of small files, so that messages name them without a path. */
class StatReportProgramTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();
    void init();
    void cleanup();

    void saysWhatIsWrong_data();
    void saysWhatIsWrong();
    void writesErrorsAsJson_data();
    void writesErrorsAsJson();
    void leavesTheOutputAlone_data();
    void leavesTheOutputAlone();
    void speaksTheLanguage_data();
    void speaksTheLanguage();
    void writesNoMarksOfDirection();
    void programsReadEnglish();
    void readsTablesAlike();
    void showsHelp_data();
    void showsHelp();
    void tellsWhenTheOutputIsFull_data();
    void tellsWhenTheOutputIsFull();
    void replacesTheOutput();
    void keepsPermissions();
    void writesThroughLinks();
    void writesIntoDevices();
    void readsStandardInput_data();
    void readsStandardInput();
    void writesToStandardOutput();
    void makesTheSamePages();
    void isQuiet();
    void notesMissingGlyphs();
    void checksTemplates();
    void listsBlocks();

private:
    ProgramResult run(const char *line, const QByteArray &input = QByteArray())
    {
        return StatReportProgram::run(words(line), input, m_folder->path());
    }
    QString path(const char *name) const { return m_folder->filePath(text(name)); }
    QStringList files() const
    {
        return QDir(m_folder->path()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
    }

    std::unique_ptr<QTemporaryDir> m_folder;
};

void StatReportProgramTest::initTestCase()
{
    for (const char *tool : {"pdftotext", "pdftoppm", "qpdf"})
        QVERIFY2(!QStandardPaths::findExecutable(text(tool)).isEmpty(), tool);
}

void StatReportProgramTest::init()
{
    StatReportTest::init();
    m_folder = std::make_unique<QTemporaryDir>();
    QVERIFY(m_folder->isValid());
    const QJsonArray blocks{TemplateFile::textBlock(text("<p>Before</p>")), TemplateFile::tableBlock()};
    const auto write = [this](const char *name, const QByteArray &bytes) {
        QVERIFY2(TemplateFile::write(path(name), bytes), name);
    };
    write("good.rtp", TemplateFile::bytes(blocks, text("<p>Head</p>"), text("<p>Foot</p>")));
    write("good.csv", "name,length_mm\nA,1.5\nB,2.5\n");
    write("good.json",
          "{\"format\": \"statreport-session\", \"version\": 1, \"micrometresPerPixel\": 1000, \"objects\": "
          "[{\"type\": \"line\", \"id\": 1, \"points\": [[0, 0], [3, 4]]}]}");
    write("empty", "");
    write("truncated.rtp", "{\"config\": {\n");
    write("deep", QByteArray(5000, '['));
    write("list.json", "[]");
    write("typed.rtp",
          TemplateFile::bytes({QJsonObject{{text("name"), text("Text Document")}, {text("config"), 5}}}));
    write("warned.rtp",
          TemplateFile::bytes({QJsonObject{{text("name"), text("Pie")}}, TemplateFile::tableBlock()}));
    write("typed.json",
          "{\"format\": \"statreport-session\", \"version\": 1, \"objects\": [{\"type\": \"line\", \"id\": "
          "1, \"points\": [[0, 0], \"x\"]}]}");
    write("truncated.json", "{\"format\": \"statreport-session\",\n\"version\":");
    write("word.csv", "name,length_mm\nA,1.5\nB,oops\n");
    write("records.json", "[{\"name\":\"A\",\"length_mm\":1.5},\n{\"name\":\"B\",\"length_mm\":2.5}]");
    write("word.json", "[{\"name\":\"A\",\"length_mm\":1.5},\n{\"name\":\"B\",\"length_mm\":\"oops\"},"
                       "{\"name\":\"C\",\"length_mm\":2}]");
    write("values.json",
          "{\"format\":\"statreport-values\",\"version\":1,\"objects\":[\n"
          "{\"type\":\"Object\",\"index\":1,\"name\":\"A\",\"values\":[{\"name\":\"length\",\"unit\":\"mm\","
          "\"value\":1.5}]},\n"
          "{\"type\":\"Object\",\"index\":2,\"name\":\"B\",\"values\":[{\"name\":\"length\",\"unit\":\"mm\","
          "\"value\":2.5}]}\n]}\n");
    write("ragged.csv", "name,length_mm\nA,1.5\nB\n");
    write("out.pdf", oldContent);
    QVERIFY(QDir(m_folder->path()).mkdir(text("folder")));
}

void StatReportProgramTest::cleanup()
{
    m_folder.reset();
    StatReportTest::cleanup();
}

void StatReportProgramTest::saysWhatIsWrong_data()
{
    QTest::addColumn<int>("exitCode");
    QTest::addColumn<QString>("error");
    const auto add = [](const char *line, int exitCode, const char *error) {
        QTest::newRow(line) << exitCode << text(error);
    };
    const char *more = " (statreport --help tells more)";
    add("", 2, (QByteArray("a command is missing: render, stats, check or blocks") + more).constData());
    add("frob", 2,
        (QByteArray("unknown command \"frob\"; it must be render, stats, check or blocks") + more)
            .constData());
    add("render good.rtp --table good.csv", 2,
        (QByteArray("the file to write is missing: -o OUT.pdf") + more).constData());
    add("stats --table good.csv --frob", 2, (QByteArray("Unknown option 'frob'.") + more).constData());

    add("check missing.rtp", 1, "missing.rtp: cannot be opened: No such file or directory");
    add("check empty", 1, "empty:1:1: is no JSON: illegal value");
    add("check truncated.rtp", 1, "truncated.rtp:2:1: is no JSON: unterminated object");
    add("check deep", 1, "deep:1:1026: is no JSON: too deeply nested document");
    add("check typed.rtp", 1, "typed.rtp: nodes[0].config: is a number, not an object");
    add("check list.json", 1, "list.json: is no template: the JSON document is no object");
    add("render missing.rtp --table good.csv -o out.pdf", 1,
        "missing.rtp: cannot be opened: No such file or directory");
    add("render deep --table good.csv -o out.pdf", 1, "deep:1:1026: is no JSON: too deeply nested document");
    add("render typed.rtp --table good.csv -o out.pdf", 1,
        "typed.rtp: nodes[0].config: is a number, not an object");

    add("stats --table missing.csv", 1, "missing.csv: The file does not exist");
    add("stats --table folder", 1, "folder: This is a folder, not a file");
    add("stats --table empty", 1, "empty: The file is empty");
    add("stats --table word.csv", 1, "word.csv:3:2: \"oops\" is not a number");
    add("stats --table ragged.csv", 1,
        "ragged.csv:3:2: The row and the header differ in their number of fields (1 and 2)");
    add("stats --table good.csv --unit Width=mm", 1,
        "good.csv: There is no value \"Width\" to give a unit; the values are \"length\"");
    add("stats --table good.csv --type-column Kind", 1,
        "good.csv:1: There is no column \"Kind\"; the columns are \"name\", \"length_mm\"");
    add("render good.rtp --table word.csv -o out.pdf", 1, "word.csv:3:2: \"oops\" is not a number");

    add("stats --table list.json", 1, "list.json:1: The file is empty");
    add("stats --table good.json", 1, "good.json: This file is a session, not a table; open it");
    add("stats --table truncated.json", 1, "truncated.json:2: The file is not valid JSON (");
    add("stats --table deep", 1, "deep:1: The file is nested too deeply");
    add("stats --table word.json", 1, "word.json:2: [1].length_mm: \"oops\" is not a number");
    add("render good.rtp --table word.json -o out.pdf", 1,
        "word.json:2: [1].length_mm: \"oops\" is not a number");
    add("stats --session values.json", 1, "values.json: format: This file is a table of values; import it");

    add("stats --session missing.json", 1, "missing.json: The file does not exist");
    add("stats --session folder", 1, "folder: This is a folder, not a file");
    add("stats --session deep", 1, "deep:1: The file is nested too deeply");
    add("stats --session truncated.json", 1, "truncated.json:2: The file is not valid JSON (");
    add("stats --session list.json", 1, "list.json: The file is not a session");
    add("stats --session good.rtp", 1, "good.rtp: format: The file is not a session");
    add("stats --session typed.json", 1,
        "typed.json: objects[0].points[1]: A point must be a list of two numbers between -1e9 and 1e9");

    add("render good.rtp --table good.csv --image missing.png -o out.pdf", 1,
        "missing.png: The picture does not exist");
    add("render good.rtp --table good.csv --image folder -o out.pdf", 1,
        "folder: This is a folder, not a picture");
    add("render good.rtp --table good.csv --image good.csv -o out.pdf", 1,
        "good.csv: The picture cannot be decoded (Unsupported image format)");
    add("render good.rtp --table good.csv -o folder", 1, "folder: cannot be written: is a directory");
    add("render good.rtp --table good.csv -o nowhere/out.pdf", 1,
        "nowhere/out.pdf: cannot be written: No such file or directory");
    add("render good.rtp --table good.csv -o /dev/full", 1,
        "/dev/full: cannot be written: No space left on device");
    // Nobody, not even the administrator, can make files there.
    add("render good.rtp --table good.csv -o /proc/out.pdf", 1,
        "/proc/out.pdf: cannot be written: No such file or directory");
}

void StatReportProgramTest::saysWhatIsWrong()
{
    QFETCH(int, exitCode);
    QFETCH(QString, error);
    const QStringList before = files();
    const ProgramResult result = run(QTest::currentDataTag());
    QVERIFY2(result.errors.startsWith(QLatin1String("statreport: ") + error), qPrintable(result.errors));
    QVERIFY2(error.endsWith(QLatin1Char('(')) ||
                 result.errors == QLatin1String("statreport: ") + error + QLatin1Char('\n'),
             qPrintable(result.errors));
    QCOMPARE(result.errors.count(QLatin1Char('\n')), 1);
    QCOMPARE(result.exitCode, exitCode);
    QCOMPARE(files(), before);
    QCOMPARE(TemplateFile::read(path("out.pdf")), QByteArray(oldContent));
}

void StatReportProgramTest::writesErrorsAsJson_data()
{
    QTest::addColumn<QJsonObject>("error");
    const auto add = [](const char *line, const QJsonObject &error) { QTest::newRow(line) << error; };
    const QString message = text("message");
    const QString file = text("file");
    add("frob --json-errors",
        {{message, text("unknown command \"frob\"; it must be render, stats, check or blocks "
                        "(statreport --help tells more)")}});
    add("check missing.rtp --json-errors",
        {{message, text("cannot be opened: No such file or directory")}, {file, text("missing.rtp")}});
    add("check truncated.rtp --json-errors", {{message, text("is no JSON: unterminated object")},
                                              {file, text("truncated.rtp")},
                                              {text("line"), 2},
                                              {text("column"), 1}});
    add("stats --table word.csv --json-errors", {{message, text("\"oops\" is not a number")},
                                                 {file, text("word.csv")},
                                                 {text("line"), 3},
                                                 {text("column"), 2}});
    add("stats --json-errors --session typed.json",
        {{message, text("A point must be a list of two numbers between -1e9 and 1e9")},
         {file, text("typed.json")},
         {text("place"), text("objects[0].points[1]")}});
    add("render good.rtp --table good.csv -o folder --json-errors",
        {{message, text("cannot be written: is a directory")}, {file, text("folder")}});
}

void StatReportProgramTest::writesErrorsAsJson()
{
    QFETCH(QJsonObject, error);
    const ProgramResult result = run(QTest::currentDataTag());
    QVERIFY(result.exitCode == 1 || result.exitCode == 2);
    QCOMPARE(result.errors.count(QLatin1Char('\n')), 1);
    QVERIFY(result.errors.endsWith(QLatin1Char('\n')));
    QCOMPARE(QJsonDocument::fromJson(result.errors.toUtf8()).object(), (QJsonObject{{text("error"), error}}));
}

void StatReportProgramTest::leavesTheOutputAlone_data()
{
    QTest::addColumn<QString>("target");
    QTest::newRow("existing") << text("out.pdf");
    QTest::newRow("new") << text("new.pdf");
}

void StatReportProgramTest::leavesTheOutputAlone()
{
    QFETCH(QString, target);
    const QStringList before = files();
    for (const char *line : {"render typed.rtp --table good.csv -o", "render good.rtp --table word.csv -o",
                             "render good.rtp --session typed.json -o",
                             "render good.rtp --table good.csv --image good.csv -o"}) {
        const ProgramResult result = run((QByteArray(line) + ' ' + target.toUtf8()).constData());
        QCOMPARE(result.exitCode, 1);
        QCOMPARE(files(), before);
        QCOMPARE(TemplateFile::read(path("out.pdf")), QByteArray(oldContent));
    }
}

void StatReportProgramTest::speaksTheLanguage_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QString>("errors");
    const auto row = [](const char *variables, const char *line, const char *errors) {
        QTest::newRow(variables) << text(line) << text(errors);
    };
    row("LC_ALL=de_DE.UTF-8", "check", "statreport: die Vorlage fehlt (weitere Hilfe: statreport --help)\n");
    row("LC_ALL=|LANG=fr_FR.UTF-8", "check none.rtp --language es",
        "statreport: none.rtp: no se puede abrir: no existe el fichero o el directorio\n");
    row("LC_ALL=it_IT.UTF-8|LANGUAGE=de:fr", "stats --frob",
        "statreport: Unbekannte Option \u201Efrob\u201C. (weitere Hilfe: statreport --help)\n");
    // A fault that the measuring library found.
    row("LANG=C", "stats --table none.csv --language de",
        "statreport: none.csv: Die Datei ist nicht vorhanden\n");
    row("LC_ALL=tlh", "check", "statreport: the template is missing (statreport --help tells more)\n");
}

void StatReportProgramTest::speaksTheLanguage()
{
    QFETCH(QString, line);
    QFETCH(QString, errors);
    const QStringList variables = QString::fromLatin1(QTest::currentDataTag()).split(QLatin1Char('|'));
    const ProgramResult result =
        StatReportProgram::runWith(variables, line.split(QLatin1Char(' ')), m_folder->path());
    QCOMPARE(result.errors, errors);
    QVERIFY(result.exitCode > 0);
}

/// Messages go to files and to terminals, which order texts as they can.
void StatReportProgramTest::writesNoMarksOfDirection()
{
    const QString table = QFileInfo(path("none.csv")).absoluteFilePath();
    const ProgramResult arabic = StatReportProgram::runWith(
        {text("LC_ALL=ar_EG.UTF-8")}, {text("stats"), text("--table"), table}, m_folder->path());
    QVERIFY2(arabic.errors.startsWith(text("statreport: ") + table + text(": ")), qPrintable(arabic.errors));
    QVERIFY(arabic.errors.contains(QChar(0x0627))); // it is Arabic
}

/// What programs read is the same in every language, what people read is not.
void StatReportProgramTest::programsReadEnglish()
{
    for (const char *line : {"stats --table good.csv --format csv", "stats --table good.csv --format json",
                             "blocks --format text", "blocks --format json"}) {
        const ProgramResult english = run(line);
        const ProgramResult german =
            StatReportProgram::runWith({text("LC_ALL=de_DE.UTF-8")}, words(line), m_folder->path());
        QCOMPARE(german.exitCode, 0);
        QCOMPARE(german.output, english.output);
    }
    const ProgramResult german = StatReportProgram::runWith(
        {text("LC_ALL=de_DE.UTF-8")}, words("stats --table good.csv"), m_folder->path());
    QVERIFY2(german.output.startsWith("Objekttyp"), german.output.constData());
    const ProgramResult fault = StatReportProgram::runWith(
        {text("LC_ALL=de_DE.UTF-8")}, words("stats --table none.csv --json-errors"), m_folder->path());
    QVERIFY2(fault.errors.startsWith(QLatin1String("{\"error\":{\"file\":\"none.csv\",\"message\":")),
             qPrintable(fault.errors));
}

void StatReportProgramTest::readsTablesAlike()
{
    const ProgramResult expected = run("stats --table good.csv --format json");
    QCOMPARE(expected.exitCode, 0);
    for (const char *line :
         {"stats --table records.json --format json", "stats --table values.json --format json"}) {
        const ProgramResult result = run(line);
        QCOMPARE(result.errors, QString());
        QCOMPARE(result.output, expected.output);
    }
    const ProgramResult piped = run("stats --table - --format json", TemplateFile::read(path("values.json")));
    QCOMPARE(piped.output, expected.output);
    QCOMPARE(run("render good.rtp --table values.json -o new.pdf").exitCode, 0);
    QVERIFY(TemplateFile::read(path("new.pdf")).startsWith("%PDF"));
}

void StatReportProgramTest::showsHelp_data()
{
    QTest::addColumn<QByteArray>("start");
    QTest::newRow("--help") << QByteArray("Usage: statreport COMMAND [options]\n");
    QTest::newRow("-v") << QByteArray("statreport ");
    QTest::newRow("render --help") << QByteArray("Usage: statreport render [options] TEMPLATE.rtp\n");
    QTest::newRow("stats --help") << QByteArray("Usage: statreport stats [options]\n");
    QTest::newRow("check -h") << QByteArray("Usage: statreport check [options] TEMPLATE.rtp\n");
    QTest::newRow("blocks -h") << QByteArray("Usage: statreport blocks [options]\n");
}

void StatReportProgramTest::showsHelp()
{
    QFETCH(QByteArray, start);
    const ProgramResult result = run(QTest::currentDataTag());
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    QVERIFY2(result.output.startsWith(start), result.output.constData());
}

void StatReportProgramTest::tellsWhenTheOutputIsFull_data()
{
    QTest::addColumn<QString>("line");
    for (const char *line : {"--help", "blocks", "check %1/good.rtp", "stats --table %1/good.csv",
                             "render %1/good.rtp --table %1/good.csv -o -"})
        QTest::newRow(line) << text(line);
}

void StatReportProgramTest::tellsWhenTheOutputIsFull()
{
    QFETCH(QString, line);
    line.replace(QLatin1String("%1"), m_folder->path());
    const ProgramResult result = StatReportProgram::runInto(text("/dev/full"), line.split(QLatin1Char(' ')));
    QCOMPARE(result.errors,
             text("statreport: <standard output>: cannot be written: No space left on device\n"));
    QCOMPARE(result.exitCode, 1);
}

void StatReportProgramTest::replacesTheOutput()
{
    const QStringList before = files();
    const ProgramResult result = run("render good.rtp --table good.csv -o out.pdf");
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    QCOMPARE(result.output, QByteArray());
    QVERIFY(TemplateFile::read(path("out.pdf")).startsWith("%PDF-"));
    QCOMPARE(files(), before);
}

void StatReportProgramTest::keepsPermissions()
{
    const QFileDevice::Permissions owner = QFileDevice::ReadOwner | QFileDevice::WriteOwner;
    QVERIFY(QFile::setPermissions(path("out.pdf"), owner));
    const QFileDevice::Permissions before = QFile::permissions(path("out.pdf"));
    QCOMPARE(run("render good.rtp --table good.csv -o out.pdf").exitCode, 0);
    QCOMPARE(QFile::permissions(path("out.pdf")), before);
    // A new file is as any other that this user's programs make.
    QCOMPARE(run("render good.rtp --table good.csv -o new.pdf").exitCode, 0);
    QCOMPARE(QFile::permissions(path("new.pdf")), QFile::permissions(path("good.csv")));
}

void StatReportProgramTest::writesThroughLinks()
{
    QVERIFY(QFile::link(text("out.pdf"), path("link.pdf")));
    QCOMPARE(run("render good.rtp --table good.csv -o link.pdf").exitCode, 0);
    QVERIFY(QFileInfo(path("link.pdf")).isSymLink());
    QVERIFY(TemplateFile::read(path("out.pdf")).startsWith("%PDF-"));
}

void StatReportProgramTest::writesIntoDevices()
{
    const ProgramResult result = run("render good.rtp --table good.csv -o /dev/null");
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    QVERIFY(!QFileInfo(text("/dev/null")).isFile());
}

void StatReportProgramTest::readsStandardInput_data()
{
    QTest::addColumn<QString>("input");
    QTest::addColumn<QString>("expected");
    QTest::newRow("render - --table good.csv -o out.pdf") << text("good.rtp") << text("2.5 mm");
    QTest::newRow("render good.rtp --table - -o out.pdf") << text("good.csv") << text("2.5 mm");
    QTest::newRow("render good.rtp --session - -o out.pdf") << text("good.json") << text("Line 1");
    QTest::newRow("check -") << text("good.rtp") << text("block \"Measurement table\"");
    QTest::newRow("stats --table -") << text("good.csv") << text("length");
    QTest::newRow("stats --session -") << text("good.json") << text("Line");
}

void StatReportProgramTest::readsStandardInput()
{
    QFETCH(QString, input);
    QFETCH(QString, expected);
    const ProgramResult result = run(QTest::currentDataTag(), TemplateFile::read(m_folder->filePath(input)));
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    QString shown = QString::fromUtf8(result.output);
    if (shown.isEmpty())
        shown = QString::fromUtf8(
            StatReportProgram::runProgram(text("pdftotext"), {text("-layout"), path("out.pdf"), text("-")})
                .output);
    QVERIFY2(shown.contains(expected), qPrintable(shown));

    const ProgramResult faulty = run(QTest::currentDataTag(), "\"");
    QCOMPARE(faulty.exitCode, 1);
    QVERIFY2(faulty.errors.startsWith(QLatin1String("statreport: <standard input>")),
             qPrintable(faulty.errors));
    QCOMPARE(faulty.errors.count(QLatin1Char('\n')), 1);
}

void StatReportProgramTest::writesToStandardOutput()
{
    const ProgramResult result = run("render good.rtp --table good.csv -o -");
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    QVERIFY(result.output.startsWith("%PDF-"));
    QVERIFY(result.output.trimmed().endsWith("%%EOF"));
    QVERIFY(TemplateFile::write(path("copy.pdf"), result.output));
    const ProgramResult checked =
        StatReportProgram::runProgram(text("qpdf"), {text("--check"), path("copy.pdf")});
    QVERIFY2(checked.exitCode == 0, qPrintable(checked.errors));
    // A failing one leaves standard output empty.
    QCOMPARE(run("render good.rtp --table word.csv -o -").output, QByteArray());
}

void StatReportProgramTest::makesTheSamePages()
{
    QByteArray table("type,name,length_mm,area_mm2\n");
    for (int i = 0; i < 60; ++i)
        table += "T" + QByteArray::number(i % 7) + ",N" + QByteArray::number(i) + ",1.5,2\n";
    QVERIFY(TemplateFile::write(path("long.csv"), table));
    QByteArray texts[2];
    QByteArray pixels[2];
    for (int i = 0; i < 2; ++i) {
        const QByteArray name = "same" + QByteArray::number(i) + ".pdf";
        QCOMPARE(run(("render good.rtp --table long.csv -o " + name).constData()).exitCode, 0);
        texts[i] = StatReportProgram::runProgram(text("pdftotext"),
                                                 {text("-layout"), path(name.constData()), text("-")})
                       .output;
        pixels[i] =
            StatReportProgram::runProgram(text("pdftoppm"), {text("-r"), text("50"), path(name.constData())})
                .output;
    }
    QVERIFY(texts[0].contains("N59"));
    QVERIFY(pixels[0].size() > 500000);
    QCOMPARE(texts[1], texts[0]);
    QVERIFY(pixels[1] == pixels[0]);
}

void StatReportProgramTest::isQuiet()
{
    const char *note =
        "statreport: note: warned.rtp: nodes[0]: there is no block type \"Pie\"; the block is skipped\n";
    const ProgramResult loud = run("render warned.rtp --table good.csv -o out.pdf");
    QCOMPARE(loud.errors, text(note));
    QCOMPARE(loud.exitCode, 0);
    for (const char *line : {"render warned.rtp --table good.csv -o out.pdf --quiet",
                             "render warned.rtp -q --table good.csv -o out.pdf"}) {
        const ProgramResult quiet = run(line);
        QCOMPARE(quiet.errors, QString());
        QCOMPARE(quiet.exitCode, 0);
    }
    // Errors are told nevertheless.
    QCOMPARE(run("stats --table word.csv --quiet").errors,
             text("statreport: word.csv:3:2: \"oops\" is not a number\n"));
}

void StatReportProgramTest::notesMissingGlyphs()
{
    // A code point that no font has: it is for private use.
    QVERIFY(TemplateFile::write(path("private.csv"), "name,length_mm\nA\xF4\x8F\xBF\xBD,1\n"));
    const ProgramResult result = run("render good.rtp --table private.csv -o out.pdf");
    QCOMPARE(result.exitCode, 0);
    QVERIFY2(result.errors.startsWith(
                 QLatin1String("statreport: note: No installed font has these characters, the report leaves "
                               "them out: ")),
             qPrintable(result.errors));
    QCOMPARE(result.errors.count(QLatin1Char('\n')), 1);
}

void StatReportProgramTest::checksTemplates()
{
    const ProgramResult result = run("check warned.rtp");
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    QCOMPARE(QString::fromUtf8(result.output),
             text("page width 952 px\npageNumbering\nblock \"Measurement table\"\n"
                  "warning: nodes[0]: there is no block type \"Pie\"; the block is skipped\n"));
}

void StatReportProgramTest::listsBlocks()
{
    const ProgramResult listed = run("blocks");
    QCOMPARE(listed.exitCode, 0);
    QCOMPARE(listed.errors, QString());
    QVERIFY(listed.output.contains("Text Document\n    text = \"\"\n"));
    QVERIFY(listed.output.contains("Measurement table\n    alignment = "));
    const ProgramResult json = run("blocks --format json");
    QCOMPARE(json.exitCode, 0);
    const QJsonArray blocks = QJsonDocument::fromJson(json.output).object().value(text("blocks")).toArray();
    QStringList names;
    for (const QJsonValue &block : blocks) {
        names.append(block.toObject().value(text("name")).toString());
        QCOMPARE(block.toObject().keys(), QStringList({text("config"), text("name"), text("title")}));
        QVERIFY(!block.toObject().value(text("config")).toObject().isEmpty());
    }
    QCOMPARE(names, QStringList({text("Image View"), text("Camera Image View"), text("Text Document"),
                                 text("Measurement table"), text("Statistics Table"), text("MinMedMaxBox"),
                                 text("Trend"), text("Counters")}));
    // The same on every run, whatever the order in which sets are kept.
    QCOMPARE(run("blocks --format json").output, json.output);
}

STATREPORT_TEST_MAIN(StatReportProgramTest)
#include "StatReportProgramTest.moc"
