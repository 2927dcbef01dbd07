// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtCsvReader.h"

#include <string>

namespace {

/// All rows as text: fields between bars, rows between line feeds, each with its line.
QByteArray readAll(ZtCsvReader *reader)
{
    QByteArray result;
    ZtCsvRow row;
    while (reader->next(&row)) {
        result += QByteArray::number(row.line) + ':';
        for (const std::string_view field : row.fields)
            result += QByteArray(field.data(), static_cast<int>(field.size())) + '|';
        result += '\n';
    }
    return result;
}

} // namespace

class ZtCsvReaderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void reads_data();
    void reads();
    void readsAgain();
    void refuses_data();
    void refuses();
    void readsLongFields();
};

void ZtCsvReaderTest::reads_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<char>("separator");
    QTest::addColumn<QByteArray>("rows");
    QTest::newRow("nothing") << QByteArray() << ',' << QByteArray();
    QTest::newRow("no line end") << QByteArray("a,b") << ',' << QByteArray("1:a|b|\n");
    QTest::newRow("LF") << QByteArray("a,b\nc,d\n") << ',' << QByteArray("1:a|b|\n2:c|d|\n");
    QTest::newRow("CR LF") << QByteArray("a,b\r\nc,d\r\n") << ',' << QByteArray("1:a|b|\n2:c|d|\n");
    QTest::newRow("CR") << QByteArray("a,b\rc,d\r") << ',' << QByteArray("1:a|b|\n2:c|d|\n");
    QTest::newRow("mixed") << QByteArray("a\r\n\nb\r\rc") << ',' << QByteArray("1:a|\n3:b|\n5:c|\n");
    QTest::newRow("blank lines") << QByteArray("\n \t\na\n\n") << ',' << QByteArray("3:a|\n");
    QTest::newRow("separators alone")
        << QByteArray("a,b\n,\n , \n1,2\n") << ',' << QByteArray("1:a|b|\n4:1|2|\n");
    QTest::newRow("empty fields") << QByteArray("a,,\n,b,") << ',' << QByteArray("1:a|||\n2:|b||\n");
    QTest::newRow("blanks around") << QByteArray(" a , b c \n") << ',' << QByteArray("1:a|b c|\n");
    QTest::newRow("semicolons") << QByteArray("a;1,5;b") << ';' << QByteArray("1:a|1,5|b|\n");
    QTest::newRow("tabs") << QByteArray("a\t\tb\t") << '\t' << QByteArray("1:a||b||\n");
    QTest::newRow("quoted") << QByteArray("\"a,b\",\"c\nd\"\n\"e\"") << ','
                            << QByteArray("1:a,b|c\nd|\n3:e|\n");
    QTest::newRow("quoted CR LF") << QByteArray("\"a\r\nb\",c\r\nd") << ','
                                  << QByteArray("1:a\r\nb|c|\n3:d|\n");
    QTest::newRow("doubled quotes") << QByteArray("\"a\"\"b\",\"\"\"\"") << ',' << QByteArray("1:a\"b|\"|\n");
    QTest::newRow("blanks around quotes") << QByteArray(" \" a \" ,b") << ',' << QByteArray("1: a |b|\n");
    QTest::newRow("quotes inside") << QByteArray("5\" disc,b") << ',' << QByteArray("1:5\" disc|b|\n");
    QTest::newRow("empty quotes") << QByteArray("a\n\"\"\nb") << ',' << QByteArray("1:a|\n2:|\n3:b|\n");
    QTest::newRow("right to left") << QByteArray("\u05D0,\u062A") << ',' << QByteArray("1:\u05D0|\u062A|\n");
}

void ZtCsvReaderTest::reads()
{
    QFETCH(QByteArray, text);
    QFETCH(char, separator);
    const std::string kept = text.toStdString();
    ZtCsvReader reader(kept, separator);
    QTEST(readAll(&reader), "rows");
    QVERIFY(reader.fault().isNull());
}

void ZtCsvReaderTest::readsAgain()
{
    ZtCsvReader reader("a\n\"b", ',');
    QCOMPARE(readAll(&reader), QByteArray("1:a|\n"));
    QVERIFY(!reader.fault().isNull());
    reader.rewind();
    QVERIFY(reader.fault().isNull());
    QCOMPARE(readAll(&reader), QByteArray("1:a|\n"));
}

void ZtCsvReaderTest::refuses_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<int>("line");
    QTest::addColumn<int>("column");
    QTest::addColumn<QString>("message");
    QTest::newRow("open quotes") << QByteArray("a,b\nc,\"d\n\n") << 2 << 2 << "A quoted text does not end";
    QTest::newRow("text after quotes")
        << QByteArray("a\n\"b\"c,d") << 2 << 1 << "There is text after a closing quote";
}

void ZtCsvReaderTest::refuses()
{
    QFETCH(QByteArray, text);
    const std::string kept = text.toStdString();
    ZtCsvReader reader(kept, ',');
    readAll(&reader);
    QTEST(reader.fault().line, "line");
    QTEST(reader.fault().column, "column");
    QTEST(reader.fault().message, "message");
}

void ZtCsvReaderTest::readsLongFields()
{
    const std::string text = std::string(10000, 'x') + ",\"" + std::string(10000, '\n') + "\"\nend";
    ZtCsvReader reader(text, ',');
    ZtCsvRow row;
    QVERIFY(reader.next(&row));
    QCOMPARE(row.fields.at(0).size(), std::size_t(10000));
    QCOMPARE(row.fields.at(1).size(), std::size_t(10000));
    QVERIFY(reader.next(&row));
    QCOMPARE(row.line, 10002);
}

STATREPORT_TEST_MAIN(ZtCsvReaderTest)
#include "ZtCsvReaderTest.moc"
