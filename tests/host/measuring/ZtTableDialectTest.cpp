// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtCsvReader.h"
#include "measuring/ZtTableDialect.h"

#include <string>

class ZtTableDialectTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void findsTheSeparator_data();
    void findsTheSeparator();
    void findsTheDecimalMark_data();
    void findsTheDecimalMark();
};

void ZtTableDialectTest::findsTheSeparator_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<bool>("comma");
    QTest::addColumn<char>("separator");
    QTest::newRow("comma") << QByteArray("a,b\n1,2\n") << false << ',';
    QTest::newRow("semicolon") << QByteArray("a;b\n1;2\n") << false << ';';
    QTest::newRow("tab") << QByteArray("a\tb\n1\t2\n") << false << '\t';
    QTest::newRow("decimal comma") << QByteArray("a;b\n1,5;2,5\n") << false << ';';
    QTest::newRow("commas everywhere") << QByteArray("a, mm;b, mm\n1,5;2,5\n") << false << ';';
    QTest::newRow("semicolons in a text") << QByteArray("a,b\nx;y,2\nz,3\n") << false << ',';
    QTest::newRow("quoted separators") << QByteArray("\"a;b\",c\n\"d;e\",2\n") << false << ',';
    QTest::newRow("one column") << QByteArray("a\n1\n") << false << ',';
    QTest::newRow("nothing") << QByteArray() << false << ',';
    QTest::newRow("known decimal comma") << QByteArray("a\tb\n1,5\t2,5\n") << true << '\t';
    QTest::newRow("known decimal comma, quoted") << QByteArray("a,b\n\"1,5\",\"2,5\"\n") << true << ',';
}

void ZtTableDialectTest::findsTheSeparator()
{
    QFETCH(QByteArray, text);
    QFETCH(bool, comma);
    const std::string kept = text.toStdString();
    QTEST(ZtTableDialect::findSeparator(kept, comma), "separator");
}

void ZtTableDialectTest::findsTheDecimalMark_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<char>("separator");
    QTest::addColumn<bool>("comma");
    QTest::newRow("comma") << QByteArray("a;b\n1,5;2\n") << ';' << true;
    QTest::newRow("point") << QByteArray("a;b\n1.5;2\n") << ';' << false;
    QTest::newRow("whole numbers") << QByteArray("a;b\n1;2\n") << ';' << false;
    QTest::newRow("both") << QByteArray("a;b\n1,5;2.5\n") << ';' << false;
    QTest::newRow("texts with commas") << QByteArray("a;b\nx,y;2.5\n") << ';' << false;
    QTest::newRow("separated by commas") << QByteArray("a,b\n1,5\n") << ',' << false;
}

void ZtTableDialectTest::findsTheDecimalMark()
{
    QFETCH(QByteArray, text);
    QFETCH(char, separator);
    const std::string kept = text.toStdString();
    ZtCsvReader reader(kept, separator);
    QTEST(ZtTableDialect::hasDecimalComma(&reader), "comma");
    ZtCsvRow row;
    QVERIFY2(reader.next(&row) && row.line == 1, "the reader is at its start again");
}

STATREPORT_TEST_MAIN(ZtTableDialectTest)
#include "ZtTableDialectTest.moc"
