// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtTableImport.h"

#include <QBuffer>
#include <QElapsedTimer>
#include <QSignalSpy>
#include <QTextCodec>

namespace {

using Options = ZtTableImportOptions;

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

QStringList list(const char *utf8)
{
    return text(utf8).split(QLatin1Char('|'));
}

Options withUnits(const QStringList &units)
{
    Options options;
    options.units = units;
    return options;
}

Options withColumns(const char *type, const char *name)
{
    Options options;
    options.typeColumn = text(type);
    options.nameColumn = text(name);
    return options;
}

/// One line per object: type, number, own name in quotes, and its values with their texts.
QStringList describe(const ZtImportedTable &table)
{
    QStringList lines;
    for (const auto &type : table.types) {
        for (int row = 0; row < type->rowCount(); ++row) {
            QString line = QStringLiteral("%1 %2").arg(type->name()).arg(row + 1);
            if (!type->rowName(row).isNull())
                line += QStringLiteral(" \"%1\"").arg(type->rowName(row));
            line += QLatin1Char(':');
            for (const ZtImportedCell &cell : type->row(row))
                line +=
                    QStringLiteral(" %1=%2;").arg(type->values().at(cell.valueIndex).name, type->text(cell));
            lines.append(line);
        }
    }
    return lines;
}

ZtImportedTable parse(const QByteArray &bytes, const Options &options = Options())
{
    ZtImportedTable table;
    ZtFault fault;
    if (!ZtTableImport::parse(bytes, text("t.csv"), options, &table, &fault))
        table.notes.append(text("FAULT ") + fault.text());
    return table;
}

ZtImportedTable readTable(const char *name, const Options &options = Options())
{
    ZtImportedTable table;
    ZtFault fault;
    const QString path = StatReportTest::sourcePath(text("tests/host/measuring/tables/") + text(name));
    if (!ZtTableImport::readFile(path, options, &table, &fault))
        table.notes.append(text("FAULT ") + fault.text());
    return table;
}

QByteArray utf16(const QString &text, const char *codec)
{
    QTextCodec::ConverterState withoutMark(QTextCodec::IgnoreHeader);
    return QTextCodec::codecForName(codec)->fromUnicode(text.constData(), text.size(), &withoutMark);
}

} // namespace

class ZtTableImportTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();
    void readsTidyTables();
    void readsTidyTablesWithoutObjects();
    void readsTidyTablesOfMixedUnits();
    void readsWideTables();
    void readsResults();
    void readsResultsWithUnits();
    void readsResultsWithATypeColumn();
    void readsClassIndexTables();
    void readsDecimalCommas();
    void readsAllScripts();
    void findsColumns_data();
    void findsColumns();
    void namesObjects_data();
    void namesObjects();
    void namesValues_data();
    void namesValues();
    void notesWhatItLeavesOut_data();
    void notesWhatItLeavesOut();
    void readsAllEncodings_data();
    void readsAllEncodings();
    void readsAllLineEnds();
    void readsDevices();
    void makesTypesAndObjects();
    void readsLongCells();
    void isFast();
};

void ZtTableImportTest::initTestCase()
{
    // What spies of created objects have to know.
    qRegisterMetaType<const ZtKernelObjectData *>("const ZtKernelObjectData*");
}

void ZtTableImportTest::readsTidyTables()
{
    const ZtImportedTable table = readTable("tidy.csv");
    QCOMPARE(table.notes, QStringList());
    QCOMPARE(describe(table),
             list("Leaf 1: Length=5.10 cm; Width=3.5 cm;|Leaf 2: Length=49 mm;|Stem 1: Length=12.25 cm;"));
    QCOMPARE(table.objectCount(), 3);
    QCOMPARE(table.types.first()->cell(0, 0)->value, 51000.0);
    QCOMPARE(table.types.first()->cell(1, 0)->value, 49000.0);
}

void ZtTableImportTest::readsTidyTablesWithoutObjects()
{
    const QByteArray bytes = "measurement,value\nLength,1\nLength,2\nWidth,3\nLength,4\nWidth,5\n";
    QCOMPARE(describe(parse(bytes)),
             list("Object 1: Length=1; Width=3;|Object 2: Length=2; Width=5;|Object 3: Length=4;"));
    QCOMPARE(
        describe(parse(bytes, withUnits({text("mm"), text("width=cm")}))),
        list("Object 1: Length=1 mm; Width=3 cm;|Object 2: Length=2 mm; Width=5 cm;|Object 3: Length=4 mm;"));
}

void ZtTableImportTest::readsTidyTablesOfMixedUnits()
{
    const ZtImportedTable table =
        parse("object,value_name,unit,value\nb,Width,cm,1\na,Length,mm,5\nb,Length,cm,2\n");
    QCOMPARE(describe(table), list("Object 1 \"b\": Width=1 cm; Length=2 cm;|Object 2 \"a\": Length=5 mm;"));
    QCOMPARE(table.types.first()->values().at(1).unit.text(), text("mm"));
}

void ZtTableImportTest::readsWideTables()
{
    const ZtImportedTable table = readTable("wide.csv");
    QCOMPARE(describe(table), list("Tern 1: wing length=39.1 mm; body mass=3750 g; year=2007;|"
                                   "Tern 2: year=2007;|"
                                   "Tern 3: wing length=40.3 mm; body mass=3250 g; year=2009;|"
                                   "Gull 1: wing length=46.5 mm; body mass=4500 g; year=2008;"));
    QCOMPARE(table.notes, QStringList(text("Columns \"place\", \"sex\" hold text and were left out")));
    QCOMPARE(table.types.first()->unit(*table.types.first()->cell(0, 1)).kind(),
             int(ZtGsManipulator::NoKind));
}

void ZtTableImportTest::readsResults()
{
    const ZtImportedTable table = readTable("results.csv");
    QCOMPARE(table.notes, QStringList());
    QCOMPARE(
        describe(table),
        list("Object 1: Area=433; Mean=190.855; Perim.=80.5; Angle=12.125 °; %Area=100 %; Circ.=0.630;|"
             "Object 2: Area=185; Mean=179.286; Perim.=60.25; Angle=90 °; %Area=100 %; Circ.=0.763;|"
             "Object 3: Area=658; Mean=205.617; Perim.=99.0; Angle=178.5 °; %Area=98.5 %; Circ.=0.872;"));
}

void ZtTableImportTest::readsResultsWithUnits()
{
    const ZtImportedTable table = readTable("results.csv", withUnits({text("um"), text("Mean=V")}));
    QCOMPARE(describe(table).first(), text("Object 1: Area=433 μm²; Mean=190.855 V; Perim.=80.5 μm; "
                                           "Angle=12.125 °; %Area=100 %; Circ.=0.630;"));
}

void ZtTableImportTest::readsResultsWithATypeColumn()
{
    QCOMPARE(describe(readTable("results_semicolon.csv")),
             list("A 1: Area=18; Mean=730.389; Angle=168.425 °;|A 2: Mean=718.333; Angle=175.471 °;|"
                  "C 1 \"C 3\": Area=68; Mean=686.985;"));
    QCOMPARE(describe(parse(" \tLabel\tArea\n1\tcell.tif\t5\n2\tcell.tif\t6\n")),
             list("Object 1 \"cell.tif\": Area=5;|Object 2 \"cell.tif\": Area=6;"));
}

void ZtTableImportTest::readsClassIndexTables()
{
    const ZtImportedTable table = readTable("class_index.csv");
    QCOMPARE(table.notes, QStringList());
    QCOMPARE(describe(table), list("oak 1: Value 1=5.1; Value 2=3.5;|oak 2: Value 1=4.9; Value 2=3.0;|"
                                   "elm 1: Value 1=7.0; Value 2=3.2;|elm 2: Value 1=6.4; Value 2=3.2;|"
                                   "ash 1: Value 1=6.3; Value 2=3.3;|ash 2: Value 1=5.8; Value 2=2.7;"));
    QCOMPARE(describe(readTable("class_index.csv", withUnits({text("cm"), text("Value 2=mm")}))).first(),
             text("oak 1: Value 1=5.1 cm; Value 2=3.5 mm;"));
    QCOMPARE(describe(parse("2;1;a;b\n1,5;1\nNA;1\n")), list("b 1: Value 1=1.5;|b 2:"));
}

void ZtTableImportTest::readsDecimalCommas()
{
    const QStringList expected = list(
        "Object 1 \"A\": Länge=1.5 mm; Fläche=2.25 mm²;|Object 2 \"B\": Länge=-2.5 mm; Fläche=1.5e1 mm²;");
    QCOMPARE(describe(readTable("decimal_comma.csv")), expected);
    Options options;
    options.decimalMark = Options::Comma;
    QCOMPARE(describe(readTable("decimal_comma.csv", options)), expected);
    QCOMPARE(describe(parse("a,b\n\"1,5\",\"2\"\n", options)), list("Object 1: a=1.5; b=2;"));
    options.decimalMark = Options::Point;
    QCOMPARE(parse("a;b\n1,5;2\n1,5;2\n", options).notes, QStringList());
    QCOMPARE(describe(parse("a;b\n1,5;2\n1,5;2\n", options)), list("1,5 1: b=2;|1,5 2: b=2;"));
}

void ZtTableImportTest::readsAllScripts()
{
    QCOMPARE(describe(readTable("scripts.tsv")),
             list("تجربة 1 \"תא 1\": length=1.5 μm;|測定 1 \"細胞\": length=2.5 μm;"));
}

void ZtTableImportTest::findsColumns_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QStringList>("objects");
    const QByteArray wide = "kind,site,size\nA,x,1\nB,y,2\nA,z,3\n";
    QTest::newRow("first text that repeats") << wide << ""
                                             << "" << list("A 1: size=1;|A 2: size=3;|B 1: size=2;");
    QTest::newRow("type by option") << wide << "Site"
                                    << "" << list("x 1: size=1;|y 1: size=2;|z 1: size=3;");
    QTest::newRow("name by option") << wide << ""
                                    << "site"
                                    << list("A 1 \"x\": size=1;|A 2 \"z\": size=3;|B 1 \"y\": size=2;");
    QTest::newRow("numbers as type") << wide << "size"
                                     << "kind" << list("FAULT");
    const QByteArray labelled = "label,class,size\np,A,1\nq,B,2\n";
    QTest::newRow("both found") << labelled << ""
                                << "" << list("A 1 \"p\": size=1;|B 1 \"q\": size=2;");
    QTest::newRow("name column as type") << labelled << "label"
                                         << "" << list("p 1: size=1;|q 1: size=2;");
    QTest::newRow("type column as name")
        << labelled << ""
        << "class" << list("Object 1 \"A\": size=1;|Object 2 \"B\": size=2;");
    QTest::newRow("one column as both") << labelled << "class"
                                        << "class" << list("A 1 \"A\": size=1;|B 1 \"B\": size=2;");
    const QByteArray tidy = "species,name,variable,value\nA,p,size,1\nB,q,size,2\n";
    QTest::newRow("tidy, both found") << tidy << ""
                                      << "" << list("A 1 \"p\": size=1;|B 1 \"q\": size=2;");
    QTest::newRow("tidy, name column as type") << tidy << "name"
                                               << "" << list("p 1: size=1;|q 1: size=2;");
    QTest::newRow("tidy, type column as name")
        << tidy << ""
        << "species" << list("Object 1 \"A\": size=1;|Object 2 \"B\": size=2;");
    QTest::newRow("results, number column as type") << QByteArray(" ,Area\n1,5\n") << ""
                                                    << "Area" << list("FAULT");
    QTest::newRow("type without a name")
        << QByteArray("type,size\nA,1\nA,1\n,2\nNA,3\n") << ""
        << "" << list("A 1: size=1;|A 2: size=1;|Object 1: size=2;|Object 2: size=3;");
    QTest::newRow("numbers under a type heading")
        << QByteArray("type,size\n1,1\n2,2\n") << ""
        << "" << list("Object 1: type=1; size=1;|Object 2: type=2; size=2;");
}

void ZtTableImportTest::findsColumns()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, type);
    QFETCH(QString, name);
    QFETCH(QStringList, objects);
    const ZtImportedTable table = parse(bytes, withColumns(type.toUtf8(), name.toUtf8()));
    if (objects == list("FAULT"))
        QCOMPARE(table.notes, QStringList(text("FAULT t.csv:1: There is no column of numbers")));
    else
        QCOMPARE(describe(table), objects);
}

void ZtTableImportTest::namesObjects_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("objects");
    QTest::newRow("texts") << QByteArray("name,size\np q,1\n\" a  b \",2\n")
                           << list("Object 1 \"p q\": size=1;|Object 2 \"a b\": size=2;");
    QTest::newRow("numbers") << QByteArray("id,size\n1,1\n7,2\n")
                             << list("Object 1: size=1;|Object 2 \"Object 7\": size=2;");
    QTest::newRow("missing") << QByteArray("id,size\n,1\nNA,2\n")
                             << list("Object 1: size=1;|Object 2: size=2;");
    QTest::newRow("tidy, in the order of first sight")
        << QByteArray("id,variable,value\n9,a,1\n3,a,2\n9,b,3\n")
        << list("Object 1 \"Object 9\": a=1; b=3;|Object 2 \"Object 3\": a=2;");
    QTest::newRow("tidy, named and numbered")
        << QByteArray("type,object_index,object_name,variable,value\nX,9,p,a,1\nX,3,p,a,2\nX,9,p,b,3\n"
                      "Y,9,Y 1,a,4\nY,10,,a,5\n")
        << list("X 1 \"p\": a=1; b=3;|X 2 \"p\": a=2;|Y 1: a=4;|Y 2 \"Y 10\": a=5;");
    QTest::newRow("wide, named and numbered") << QByteArray("object_index,object_name,size\n4,p,1\n5,q,2\n")
                                              << list("Object 1 \"p\": size=1;|Object 2 \"q\": size=2;");
    QTest::newRow("wide blank only") << QByteArray("name,size\n\u3000,1\n") << list("Object 1: size=1;");
    QTest::newRow("type of wide blanks") << QByteArray("type,size\n\u3000,1\n") << list("Object 1: size=1;");
}

void ZtTableImportTest::namesObjects()
{
    QFETCH(QByteArray, bytes);
    QTEST(describe(parse(bytes)), "objects");
}

void ZtTableImportTest::namesValues_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("object");
    QTest::newRow("units in headings")
        << QByteArray("bill_length_mm,Area [\u00B5m\u00B2],Length (mm),Width / mm\n1,2,3,4\n")
        << "Object 1: bill length=1 mm; Area=2 μm²; Length=3 mm; Width=4 mm;";
    QTest::newRow("same twice") << QByteArray("a,a [mm],A\n1,2,3\n") << "Object 1: a=1; a (2)=2 mm; A=3;";
    QTest::newRow("no heading") << QByteArray("a,,b\n1,2,3\n") << "Object 1: a=1; Column 2=2; b=3;";
    QTest::newRow("heading of two lines")
        << QByteArray("\"bill\nlength (mm)\",b\n1,2\n") << "Object 1: bill length=1 mm; b=2;";
}

void ZtTableImportTest::namesValues()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, object);
    QCOMPARE(describe(parse(bytes)), QStringList(object));
}

void ZtTableImportTest::notesWhatItLeavesOut_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("notes");
    QTest::newRow("nothing") << QByteArray("name,type,size\nx,A,1\n") << QStringList();
    QTest::newRow("one") << QByteArray("size,comment\n1,good\n")
                         << list("Column \"comment\" holds text and was left out");
    QTest::newRow("empty column") << QByteArray("size,comment\n1,\n") << QStringList();
    QTest::newRow("tidy, one") << QByteArray("variable,value,who\na,1,me\n")
                               << list("Column \"who\" is not part of a list of values and was left out");
    QTest::newRow("tidy, two")
        << QByteArray("variable,who,value,when\na,me,1,now\n")
        << list("Columns \"who\", \"when\" are not part of a list of values and were left out");
    QTest::newRow("no rows") << QByteArray("a,b\n") << list("The table has no rows");
    QTest::newRow("no rows, tidy") << QByteArray("variable,value\n\n") << list("The table has no rows");
}

void ZtTableImportTest::notesWhatItLeavesOut()
{
    QFETCH(QByteArray, bytes);
    QTEST(parse(bytes).notes, "notes");
}

void ZtTableImportTest::readsAllEncodings_data()
{
    QTest::addColumn<QByteArray>("bytes");
    const QString table = text("name,Größe [µm]\nתא,1.5\n");
    QTest::newRow("UTF-8") << table.toUtf8();
    QTest::newRow("UTF-8 with a mark") << "\xEF\xBB\xBF" + table.toUtf8();
    QTest::newRow("UTF-16LE") << "\xFF\xFE" + utf16(table, "UTF-16LE");
    QTest::newRow("UTF-16BE") << "\xFE\xFF" + utf16(table, "UTF-16BE");
}

void ZtTableImportTest::readsAllEncodings()
{
    QFETCH(QByteArray, bytes);
    QCOMPARE(describe(parse(bytes)), list("Object 1 \"תא\": Größe=1.5 μm;"));
}

void ZtTableImportTest::readsAllLineEnds()
{
    for (const char *end : {"\n", "\r\n", "\r"}) {
        QByteArray bytes = "a,b\n1,2\n\n3,4\n";
        bytes.replace("\n", end);
        QCOMPARE(describe(parse(bytes)), list("Object 1: a=1; b=2;|Object 2: a=3; b=4;"));
    }
}

void ZtTableImportTest::readsDevices()
{
    QByteArray bytes = "a\n1\n";
    QBuffer buffer(&bytes);
    ZtImportedTable table;
    ZtFault fault;
    QVERIFY(!ZtTableImport::readDevice(&buffer, text("-"), Options(), &table, &fault));
    QCOMPARE(fault.text(), text("-: The table is not open for reading"));
    QVERIFY(buffer.open(QIODevice::ReadOnly));
    QVERIFY(ZtTableImport::readDevice(&buffer, text("-"), Options(), &table, &fault));
    QVERIFY(fault.isNull());
    QCOMPARE(describe(table), list("Object 1: a=1;"));
}

void ZtTableImportTest::makesTypesAndObjects()
{
    ZtKernelData *kernel = ZtKernelData::getInstance();
    QSignalSpy created(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)));
    const QVector<int> first = ZtTableImport::apply(parse("type,name,size\nA,,1\nB,two,2\nA,three,3\n"));
    const QVector<int> second = ZtTableImport::apply(parse("size\n1\n"));
    QCOMPARE(first, (QVector<int>{ZtTableImport::firstTypeId, ZtTableImport::firstTypeId + 1}));
    QCOMPARE(second, QVector<int>{ZtTableImport::firstTypeId + 2});
    QCOMPARE(created.size(), 3);
    QCOMPARE(kernel->objects().value(first.at(0)).keys(), (QList<int>{1, 2}));
    QCOMPARE(kernel->getGsManipulator(first.at(0))->getObjectName(1), text("A 1"));
    QCOMPARE(kernel->getGsManipulator(first.at(0))->getObjectName(2), text("three"));
    QCOMPARE(kernel->getGsManipulator(first.at(1))->getObjectName(1), text("two"));
    QVERIFY(kernel->getDataDescriptor(first.at(0)));
    for (const int type : first + second)
        kernel->unregisterType(type);
    QVERIFY(kernel->objects().isEmpty());
}

void ZtTableImportTest::readsLongCells()
{
    const QByteArray name(10000, 'n');
    const QByteArray digits = "0." + QByteArray(10000, '1');
    const ZtImportedTable table = parse("name," + QByteArray(10000, 'h') + "\n" + name + ',' + digits + '\n');
    QCOMPARE(table.objectCount(), 1);
    QCOMPARE(table.types.first()->rowName(0).size(), 10000);
    QCOMPARE(table.types.first()->values().first().name.size(), 10000);
    QCOMPARE(table.types.first()->text(*table.types.first()->cell(0, 0)), QString::fromLatin1(digits));
}

void ZtTableImportTest::isFast()
{
    QByteArray wide = "species,name,length_mm,width_mm,mass_g\n";
    QByteArray tidy = "object_type,object_index,value_name,unit,value\n";
    for (int i = 1; i <= 100000; ++i) {
        const QByteArray number = QByteArray::number(i);
        wide += "A,object " + number + ',' + number + ".5,2.25,3750\n";
        tidy += "A," + QByteArray::number(i / 4) + ",value " + QByteArray::number(i % 4) + ",mm," + number +
                ".5\n";
    }
    for (const QByteArray &bytes : {wide, tidy}) {
        QElapsedTimer timer;
        timer.start();
        const ZtImportedTable table = parse(bytes);
        qInfo("100 000 rows in %lld ms", timer.elapsed());
        // Far more than it takes, for slow machines and instrumented builds.
        QVERIFY2(timer.elapsed() < 8000, qPrintable(QString::number(timer.elapsed())));
        QVERIFY(table.objectCount() > 25000);
    }
}

STATREPORT_TEST_MAIN(ZtTableImportTest)
#include "ZtTableImportTest.moc"
