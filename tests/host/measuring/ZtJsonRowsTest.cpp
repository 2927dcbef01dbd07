// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonRows.h"

#include "measuring/ZtProgress.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtTableImport.h"
#include "support/StatReportTest.h"

#include <QElapsedTimer>

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

bool read(const QByteArray &bytes, ZtImportedTable *table, ZtFault *fault, ZtProgress *progress = nullptr)
{
    return ZtTableImport::parse(bytes, QStringLiteral("t.json"), ZtTableImportOptions(), table, fault,
                                progress);
}

/// Types, objects and values with number and unit as the file has them, one line for each object.
QStringList contents(const ZtImportedTable &table)
{
    QStringList lines;
    for (const auto &type : table.types) {
        for (int row = 0; row < type->rowCount(); ++row) {
            QStringList parts{type->name(), type->rowName(row)};
            for (const ZtImportedCell &cell : type->row(row))
                parts.append(type->values().at(cell.valueIndex).name + QLatin1Char('=') + type->text(cell));
            lines.append(parts.join(QLatin1Char('|')));
        }
    }
    return lines;
}

QByteArray values(const QByteArray &objects)
{
    return "{\"format\":\"statreport-values\",\"version\":1,\"objects\":[\n" + objects + "\n]}\n";
}

QByteArray manyRecords(int count)
{
    QByteArray bytes = "[";
    for (int i = 0; i < count; ++i)
        bytes += (i == 0 ? "{\"Name\":\"A\",\"Length [mm]\":1.5}" : ",{\"Name\":\"A\",\"Length [mm]\":1.5}");
    return bytes + "]";
}

QByteArray manyValues(int count)
{
    QByteArray bytes;
    for (int i = 0; i < count; ++i)
        bytes +=
            (i == 0 ? "" : ",\n") + QByteArray("{\"type\":\"Line\",\"index\":1,\"name\":\"L\",\"values\":["
                                               "{\"name\":\"Length\",\"unit\":\"mm\",\"value\":1.5}]}");
    return values(bytes);
}

} // namespace

/** Tables in JSON, as the import reads them. */
class ZtJsonRowsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void recognizes_data();
    void recognizes();
    void readsTheSameAsSeparatedValues_data();
    void readsTheSameAsSeparatedValues();
    void readsExportedValues();
    void namesThePlace_data();
    void namesThePlace();
    void cutFiles_data();
    void cutFiles();
    void optionsApply();
    void manyRows_data();
    void manyRows();
    void sessionsSayThatThisIsATable();
};

void ZtJsonRowsTest::recognizes_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<bool>("isJson");
    QTest::newRow("list") << QByteArray("[]") << true;
    QTest::newRow("object") << QByteArray(" \r\n\t{") << true;
    QTest::newRow("headings") << QByteArray("a,b") << false;
    QTest::newRow("quoted heading") << QByteArray("\"[mm]\",b") << false;
    QTest::newRow("blank") << QByteArray(" \n") << false;
}

void ZtJsonRowsTest::recognizes()
{
    QFETCH(QByteArray, bytes);
    QFETCH(bool, isJson);
    QCOMPARE(
        ZtJsonRows::recognizes(std::string_view(bytes.constData(), static_cast<std::size_t>(bytes.size()))),
        isJson);
}

void ZtJsonRowsTest::readsTheSameAsSeparatedValues_data()
{
    QTest::addColumn<QByteArray>("json");
    QTest::addColumn<QByteArray>("separated");
    QTest::newRow("tidy") << QByteArray(R"([{"id":1,"variable":"Length","unit":"mm","value":1.20},)"
                                        R"({"id":2,"variable":"Length","unit":"mm","value":"3e1"},)"
                                        R"({"id":2,"variable":"Mass","unit":null,"value":null},)"
                                        R"({"id":3,"variable":"Mass","value":5}])")
                          << QByteArray("id,variable,unit,value\n1,Length,mm,1.20\n2,Length,mm,3e1\n"
                                        "2,Mass,,\n3,Mass,,5\n");
    QTest::newRow("wide")
        << QByteArray(R"([{"Object":"a","Length [mm]":1.2,"Mass [g]":-0},)"
                      R"({"Mass [g]":1E+2,"Object":"b \"c\" \u00e4"}, {"Object":"d","Width_um":7}])")
        << QByteArray("Object,Length [mm],Mass [g],Width_um\na,1.2,-0,\n"
                      "\"b \"\"c\"\" ä\",,1E+2,\nd,,,7\n");
    QTest::newRow("types") << QByteArray(
                                  R"([{"species":"x","n":1},{"species":"y","n":2},{"species":"x","n":3}])")
                           << QByteArray("species,n\nx,1\ny,2\nx,3\n");
    QTest::newRow("keys that are numbers")
        << QByteArray(R"([{"0":1.5,"1":2},{"0":3,"1":4}])") << QByteArray();
    QTest::newRow("texts that are no values")
        << QByteArray(R"([{"a":1,"ok":true},{"a":2,"ok":false}])") << QByteArray("a,ok\n1,true\n2,false\n");
}

void ZtJsonRowsTest::readsTheSameAsSeparatedValues()
{
    QFETCH(QByteArray, json);
    QFETCH(QByteArray, separated);
    ZtImportedTable table;
    ZtFault fault;
    for (const QByteArray &start : {QByteArray(), QByteArray("\xEF\xBB\xBF \n")}) {
        QVERIFY2(read(start + json, &table, &fault), qPrintable(fault.text()));
        if (separated.isEmpty()) {
            // Separated values cannot have such headings.
            QCOMPARE(contents(table), QStringList({text("Object||0=1.5|1=2"), text("Object||0=3|1=4")}));
            continue;
        }
        ZtImportedTable expected;
        QVERIFY2(read(separated, &expected, &fault), qPrintable(fault.text()));
        QCOMPARE(contents(table), contents(expected));
        QCOMPARE(table.notes, expected.notes);
        QVERIFY(!contents(table).isEmpty());
    }
}

void ZtJsonRowsTest::readsExportedValues()
{
    ZtImportedTable table;
    ZtFault fault;
    const QByteArray bytes = values(
        R"({"type":"Line","index":4,"name":"Line 4","values":[{"name":"Length","unit":"mm","value":1.10},)"
        R"({"unit":"","value":3e-7,"name":"n \"q\""}]},)"
        R"({"values":[],"name":"L\tx","index":5,"type":"Line","colour":[{"a":[]}]},)"
        R"({"type":"Circle","index":9,"values":[{"name":"Area","unit":"µm²","value":null}]})");
    QVERIFY2(read(bytes, &table, &fault), qPrintable(fault.text()));
    QCOMPARE(contents(table), QStringList({text("Line|Line 4|Length=1.10 mm|n \"q\"=3e-7"), text("Line|L x"),
                                           text("Circle|Circle 9")}));
    QVERIFY(read(values(""), &table, &fault));
    QCOMPARE(table.objectCount(), 0);
    QCOMPARE(table.notes, QStringList(text("The table has no rows")));
}

void ZtJsonRowsTest::namesThePlace_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("fault");
    const auto row = [](const char *name, const QByteArray &bytes, const char *fault) {
        QTest::newRow(name) << bytes << text("t.json:") + text(fault);
    };
    row("no text", "[{\"a\":1},\n{\"a\":2}\n", "3: The file is not valid JSON (unterminated array)");
    row("not a number", "[{\"a\":NaN}]", "1: The file is not valid JSON (illegal number)");
    row("huge number", "[{\"a\":1e999}]", "1: The file is not valid JSON (illegal number)");
    row("deep", QByteArray(100000, '['), "1: The file is nested too deeply");
    row("rubbish behind", "[{\"a\":1}]x",
        "1: The file is not valid JSON (garbage at the end of the document)");
    row("no records", "[]", "1: The file is empty");
    row("empty records", "[{},{}]", "1: There is no column of numbers");
    row("only texts", "[{\"a\":\"x\"}]", " There is no column of numbers");
    row("numbers", "[1,2]", "1: [0]: This must be an object");
    row("nested", "[{\"a\":1},\n{\"a\":[1]}]", "2: [1].a: This must be a text, a number or null");
    row("twice", "[{\"a\":1,\n\"a\":2}]", "2: [0].a: This name comes twice");
    row("text among numbers", "[{\"a\":1},{\"a\":2},\n{\"a\":\"six\"}]", "2: [2].a: \"six\" is not a number");
    row("too large in base units", "[{\"a [m]\":1e305}]", "1: [0].a [m]: \"1e305\" is not a finite number");
    row("same value twice",
        "[{\"id\":1,\"variable\":\"a\",\"value\":1},\n{\"id\":1,\"variable\":\"a\",\"value\":2}]",
        "2: \"Object 1\" already has a value \"a\" in line 1");
    row("session", "{\"format\":\"statreport-session\"}", " This file is a session, not a table; open it");
    row("other object", "{\"a\":{\"0\":1}}",
        " The file is neither a list of records nor an export of values");
    row("newer", "{\"format\":\"statreport-values\",\"version\":2,\"objects\":[]}",
        "1: version: The table is of version 2; this program reads version 1");
    row("no version", "{\"format\":\"statreport-values\",\"objects\":[]}",
        "1: version: This must be a number");
    row("no objects", "{\"format\":\"statreport-values\",\"version\":1}", "1: objects: This must be a list");
    row("objects twice", "{\"format\":\"statreport-values\",\"version\":1,\"objects\":[],\"objects\":[]}",
        "1: objects: This name comes twice");
    row("object that is none", values("7"), "2: objects[0]: This must be an object");
    row("no values", values("{\"type\":\"a\"}"), "2: objects[0].values: This must be a list");
    row("value that is none", values("{\"values\":[7]}"), "2: objects[0].values[0]: This must be an object");
    row("value without a name", values("{\"values\":[{\"value\":7}]}"),
        "2: objects[0].values[0].name: The value has no name");
    row("value of a text", values("{\"values\":[]},\n{\"values\":[{\"name\":\"a\",\"value\":\"x\"}]}"),
        "3: objects[1].values[0].value: \"x\" is not a number");
    row("nested value", values("{\"values\":[{\"name\":\"a\",\"value\":{}}]}"),
        "2: objects[0].values[0].value: This must be a text, a number or null");
    row("nested name", values("{\"name\":[],\"values\":[]}"),
        "2: objects[0].name: This must be a text, a number or null");
    row("value twice", values("{\"values\":[{\"name\":\"a\",\"name\":\"b\"}]}"),
        "2: objects[0].values[0].name: This name comes twice");
    row("another unit",
        values("{\"values\":[{\"name\":\"a\",\"unit\":\"mm\",\"value\":1},\n{\"name\":\"a\",\"unit\":\"g\","
               "\"value\":1}]}"),
        "3: objects[0].values[1].unit: \"a\" of \"Object\" is given in \"g\" here, but in \"mm\" before");
    QByteArray different = "[";
    for (int i = 0; i < 20000; ++i)
        different += "{\"" + QByteArray::number(i) + "\":1},";
    different.back() = ']';
    row("names of their own", different, "1: The records have too many different names");
}

void ZtJsonRowsTest::namesThePlace()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, fault);
    ZtImportedTable table;
    table.notes = QStringList(QStringLiteral("untouched"));
    ZtFault found;
    QVERIFY(!read(bytes, &table, &found));
    QString plain = found.text();
    plain.remove(QChar(0x2066)).remove(QChar(0x2069));
    QCOMPARE(plain, fault);
    QCOMPARE(table.notes, QStringList(QStringLiteral("untouched")));
    QVERIFY(table.types.isEmpty());
}

void ZtJsonRowsTest::cutFiles_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("records") << QByteArray(R"([{"Name":"A\u00e4","L":1.5e2},{"Name":null,"L":true}])");
    QTest::newRow("values") << values(
        R"({"type":"a","index":1,"name":"ä","values":[{"name":"x","value":1}]})");
}

void ZtJsonRowsTest::cutFiles()
{
    QFETCH(QByteArray, bytes);
    bytes = bytes.trimmed();
    for (int size = 1; size < bytes.size(); ++size) {
        ZtImportedTable table;
        ZtFault fault;
        QVERIFY(!read(bytes.left(size), &table, &fault));
        QVERIFY(!fault.isNull());
    }
}

void ZtJsonRowsTest::optionsApply()
{
    ZtTableImportOptions options;
    options.units = QStringList(QStringLiteral("um"));
    options.typeColumn = QStringLiteral("kind");
    options.nameColumn = QStringLiteral("who");
    // Numbers of JSON have a point, whatever the texts of other files have.
    options.decimalMark = ZtTableImportOptions::Comma;
    ZtImportedTable table;
    ZtFault fault;
    QVERIFY(ZtTableImport::parse(R"([{"kind":"k","who":"w","a":1.5}])", QString(), options, &table, &fault));
    QCOMPARE(contents(table), QStringList(text("k|w|a=1.5 \u03BCm")));
}

void ZtJsonRowsTest::manyRows_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("records") << manyRecords(200000);
    QTest::newRow("values") << manyValues(200000);
}

void ZtJsonRowsTest::manyRows()
{
    QFETCH(QByteArray, bytes);
    ZtImportedTable table;
    ZtFault fault;
    ZtProgress progress;
    QVERIFY2(read(bytes, &table, &fault, &progress), qPrintable(fault.text()));
    QCOMPARE(table.objectCount(), 200000);
    QVERIFY(progress.fraction() > 0.85);
    ZtProgress cancelled;
    cancelled.cancel();
    ZtImportedTable none;
    QVERIFY(!read(bytes, &none, &fault, &cancelled));
    QCOMPARE(fault.message, text("Reading was cancelled"));
    QCOMPARE(none.objectCount(), 0);
}

void ZtJsonRowsTest::sessionsSayThatThisIsATable()
{
    ZtSession session;
    ZtFault fault;
    QVERIFY(!ZtSession::parse(values(""), QStringLiteral("v.json"), &session, &fault));
    QCOMPARE(fault.message, text("This file is a table of values; import it"));
}

STATREPORT_TEST_MAIN(ZtJsonRowsTest)

#include "ZtJsonRowsTest.moc"
