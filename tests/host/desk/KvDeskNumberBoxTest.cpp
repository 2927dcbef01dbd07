// SPDX-License-Identifier: MIT
#include "KvDeskNumberBox.h"

#include "support/StatReportTest.h"

class KvDeskNumberBoxTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void takesTypedNumbers_data();
    void takesTypedNumbers();
    void showsNumbers_data();
    void showsNumbers();
    void announcesWhatIsTyped();
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
    QTest::newRow("letters are left out") << QStringLiteral("1a2") << 12.0;
    QTest::newRow("no minus") << QStringLiteral("-3") << 3.0;
    QTest::newRow("a second point is left out") << QStringLiteral("1.2.3") << 1.23;
    QTest::newRow("digits beyond the largest are left out") << QStringLiteral("12345678901") << 123456789.0;
}

void KvDeskNumberBoxTest::takesTypedNumbers()
{
    QFETCH(QString, typed);
    QFETCH(double, value);
    KvDeskNumberBox box;
    QTest::keyClicks(&box, typed);
    QTest::keyClick(&box, Qt::Key_Return);
    QCOMPARE(box.value(), value);
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

void KvDeskNumberBoxTest::announcesWhatIsTyped()
{
    KvDeskNumberBox box;
    QSignalSpy changed(&box, SIGNAL(valueChanged(double)));
    QTest::keyClicks(&box, QStringLiteral("1,5"));
    QCOMPARE(changed.last().first().toDouble(), 1.5);
}

STATREPORT_TEST_MAIN(KvDeskNumberBoxTest)
#include "KvDeskNumberBoxTest.moc"
