// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvWidthOptionsRow.h"

#include <QSpinBox>

class KvWidthOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void goesFromOneToHundredPercent();
    void settingEmitsNothing();
    void showsEveryWidth();
    void isWrittenAsInReports();
    void outOfRangeIsClamped_data();
    void outOfRangeIsClamped();
    void typingEmits();
    void keysEmitOncePerStep();
};

void KvWidthOptionsRowTest::goesFromOneToHundredPercent()
{
    const KvWidthOptionsRow row;
    const auto *box = row.findChild<QSpinBox *>();
    QVERIFY(box);
    QCOMPARE(box->minimum(), 1);
    QCOMPARE(box->maximum(), 100);
    QCOMPARE(box->suffix(), QStringLiteral("%"));
    QCOMPARE(row.findChildren<QSpinBox *>().size(), 1);
}

void KvWidthOptionsRowTest::settingEmitsNothing()
{
    KvWidthOptionsRow row;
    QSignalSpy changed(&row, SIGNAL(signalWidthChanged(int)));
    row.setWidthPercent(40);
    row.setWidthPercent(100);
    QCOMPARE(row.widthPercent(), 100);
    QCOMPARE(changed.count(), 0);
}

void KvWidthOptionsRowTest::showsEveryWidth()
{
    KvWidthOptionsRow row;
    for (int percent = 1; percent <= 100; ++percent) {
        row.setWidthPercent(percent);
        QCOMPARE(row.widthPercent(), percent);
    }
}

void KvWidthOptionsRowTest::isWrittenAsInReports()
{
    QLocale::setDefault(QLocale(QLocale::Arabic, QLocale::Egypt));
    KvWidthOptionsRow row;
    row.setWidthPercent(42);
    const QString text = row.findChild<QSpinBox *>()->text();
    QLocale::setDefault(QLocale::c());
    QCOMPARE(text, QStringLiteral("42%"));
}

void KvWidthOptionsRowTest::outOfRangeIsClamped_data()
{
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("shown");
    QTest::newRow("0") << 0 << 1;
    QTest::newRow("negative") << -20 << 1;
    QTest::newRow("101") << 101 << 100;
}

void KvWidthOptionsRowTest::outOfRangeIsClamped()
{
    QFETCH(int, percent);
    KvWidthOptionsRow row;
    row.setWidthPercent(percent);
    QTEST(row.widthPercent(), "shown");
}

void KvWidthOptionsRowTest::typingEmits()
{
    KvWidthOptionsRow row;
    row.setWidthPercent(75);
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy changed(&row, SIGNAL(signalWidthChanged(int)));
    auto *box = row.findChild<QSpinBox *>();
    box->selectAll();
    QTest::keyClicks(box, QStringLiteral("59"));
    QCOMPARE(row.widthPercent(), 59);
    QCOMPARE(changed.last().first().toInt(), 59);
}

void KvWidthOptionsRowTest::keysEmitOncePerStep()
{
    KvWidthOptionsRow row;
    row.setWidthPercent(99);
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy changed(&row, SIGNAL(signalWidthChanged(int)));
    auto *box = row.findChild<QSpinBox *>();
    QTest::keyClick(box, Qt::Key_Up);
    QTest::keyClick(box, Qt::Key_Up); // there is no 101
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().toInt(), 100);
}

STATREPORT_TEST_MAIN(KvWidthOptionsRowTest)
#include "KvWidthOptionsRowTest.moc"
