// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvColumnsOptionsRow.h"

#include <QCheckBox>

namespace {
const QStringList names{QStringLiteral("Min"), QStringLiteral("Max"), QStringLiteral("Average")};
const QStringList labels{QStringLiteral("Minimum"), QStringLiteral("Maximum"), QStringLiteral("Mittelwert")};
} // namespace

class KvColumnsOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsTitleAndLabels();
    void missingLabelsAreTheNames();
    void settingChecksAndEmitsNothing();
    void clickingTellsNameAndState();
};

void KvColumnsOptionsRowTest::showsTitleAndLabels()
{
    KvColumnsOptionsRow row(names, labels);
    QVERIFY(PanelProbe::show(&row));
    QCOMPARE(PanelProbe::labelTexts(&row), QStringList{"Select columns:"});
    QCOMPARE(PanelProbe::buttonTexts<QCheckBox>(&row), labels);
    for (const QCheckBox *box : row.findChildren<QCheckBox *>())
        QVERIFY(!box->isChecked());
}

void KvColumnsOptionsRowTest::missingLabelsAreTheNames()
{
    KvColumnsOptionsRow row(names, {QStringLiteral("Minimum")});
    QVERIFY(PanelProbe::show(&row));
    QCOMPARE(PanelProbe::buttonTexts<QCheckBox>(&row), QStringList({"Minimum", "Max", "Average"}));
}

void KvColumnsOptionsRowTest::settingChecksAndEmitsNothing()
{
    KvColumnsOptionsRow row(names, labels);
    QSignalSpy changed(&row, SIGNAL(signalColumnStateChanged(QString, int)));
    row.setColumns({QStringLiteral("Max"), QStringLiteral("unknown")});
    for (const QCheckBox *box : row.findChildren<QCheckBox *>())
        QCOMPARE(box->isChecked(), box->text() == QLatin1String("Maximum"));
    row.setColumns({});
    for (const QCheckBox *box : row.findChildren<QCheckBox *>())
        QVERIFY(!box->isChecked());
    QCOMPARE(changed.count(), 0);
}

void KvColumnsOptionsRowTest::clickingTellsNameAndState()
{
    KvColumnsOptionsRow row(names, labels);
    row.setColumns({QStringLiteral("Max")});
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy changed(&row, SIGNAL(signalColumnStateChanged(QString, int)));
    PanelProbe::click(PanelProbe::button<QCheckBox>(&row, QStringLiteral("Mittelwert")));
    PanelProbe::click(PanelProbe::button<QCheckBox>(&row, QStringLiteral("Maximum")));
    QCOMPARE(changed.count(), 2);
    QCOMPARE(changed.at(0), QList<QVariant>({QStringLiteral("Average"), 2}));
    QCOMPARE(changed.at(1), QList<QVariant>({QStringLiteral("Max"), 0}));
}

STATREPORT_TEST_MAIN(KvColumnsOptionsRowTest)
#include "KvColumnsOptionsRowTest.moc"
