// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvThemeOptionsRow.h"
#include "charts/KvChartThemes.h"

#include <QRadioButton>

using kvCharts::KvChartThemes;

class KvThemeOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void textsAreLiteral();
    void choicesAreThemes();
};

void KvThemeOptionsRowTest::textsAreLiteral()
{
    KvThemeOptionsRow row;
    QVERIFY(PanelProbe::show(&row));
    QCOMPARE(PanelProbe::labelTexts(&row), QStringList{"Color theme:"});
    QCOMPARE(PanelProbe::buttonTexts<QRadioButton>(&row), QStringList({"Dark", "Light"}));
}

void KvThemeOptionsRowTest::choicesAreThemes()
{
    KvThemeOptionsRow row;
    row.setChoice(KvChartThemes::Dark);
    QVERIFY(PanelProbe::show(&row));
    QVERIFY(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Dark"))->isChecked());
    PanelProbe::click(PanelProbe::button<QRadioButton>(&row, QStringLiteral("Light")));
    QCOMPARE(row.choice(), int(KvChartThemes::Light));
}

STATREPORT_TEST_MAIN(KvThemeOptionsRowTest)
#include "KvThemeOptionsRowTest.moc"
