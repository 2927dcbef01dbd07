// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvChoiceOptionsRow.h"

#include <QRadioButton>
#include <QVBoxLayout>

namespace {
const QStringList themes{QStringLiteral("Dark"), QStringLiteral("Light")};
}

class KvChoiceOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsTitleAndChoices();
    void settingEmitsNothing();
    void clickingSwitches();
    void choicesWithoutButtonUncheckAll();
    void rowsOfOnePanelAreIndependent();
};

void KvChoiceOptionsRowTest::showsTitleAndChoices()
{
    const KvChoiceOptionsRow row(QStringLiteral("Color theme:"), themes);
    QCOMPARE(PanelProbe::labelTexts(&row), QStringList{"Color theme:"});
    QCOMPARE(row.findChildren<QRadioButton *>().size(), 2);
    QCOMPARE(row.choice(), -1);
}

void KvChoiceOptionsRowTest::settingEmitsNothing()
{
    KvChoiceOptionsRow row(QStringLiteral("Color theme:"), themes);
    QSignalSpy toggled(&row, SIGNAL(signalToggled()));
    row.setChoice(0);
    QCOMPARE(row.choice(), 0);
    row.setChoice(1);
    QCOMPARE(row.choice(), 1);
    QCOMPARE(toggled.count(), 0);
}

void KvChoiceOptionsRowTest::clickingSwitches()
{
    KvChoiceOptionsRow row(QStringLiteral("Color theme:"), themes);
    row.setChoice(0);
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy toggled(&row, SIGNAL(signalToggled()));
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Light")));
    QCOMPARE(row.choice(), 1);
    QCOMPARE(toggled.count(), 2);
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Light")));
    QCOMPARE(toggled.count(), 2);
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Dark")));
    QCOMPARE(row.choice(), 0);
    QCOMPARE(toggled.count(), 4);
}

void KvChoiceOptionsRowTest::choicesWithoutButtonUncheckAll()
{
    KvChoiceOptionsRow row(QStringLiteral("Color theme:"), themes);
    QSignalSpy toggled(&row, SIGNAL(signalToggled()));
    row.setChoice(1);
    row.setChoice(-1);
    QCOMPARE(row.choice(), -1);
    for (const QRadioButton *button : row.findChildren<QRadioButton *>())
        QVERIFY(!button->isChecked());
    row.setChoice(7);
    QCOMPARE(row.choice(), -1);
    QCOMPARE(toggled.count(), 0);

    QVERIFY(PanelProbe::show(&row)); // still exclusive afterwards
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Light")));
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Dark")));
    QCOMPARE(row.choice(), 0);
    QVERIFY(!PanelProbe::button<QRadioButton>(&row, QStringLiteral("Light"))->isChecked());
}

void KvChoiceOptionsRowTest::rowsOfOnePanelAreIndependent()
{
    QWidget panel;
    auto *layout = new QVBoxLayout(&panel);
    auto *theme = new KvChoiceOptionsRow(QStringLiteral("Color theme:"), themes, &panel);
    auto *group = new KvChoiceOptionsRow(QStringLiteral("Group by:"),
                                         {QStringLiteral("Object"), QStringLiteral("Measurement")}, &panel);
    layout->addWidget(theme);
    layout->addWidget(group);
    theme->setChoice(0);
    group->setChoice(0);
    QVERIFY(PanelProbe::show(&panel));
    PanelProbe::click(PanelProbe::button<QRadioButton>(theme, QStringLiteral("Light")));
    PanelProbe::click(PanelProbe::button<QRadioButton>(group, QStringLiteral("Measurement")));
    QCOMPARE(theme->choice(), 1);
    QCOMPARE(group->choice(), 1);
}

STATREPORT_TEST_MAIN(KvChoiceOptionsRowTest)
#include "KvChoiceOptionsRowTest.moc"
