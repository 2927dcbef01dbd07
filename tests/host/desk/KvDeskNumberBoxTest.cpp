// SPDX-License-Identifier: MIT
#include "KvDeskNumberBox.h"

#include "support/StatReportTest.h"

#include <limits>

class KvDeskNumberBoxTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void takesTypedNumbers_data();
    void takesTypedNumbers();
    void swallowsNoKey_data();
    void swallowsNoKey();
    void showsNumbers_data();
    void showsNumbers();
    void keepsAllDigits();
    void announcesWhatIsTyped();
    void faultsAreMarked();
};

void KvDeskNumberBoxTest::takesTypedNumbers_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<double>("value");
    QTest::newRow("whole number") << QStringLiteral("100") << 100.0;
    QTest::newRow("point") << QStringLiteral("0.25") << 0.25;
    QTest::newRow("comma") << QStringLiteral("0,25") << 0.25;
    QTest::newRow("begins with the point") << QStringLiteral(".5") << 0.5;
    QTest::newRow("exponent") << QStringLiteral("2.5e-3") << 0.0025;
    QTest::newRow("nothing") << QString() << 0.0;
    QTest::newRow("spaces around") << QStringLiteral(" 5 ") << 5.0;
    QTest::newRow("negative") << QStringLiteral("-3") << -3.0;
    QTest::newRow("many digits") << QStringLiteral("12345678901") << 12345678901.0;
    QTest::newRow("no end to it") << QStringLiteral("1e400") << std::numeric_limits<double>::infinity();
}

void KvDeskNumberBoxTest::takesTypedNumbers()
{
    QFETCH(QString, typed);
    KvDeskNumberBox box;
    QTest::keyClicks(&box, typed);
    QTest::keyClick(&box, Qt::Key_Return);
    QTEST(box.value(), "value");
    QVERIFY(box.isNumber());
    QCOMPARE(box.text(), typed);
}

void KvDeskNumberBoxTest::swallowsNoKey_data()
{
    QTest::addColumn<QString>("typed");
    for (const char *text : {"1a2", "1.2.3", "1.234,5", "1,234.5", "1 000", "1e", "1e-", ".", "-", "--1",
                             "inf", "nan", "0x10", "1e2.5", "5 mm"})
        QTest::newRow(text) << QString::fromLatin1(text);
    QTest::newRow("digits of another script") << QStringLiteral("٣");
}

void KvDeskNumberBoxTest::swallowsNoKey()
{
    QFETCH(QString, typed);
    KvDeskNumberBox box;
    box.setValue(7.0);
    box.selectAll();
    for (const QChar letter : typed)
        QTest::sendKeyEvent(QTest::Click, &box, Qt::Key_unknown, QString(letter), Qt::NoModifier);
    QCOMPARE(box.text(), typed);
    QVERIFY(!box.isNumber());
    QCOMPARE(box.value(), 0.0);
    box.setValue(2.0);
    QVERIFY(box.isNumber());
    QCOMPARE(box.text(), QStringLiteral("2"));
}

void KvDeskNumberBoxTest::showsNumbers_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<QString>("text");
    QTest::newRow("none") << 0.0 << QString();
    QTest::newRow("whole") << 100.0 << QStringLiteral("100");
    QTest::newRow("fraction") << 0.345 << QStringLiteral("0.345");
    QTest::newRow("many digits") << 1.0 / 3.0 << QStringLiteral("0.3333333333");
}

void KvDeskNumberBoxTest::showsNumbers()
{
    QFETCH(double, value);
    KvDeskNumberBox box;
    box.setValue(1.0);
    box.setValue(value);
    QTEST(box.text(), "text");
}

void KvDeskNumberBoxTest::keepsAllDigits()
{
    KvDeskNumberBox box;
    box.setValue(1.0 / 3.0);
    QCOMPARE(box.value(), 1.0 / 3.0);
}

void KvDeskNumberBoxTest::announcesWhatIsTyped()
{
    KvDeskNumberBox box;
    QSignalSpy changed(&box, SIGNAL(valueChanged(double)));
    QTest::keyClicks(&box, QStringLiteral("1,5"));
    QCOMPARE(changed.last().first().toDouble(), 1.5);
}

void KvDeskNumberBoxTest::faultsAreMarked()
{
    KvDeskNumberBox box;
    box.setStyleSheet(QStringLiteral("QLineEdit { border: 3px solid #00ff00 }"
                                     "QLineEdit[invalid=\"true\"] { border-color: #ff0000 }"));
    box.setToolTip(QStringLiteral("Width"));
    const auto border = [&box]() { return box.grab().toImage().pixelColor(box.width() / 2, 1); };
    QCOMPARE(border(), QColor(0, 255, 0));
    box.setFault(QStringLiteral("too much"));
    QCOMPARE(border(), QColor(255, 0, 0));
    QCOMPARE(box.toolTip(), QStringLiteral("too much"));
    QCOMPARE(box.accessibleDescription(), QStringLiteral("too much"));
    box.setFault(QString());
    QCOMPARE(border(), QColor(0, 255, 0));
    QCOMPARE(box.toolTip(), QStringLiteral("Width"));
    QCOMPARE(box.accessibleDescription(), QString());
}

STATREPORT_TEST_MAIN(KvDeskNumberBoxTest)
#include "KvDeskNumberBoxTest.moc"
