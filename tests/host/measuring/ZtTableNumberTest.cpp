// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtTableNumber.h"

#include <string>

class ZtTableNumberTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void reads_data();
    void reads();
    void keepsTheTextAsWritten_data();
    void keepsTheTextAsWritten();
    void readsLongFields();
};

void ZtTableNumberTest::reads_data()
{
    QTest::addColumn<QByteArray>("field");
    QTest::addColumn<bool>("comma");
    QTest::addColumn<int>("kind");
    QTest::addColumn<double>("value");
    const int number = ZtTableNumber::Number;
    const int missing = ZtTableNumber::Missing;
    const int text = ZtTableNumber::Text;
    const int infinite = ZtTableNumber::Infinite;
    QTest::newRow("whole") << QByteArray("42") << false << number << 42.0;
    QTest::newRow("fraction") << QByteArray("5.10") << false << number << 5.1;
    QTest::newRow("fraction, comma") << QByteArray("5,10") << true << number << 5.1;
    QTest::newRow("negative") << QByteArray("-5.5") << false << number << -5.5;
    QTest::newRow("plus") << QByteArray("+5.5") << false << number << 5.5;
    QTest::newRow("no leading digit") << QByteArray("-.5") << false << number << -0.5;
    QTest::newRow("no trailing digit") << QByteArray("5.") << false << number << 5.0;
    QTest::newRow("exponent") << QByteArray("1.5e3") << false << number << 1500.0;
    QTest::newRow("exponent, comma") << QByteArray("1,5E-3") << true << number << 0.0015;
    QTest::newRow("blanks around") << QByteArray(" 7 \t") << false << number << 7.0;
    QTest::newRow("nearly nothing") << QByteArray("1e-400") << false << number << 0.0;
    QTest::newRow("empty") << QByteArray("") << false << missing << 0.0;
    QTest::newRow("blank") << QByteArray("  ") << false << missing << 0.0;
    QTest::newRow("NA") << QByteArray("NA") << false << missing << 0.0;
    QTest::newRow("n/a") << QByteArray("n/a") << false << missing << 0.0;
    QTest::newRow("NaN") << QByteArray("NaN") << false << missing << 0.0;
    QTest::newRow("null") << QByteArray("null") << false << missing << 0.0;
    QTest::newRow("dash") << QByteArray("-") << false << missing << 0.0;
    QTest::newRow("inf") << QByteArray("inf") << false << infinite << 0.0;
    QTest::newRow("-Infinity") << QByteArray("-Infinity") << false << infinite << 0.0;
    QTest::newRow("too large") << QByteArray("1e400") << false << infinite << 0.0;
    QTest::newRow("word") << QByteArray("five") << false << text << 0.0;
    QTest::newRow("plus alone") << QByteArray("+") << false << text << 0.0;
    QTest::newRow("point alone") << QByteArray(".") << false << text << 0.0;
    QTest::newRow("number and unit") << QByteArray("5 mm") << false << text << 0.0;
    QTest::newRow("hexadecimal") << QByteArray("0x10") << false << text << 0.0;
    QTest::newRow("two signs") << QByteArray("--5") << false << text << 0.0;
    QTest::newRow("comma where a point is meant") << QByteArray("5,1") << false << text << 0.0;
    QTest::newRow("point where a comma is meant") << QByteArray("5.1") << true << text << 0.0;
    QTest::newRow("groups") << QByteArray("1,234.5") << false << text << 0.0;
    QTest::newRow("groups, comma") << QByteArray("1.234,5") << true << text << 0.0;
    QTest::newRow("two commas") << QByteArray("1,234,5") << true << text << 0.0;
    QTest::newRow("Arabic digits") << QByteArray("\u0661\u0662") << false << text << 0.0;
    QTest::newRow("half an exponent") << QByteArray("1e") << false << text << 0.0;
}

void ZtTableNumberTest::reads()
{
    QFETCH(QByteArray, field);
    QFETCH(bool, comma);
    const ZtTableNumber number = ZtTableNumber::read(field.toStdString(), comma);
    QTEST(int(number.kind), "kind");
    if (number.kind == ZtTableNumber::Number)
        QTEST(number.value, "value");
}

void ZtTableNumberTest::keepsTheTextAsWritten_data()
{
    QTest::addColumn<QByteArray>("field");
    QTest::addColumn<bool>("comma");
    QTest::addColumn<QString>("text");
    QTest::newRow("zeros") << QByteArray("007.500") << false << "007.500";
    QTest::newRow("comma") << QByteArray("7,500") << true << "7.500";
    QTest::newRow("sign and exponent") << QByteArray("+1E5") << false << "+1E5";
    QTest::newRow("blanks around") << QByteArray(" 7 ") << false << "7";
}

void ZtTableNumberTest::keepsTheTextAsWritten()
{
    QFETCH(QByteArray, field);
    QFETCH(bool, comma);
    const std::string bytes = field.toStdString();
    std::string buffer;
    const std::string_view written = ZtTableNumber::textOf(bytes, comma, &buffer);
    QTEST(QString::fromLatin1(written.data(), static_cast<int>(written.size())), "text");
}

void ZtTableNumberTest::readsLongFields()
{
    const std::string fraction = "0." + std::string(10000, '3');
    const ZtTableNumber third = ZtTableNumber::read(fraction, false);
    QCOMPARE(int(third.kind), int(ZtTableNumber::Number));
    QCOMPARE(third.value, 1.0 / 3.0);
    std::string buffer;
    QCOMPARE(ZtTableNumber::textOf(fraction, false, &buffer).size(), std::size_t(10002));
    QCOMPARE(int(ZtTableNumber::read(std::string(10000, '9'), false).kind), int(ZtTableNumber::Infinite));
    QCOMPARE(int(ZtTableNumber::read("0." + std::string(10000, '0') + '1', false).kind),
             int(ZtTableNumber::Number));
    QCOMPARE(int(ZtTableNumber::read(std::string(10000, 'x'), true).kind), int(ZtTableNumber::Text));
}

STATREPORT_TEST_MAIN(ZtTableNumberTest)
#include "ZtTableNumberTest.moc"
