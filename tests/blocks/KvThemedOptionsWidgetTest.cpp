// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvThemedOptionsWidget.h"

#include <QCheckBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>

namespace {

QString spacedLabel(const QString &name)
{
    return QStringLiteral("the ") + name;
}

/** A panel with all rows that writes down what they call. */
class Panel : public KvThemedOptionsWidget
{
    Q_OBJECT
public:
    Panel()
        : KvThemedOptionsWidget(QStringLiteral("Everything"), nullptr)
    {}

    void addAllRows()
    {
        addPlacementRows();
        addThemeRow();
        addGroupByRow();
        addColumnsRow({QStringLiteral("Min"), QStringLiteral("Max")}, &spacedLabel);
    }
    void setFromConfig(const KvBaseEditorNodeCfg *) override {}

    using KvThemedOptionsWidget::changedColumns;
    using KvThemedOptionsWidget::chosenGrouping;
    using KvThemedOptionsWidget::chosenTheme;
    using KvThemedOptionsWidget::showColumns;
    using KvThemedOptionsWidget::showGrouping;
    using KvThemedOptionsWidget::showPlacement;
    using KvThemedOptionsWidget::showTheme;

    QStringList calls;

public slots:
    void slotWidthEdited(int aWidth) { calls.append(QStringLiteral("width %1").arg(aWidth)); }
    void slotAlignLeftClicked() { calls.append(QStringLiteral("left")); }
    void slotAlignCenterClicked() { calls.append(QStringLiteral("centre")); }
    void slotAlignRightClicked() { calls.append(QStringLiteral("right")); }
    void slotThemeToggled() { calls.append(QStringLiteral("theme %1").arg(chosenTheme())); }
    void slotGroupByToggled() { calls.append(QStringLiteral("grouping %1").arg(chosenGrouping())); }
    void slotColumnStateChanged(const QString &aName, int aState)
    {
        calls.append(QStringLiteral("%1 %2").arg(aName, QString::number(aState)));
    }
};

} // namespace

class KvThemedOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void rowsCallTheSlotsOfThePanel();
    void showingCallsNothing();
    void rowsThatAreMissingShowNothing();
    void columnsChangeByTheirBoxes_data();
    void columnsChangeByTheirBoxes();
};

void KvThemedOptionsWidgetTest::rowsCallTheSlotsOfThePanel()
{
    Panel panel;
    panel.addAllRows();
    panel.showPlacement(50, Qt::AlignLeft);
    panel.showTheme(0);
    panel.showGrouping(1);
    panel.showColumns({QStringLiteral("Max")});
    QVERIFY(PanelProbe::show(&panel));
    QTest::keyClick(panel.findChild<QSpinBox *>(), Qt::Key_Up);
    for (QPushButton *button : PanelProbe::controls<QPushButton>(&panel))
        PanelProbe::click(button);
    PanelProbe::click(PanelProbe::button<QRadioButton>(&panel, QStringLiteral("Light")));
    PanelProbe::click(PanelProbe::button<QRadioButton>(&panel, QStringLiteral("Measurement")));
    for (QCheckBox *box : PanelProbe::controls<QCheckBox>(&panel))
        PanelProbe::click(box);
    // A pair of buttons calls twice: one goes off, the other comes on.
    QCOMPARE(panel.calls, QStringList({"width 51", "left", "centre", "right", "theme 1", "theme 1",
                                       "grouping 0", "grouping 0", "Min 2", "Max 0"}));
    QCOMPARE(PanelProbe::buttonTexts<QCheckBox>(&panel), QStringList({"the Min", "the Max"}));
}

void KvThemedOptionsWidgetTest::showingCallsNothing()
{
    Panel panel;
    panel.addAllRows();
    panel.showPlacement(7, Qt::AlignRight);
    panel.showTheme(1);
    panel.showGrouping(0);
    panel.showColumns({QStringLiteral("Min")});
    QCOMPARE(panel.findChild<QSpinBox *>()->value(), 7);
    QVERIFY(panel.findChildren<QPushButton *>().last()->isChecked());
    QCOMPARE(panel.chosenTheme(), 1);
    QCOMPARE(panel.chosenGrouping(), 0);
    QVERIFY(panel.findChildren<QCheckBox *>().first()->isChecked());
    QVERIFY(!panel.findChildren<QCheckBox *>().last()->isChecked());
    QCOMPARE(panel.calls, QStringList());
}

void KvThemedOptionsWidgetTest::rowsThatAreMissingShowNothing()
{
    Panel panel;
    panel.showPlacement(50, Qt::AlignLeft);
    panel.showTheme(1);
    panel.showGrouping(1);
    panel.showColumns({QStringLiteral("Min")});
    QCOMPARE(panel.chosenTheme(), -1);
    QCOMPARE(panel.chosenGrouping(), -1);
}

void KvThemedOptionsWidgetTest::columnsChangeByTheirBoxes_data()
{
    QTest::addColumn<QSet<QString>>("columns");
    QTest::addColumn<int>("state");
    QTest::addColumn<QSet<QString>>("changed");
    QTest::newRow("one more") << QSet<QString>{"Max", "?"} << 2 << QSet<QString>{"Min", "Max", "?"};
    QTest::newRow("one less") << QSet<QString>{"Min", "?"} << 0 << QSet<QString>{"?"};
    QTest::newRow("there already") << QSet<QString>{"Min"} << 2 << QSet<QString>{"Min"};
    QTest::newRow("not there") << QSet<QString>{"Max"} << 0 << QSet<QString>{"Max"};
}

void KvThemedOptionsWidgetTest::columnsChangeByTheirBoxes()
{
    QFETCH(QSet<QString>, columns);
    QFETCH(int, state);
    QTEST(Panel::changedColumns(columns, QStringLiteral("Min"), state), "changed");
}

STATREPORT_TEST_MAIN(KvThemedOptionsWidgetTest)
#include "KvThemedOptionsWidgetTest.moc"
