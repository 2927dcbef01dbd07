// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonText.h"

#include "support/StatReportTest.h"

#include <QJsonArray>
#include <QJsonDocument>

class ZtJsonTextTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void texts_data();
    void texts();
    void numbers_data();
    void numbers();
    void plainTexts();
};

void ZtJsonTextTest::texts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QByteArray>("json");
    QTest::newRow("empty") << QString() << QByteArray("\"\"");
    QTest::newRow("letters") << QStringLiteral("Länge μm 𝜇") << QByteArray("\"Länge μm 𝜇\"");
    QTest::newRow("quotes") << QStringLiteral("a \"b\" \\c") << QByteArray("\"a \\\"b\\\" \\\\c\"");
    QTest::newRow("controls") << QStringLiteral("\t\n\x1f") << QByteArray("\"\\u0009\\u000a\\u001f\"");
}

void ZtJsonTextTest::texts()
{
    QFETCH(QString, text);
    QByteArray json;
    ZtJsonText::append(&json, text);
    QTEST(json, "json");
    QCOMPARE(QJsonDocument::fromJson('[' + json + ']').array().at(0).toString(), text);
}

void ZtJsonTextTest::numbers_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<QByteArray>("json");
    QTest::newRow("whole") << 12.0 << QByteArray("12");
    QTest::newRow("tenth") << 0.1 << QByteArray("0.1");
    QTest::newRow("third") << 1.0 / 3.0 << QByteArray("0.3333333333333333");
    QTest::newRow("negative") << -2.5 << QByteArray("-2.5");
    QTest::newRow("large") << 1e300 << QByteArray("1e+300");
    QTest::newRow("small") << 5e-324 << QByteArray("5e-324");
}

void ZtJsonTextTest::numbers()
{
    QFETCH(double, value);
    QTEST(ZtJsonText::number(value), "json");
    QCOMPARE(ZtJsonText::number(value).toDouble(), value);
}

void ZtJsonTextTest::plainTexts()
{
    QByteArray json("[");
    ZtJsonText::appendPlain(&json, "1.50");
    QCOMPARE(json, QByteArray("[\"1.50\""));
}

STATREPORT_TEST_MAIN(ZtJsonTextTest)
#include "ZtJsonTextTest.moc"
