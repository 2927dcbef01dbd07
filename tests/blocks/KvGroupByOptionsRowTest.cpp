// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvGroupByOptionsRow.h"

#include <QRadioButton>

class KvGroupByOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void textsAreLiteral();
    void showsGroupings_data();
    void showsGroupings();
    void clickingSwitches();
};

void KvGroupByOptionsRowTest::textsAreLiteral()
{
    KvGroupByOptionsRow row;
    QVERIFY(PanelProbe::show(&row));
    QCOMPARE(PanelProbe::labelTexts(&row), QStringList{"Group by:"});
    QCOMPARE(PanelProbe::buttonTexts<QRadioButton>(&row), QStringList({"Object", "Measurement"}));
    QCOMPARE(row.grouping(), -1);
}

void KvGroupByOptionsRowTest::showsGroupings_data()
{
    QTest::addColumn<int>("grouping");
    QTest::addColumn<int>("shown");
    QTest::addColumn<QString>("checked");
    QTest::newRow("by measurement") << 0 << 0 << "Measurement";
    QTest::newRow("by object") << 1 << 1 << "Object";
    QTest::newRow("unknown") << 2 << -1 << "";
    QTest::newRow("negative") << -1 << -1 << "";
}

void KvGroupByOptionsRowTest::showsGroupings()
{
    QFETCH(int, grouping);
    KvGroupByOptionsRow row;
    QSignalSpy toggled(&row, SIGNAL(signalToggled()));
    row.setGrouping(1 - grouping); // another one before
    row.setGrouping(grouping);
    QTEST(row.grouping(), "shown");
    QStringList checked;
    for (const QRadioButton *button : row.findChildren<QRadioButton *>()) {
        if (button->isChecked())
            checked.append(button->text());
    }
    QTEST(checked.join(QLatin1Char(' ')), "checked");
    QCOMPARE(toggled.count(), 0);
}

void KvGroupByOptionsRowTest::clickingSwitches()
{
    KvGroupByOptionsRow row;
    row.setGrouping(1);
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy toggled(&row, SIGNAL(signalToggled()));
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Measurement")));
    QCOMPARE(row.grouping(), 0);
    QCOMPARE(toggled.count(), 2);
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Object")));
    QCOMPARE(row.grouping(), 1);
    QCOMPARE(toggled.count(), 4);
}

STATREPORT_TEST_MAIN(KvGroupByOptionsRowTest)
#include "KvGroupByOptionsRowTest.moc"
