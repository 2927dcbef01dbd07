// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"
#include "support/UnprivilegedUser.h"

#include "measuring/ZtTableImport.h"

#include <QFile>
#include <QFileInfo>

Q_DECLARE_METATYPE(ZtTableImportOptions)

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

ZtFault readFault(const QString &path, const ZtTableImportOptions &options = ZtTableImportOptions())
{
    ZtImportedTable table;
    ZtFault fault;
    ZtTableImport::readFile(path, options, &table, &fault);
    return fault;
}

} // namespace

/** What is wrong with a table is said with its place, and nothing of it is taken. */
class ZtTableImportFaultsTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void namesThePlace_data();
    void namesThePlace();
    void refusesOptions_data();
    void refusesOptions();
    void refusesFiles();
    void refusesUnreadableFiles();
    void refusesLargeFiles();
};

void ZtTableImportFaultsTest::namesThePlace_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("fault");
    QTest::newRow("empty") << QByteArray() << "t.csv: The file is empty";
    QTest::newRow("blank") << QByteArray(" \n\n,,\n") << "t.csv: The file is empty";
    QTest::newRow("no header") << QByteArray("\n1,2\n3,4\n")
                               << "t.csv:2: The first line does not name the columns";
    QTest::newRow("Latin-1") << QByteArray("a\n1\n\xB5\n") << "t.csv:3: The text is not valid UTF-8";
    QTest::newRow("binary") << QByteArray("\x89PNG\0\0", 6)
                            << "t.csv:1: The file is not a text file: it holds a NUL character";
    QTest::newRow("open quotes") << QByteArray("a,b\n1,\"2\n") << "t.csv:2:2: A quoted text does not end";
    QTest::newRow("text after quotes")
        << QByteArray("a,b\n1,2\n\"1\"x,2\n") << "t.csv:3:1: There is text after a closing quote";
    QTest::newRow("short row")
        << QByteArray("a,b,c\n1,2,3\n1,2\n1,2,3\n")
        << "t.csv:3:3: The row and the header differ in their number of fields (2 and 3)";
    QTest::newRow("long row")
        << QByteArray("a,b\n1,2\n1,2,3,4\n")
        << "t.csv:3:3: The row and the header differ in their number of fields (4 and 2)";
    QTest::newRow("text among numbers")
        << QByteArray("a,b\n1,2\n3,4\n5,six\n") << "t.csv:4:2: \"six\" is not a number";
    QTest::newRow("infinite") << QByteArray("a,b\n1,2\n3,inf\n")
                              << "t.csv:3:2: \"inf\" is not a finite number";
    QTest::newRow("too large") << QByteArray("a\n1e400\n") << "t.csv:2:1: \"1e400\" is not a finite number";
    QTest::newRow("too large in base units")
        << QByteArray("a [m]\n1e305\n") << "t.csv:2:1: \"1e305\" is not a finite number";
    QTest::newRow("long text") << QByteArray("a\n1\n2\n" + QByteArray(100, 'x') + "\n")
                               << QString(text("t.csv:4:1: \"") + QString(39, QLatin1Char('x')) +
                                          text("…\" is not a number"));
    QTest::newRow("after a cell of two lines")
        << QByteArray("n,a\n\"x\ny\",1\nz,1\nz,q\n") << "t.csv:5:2: \"q\" is not a number";
    QTest::newRow("no numbers") << QByteArray("a,b\nx,y\n") << "t.csv:1: There is no column of numbers";
    QTest::newRow("tidy, no number") << QByteArray("variable,value\na,1\nb,x\n")
                                     << "t.csv:3:2: \"x\" is not a number";
    QTest::newRow("tidy, no name") << QByteArray("variable,value\na,1\n,2\n")
                                   << "t.csv:3:1: The value has no name";
    QTest::newRow("tidy, name of wide blanks")
        << QByteArray("variable,value\n\u3000,2\n") << "t.csv:2:1: The value has no name";
    QTest::newRow("tidy, no object") << QByteArray("id,variable,value\n1,a,1\n,a,2\n")
                                     << "t.csv:3:1: The row does not say which object it belongs to";
    QTest::newRow("tidy, twice") << QByteArray("id,variable,value\n1,a,1\n2,a,1\n1,a,2\n")
                                 << "t.csv:4:3: \"Object 1\" already has a value \"a\" in line 2";
    QTest::newRow("tidy, another unit")
        << QByteArray("id,variable,unit,value\n1,a,mm,1\n2,a,cm,1\n3,a,g,2\n")
        << "t.csv:4:3: \"a\" of \"Object\" is given in \"g\" here, but in \"mm\" before";
    QTest::newRow("tidy, number for a unit")
        << QByteArray("id,variable,unit,value\n1,a,5,1\n") << "t.csv:2:3: \"5\" is not a unit";
    QTest::newRow("class index, short row")
        << QByteArray("2,2,a,b\n1,2,0\n1,0\n") << "t.csv:3:3: The row has 2 field(s) instead of 3";
    QTest::newRow("class index, no such class")
        << QByteArray("1,1,a,b\n1,2\n")
        << "t.csv:2:2: \"2\" is not the index of a class; they go from 0 to 1";
    QTest::newRow("class index, negative class")
        << QByteArray("1,1,a,b\n1,-1\n")
        << "t.csv:2:2: \"-1\" is not the index of a class; they go from 0 to 1";
    QTest::newRow("class index, no number")
        << QByteArray("1,1,a\nx,0\n") << "t.csv:2:1: \"x\" is not a number";
    QTest::newRow("class index, too few rows")
        << QByteArray("\n3,1,a\n1,0\n") << "t.csv:2:1: The table has 1 row(s), its first line announces 3";
    QTest::newRow("class index, too many rows")
        << QByteArray("1,1,a\n1,0\n1,0\n") << "t.csv:1:1: The table has 2 row(s), its first line announces 1";
    QTest::newRow("class index, no values")
        << QByteArray("1,0,a\n0\n") << "t.csv:1:2: The first line announces rows without values";
    QTest::newRow("class index, a great many values")
        << QByteArray("1,2147483647,a\n1,0\n") << "t.csv:2:3: The row has 2 field(s) instead of 2147483648";
}

void ZtTableImportFaultsTest::namesThePlace()
{
    QFETCH(QByteArray, bytes);
    ZtImportedTable table;
    table.notes.append(text("untouched"));
    ZtFault fault;
    QVERIFY(!ZtTableImport::parse(bytes, text("t.csv"), ZtTableImportOptions(), &table, &fault));
    QTEST(fault.text(), "fault");
    QVERIFY(table.types.isEmpty());
    QCOMPARE(table.notes, QStringList(text("untouched")));
}

void ZtTableImportFaultsTest::refusesOptions_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<ZtTableImportOptions>("options");
    QTest::addColumn<QString>("fault");
    const QByteArray wide = "kind,size\nA,1\n";
    ZtTableImportOptions options;
    options.typeColumn = text("sort");
    const char noSuchColumn[] = "t.csv:1: There is no column \"sort\"; the columns are \"kind\", \"size\"";
    QTest::newRow("type column") << wide << options << noSuchColumn;
    QTest::newRow("type column, class index")
        << QByteArray("1,1,a\n1,0\n") << options
        << "t.csv: There is no column \"sort\"; the columns of this table have no names";
    QTest::newRow("type column, tidy")
        << QByteArray("variable,value\na,1\n") << options
        << "t.csv:1: There is no column \"sort\"; the columns are \"variable\", \"value\"";
    options = ZtTableImportOptions();
    options.nameColumn = text("sort");
    QTest::newRow("name column") << wide << options << noSuchColumn;
    options = ZtTableImportOptions();
    options.units = QStringList{text("mm"), text("weight=g")};
    QTest::newRow("unit of no value")
        << wide << options << "t.csv: There is no value \"weight\" to give a unit; the values are \"size\"";
}

void ZtTableImportFaultsTest::refusesOptions()
{
    QFETCH(QByteArray, bytes);
    QFETCH(ZtTableImportOptions, options);
    ZtImportedTable table;
    ZtFault fault;
    QVERIFY(!ZtTableImport::parse(bytes, text("t.csv"), options, &table, &fault));
    QTEST(fault.text(), "fault");
}

void ZtTableImportFaultsTest::refusesFiles()
{
    const QString missing = temporaryPath(text("missing.csv"));
    QCOMPARE(readFault(missing).text(), missing + text(": The file does not exist"));
    const QString folder = QFileInfo(missing).path();
    QCOMPARE(readFault(folder).text(), folder + text(": This is a folder, not a file"));
    QCOMPARE(readFault(QString()).message, text("The file does not exist"));
}

void ZtTableImportFaultsTest::refusesUnreadableFiles()
{
    const QString broken = text("/proc/self/mem");
    if (QFile::exists(broken))
        QVERIFY(readFault(broken).message.startsWith(text("The file cannot be read")));
    const QString path = temporaryPath(text("closed.csv"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.setPermissions(QFileDevice::Permissions());
    const UnprivilegedUser user;
    QVERIFY(user.isUnprivileged());
    QVERIFY(readFault(path).message.startsWith(text("The file cannot be read")));
}

void ZtTableImportFaultsTest::refusesLargeFiles()
{
    const QString path = temporaryPath(text("large.csv"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly) && file.resize(3 * 1024 * 1024));
    ZtTableImportOptions options;
    options.maximumBytes = 2 * 1024 * 1024;
    QCOMPARE(readFault(path, options).text(), path + text(": The file is larger than 2 MB"));
    ZtImportedTable table;
    ZtFault fault;
    QVERIFY(
        !ZtTableImport::parse(QByteArray(2 * 1024 * 1024 + 1, 'x'), text("t.csv"), options, &table, &fault));
    QCOMPARE(fault.text(), text("t.csv: The file is larger than 2 MB"));
}

STATREPORT_TEST_MAIN(ZtTableImportFaultsTest)
#include "ZtTableImportFaultsTest.moc"
