// SPDX-License-Identifier: MIT
#include "KvDeskDecimalBox.h"

#include "support/StatReportTest.h"

class KvDeskDecimalBoxTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void showsAPoint_data();
    void showsAPoint();
    void takesTypedNumbers_data();
    void takesTypedNumbers();
};

void KvDeskDecimalBoxTest::cleanup()
{
    QLocale::setDefault(QLocale::c());
    StatReportTest::cleanup();
}

void KvDeskDecimalBoxTest::showsAPoint_data()
{
    QTest::addColumn<QLocale>("locale");
    QTest::newRow("C") << QLocale::c();
    QTest::newRow("German") << QLocale(QLocale::German, QLocale::Germany);
    QTest::newRow("Arabic") << QLocale(QLocale::Arabic, QLocale::Egypt);
}

void KvDeskDecimalBoxTest::showsAPoint()
{
    QFETCH(QLocale, locale);
    QLocale::setDefault(locale);
    KvDeskDecimalBox box;
    box.setRange(0.0, 1e6);
    box.setDecimals(3);
    box.setSuffix(QStringLiteral(" ms"));
    box.setValue(12345.5);
    QCOMPARE(box.text(), QStringLiteral("12345.500 ms"));
}

void KvDeskDecimalBoxTest::takesTypedNumbers_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<double>("value");
    QTest::newRow("whole number") << QStringLiteral("100") << 100.0;
    QTest::newRow("point") << QStringLiteral("0.25") << 0.25;
    QTest::newRow("comma") << QStringLiteral("0,25") << 0.25;
    QTest::newRow("Arabic") << QStringLiteral("\u0661\u0662\u066B\u0665") << 12.5;
    QTest::newRow("a second comma is left out") << QStringLiteral("1,2,3") << 1.23;
    QTest::newRow("letters are left out") << QStringLiteral("1a2") << 12.0;
}

void KvDeskDecimalBoxTest::takesTypedNumbers()
{
    QFETCH(QString, typed);
    QFETCH(double, value);
    KvDeskDecimalBox box;
    box.setRange(0.0, 1000.0);
    box.setDecimals(3);
    box.setSuffix(QStringLiteral(" ms, camera"));
    box.selectAll();
    for (const QChar character : typed) {
        QKeyEvent press(QEvent::KeyPress, 0, Qt::NoModifier, QString(character));
        QApplication::sendEvent(&box, &press);
    }
    QTest::keyClick(&box, Qt::Key_Return);
    QCOMPARE(box.value(), value);
    QVERIFY(box.text().endsWith(QStringLiteral(" ms, camera")));
}

STATREPORT_TEST_MAIN(KvDeskDecimalBoxTest)
#include "KvDeskDecimalBoxTest.moc"
