// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "MetaMethods.h"
#include "PanelProbe.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"
#include "blocks/statisticstable/KvStatisticsStatsTableOptionsWidget.h"

#include <QCheckBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>

using kvCharts::KvChartThemes;

namespace {

using Cfg = KvStatisticsStatsTableNodeCfg;
using Panel = KvStatisticsStatsTableOptionsWidget;

/** Counts all that the panel says. */
struct PanelSpies
{
    explicit PanelSpies(Panel *panel)
        : width(panel, SIGNAL(signalWidthChanged(int)))
                , alignment(panel, SIGNAL(signalAlignmentChanged(Qt::Alignment)))
                            , theme(panel, SIGNAL(signalThemeChanged(kvCharts::KvChartThemes::ThemeType)))
                                    , groupBy(panel, SIGNAL(signalGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy)))
                                              , columns(panel, SIGNAL(signalColumnsChanged(QSet<QString>)))
    {}

    int total() const
    {
        return width.count() + alignment.count() + theme.count() + groupBy.count() + columns.count();
    }

    QSignalSpy width;
    QSignalSpy alignment;
    QSignalSpy theme;
    QSignalSpy groupBy;
    QSignalSpy columns;
};

QStringList checkedChoices(const QWidget *panel)
{
    QStringList texts;
    for (const QRadioButton *button : PanelProbe::controls<QRadioButton>(panel)) {
        if (button->isChecked())
            texts.append(button->text());
    }
    return texts;
}

} // namespace

class KvStatisticsStatsTableOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSignalsAndSlotsInOrder();
    void rowsStandInOrder();
    void textsAreLiteral();
    void controlsAreNamed();
    void theTabKeyGoesDown();
    void showsTheConfiguration_data();
    void showsTheConfiguration();
    void fillingEmitsNothing();
    void everyWidthIsGivenBack();
    void alignmentIsClicked_data();
    void alignmentIsClicked();
    void aNewTableShowsTheCentre();
    void themeIsClicked();
    void groupingIsClicked();
    void themeAndGroupingAreIndependent();
    void unknownChoicesCheckNothing();
    void columnsAreClicked();
    void unknownColumnsAreKept();
    void withoutPlacementTwoRowsAreMissing();
    void survivesItsConfiguration();
    void ignoresOtherConfigurations();

private:
    QSpinBox *widthBox() const { return m_panel->findChild<QSpinBox *>(); }
    QRadioButton *choice(const char *text) const
    {
        return PanelProbe::button<QRadioButton>(m_panel.get(), QLatin1String(text));
    }

    std::unique_ptr<Cfg> m_cfg;
    std::unique_ptr<Panel> m_panel;
};

void KvStatisticsStatsTableOptionsWidgetTest::init()
{
    StatReportTest::init();
    m_cfg = std::make_unique<Cfg>(nullptr);
    m_panel = std::make_unique<Panel>(m_cfg.get(), nullptr, true);
    QVERIFY(PanelProbe::show(m_panel.get()));
}

void KvStatisticsStatsTableOptionsWidgetTest::cleanup()
{
    m_panel.reset();
    m_cfg.reset();
    StatReportTest::cleanup();
}

void KvStatisticsStatsTableOptionsWidgetTest::declaresSignalsAndSlotsInOrder()
{
    const QMetaObject &metaObject = Panel::staticMetaObject;
    QCOMPARE(ownMethods(metaObject, QMetaMethod::Signal),
             QStringList({"signalWidthChanged(int)", "signalAlignmentChanged(Qt::Alignment)",
                          "signalThemeChanged(kvCharts::KvChartThemes::ThemeType)",
                          "signalGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy)",
                          "signalColumnsChanged(QSet<QString>)"}));
    QCOMPARE(
        ownMethods(metaObject, QMetaMethod::Slot),
        QStringList({"slotAlignLeftClicked()", "slotAlignCenterClicked()", "slotAlignRightClicked()",
                     "slotThemeToggled()", "slotGroupByToggled()", "slotColumnStateChanged(QString,int)"}));
}

void KvStatisticsStatsTableOptionsWidgetTest::rowsStandInOrder()
{
    const auto top = [this](const QWidget *control) {
        return control->mapTo(m_panel.get(), QPoint(0, 0)).y();
    };
    const auto buttons = PanelProbe::controls<QPushButton>(m_panel.get());
    const auto choices = PanelProbe::controls<QRadioButton>(m_panel.get());
    const auto boxes = PanelProbe::controls<QCheckBox>(m_panel.get());
    QCOMPARE(buttons.size(), 3);
    QCOMPARE(choices.size(), 4);
    QCOMPARE(boxes.size(), 6);

    QVector<QWidget *> rows{m_panel->findChild<QLabel *>(QStringLiteral("sideHeader")), widthBox(),
                            buttons.first(), choices.at(0), choices.at(2)};
    for (QCheckBox *box : boxes)
        rows.append(box);
    for (int i = 1; i < rows.size(); ++i)
        QVERIFY(top(rows.at(i - 1)) + rows.at(i - 1)->height() <= top(rows.at(i)));
    QCOMPARE(top(buttons.last()), top(buttons.first()));
    QCOMPARE(top(choices.at(1)), top(choices.at(0)));
    QCOMPARE(top(choices.at(3)), top(choices.at(2)));
}

void KvStatisticsStatsTableOptionsWidgetTest::textsAreLiteral()
{
    const QStringList labels = PanelProbe::labelTexts(m_panel.get());
    QCOMPARE(labels.mid(labels.size() - 3), QStringList({"Color theme:", "Group by:", "Select columns:"}));
    QCOMPARE(PanelProbe::buttonTexts<QRadioButton>(m_panel.get()),
             QStringList({"Dark", "Light", "Object", "Measurement"}));
    QCOMPARE(PanelProbe::buttonTexts<QCheckBox>(m_panel.get()),
             QStringList({"Min", "Max", "Average", "Sigma", "3 Sigma", "6 Sigma"}));
    QCOMPARE(widthBox()->suffix(), QStringLiteral("%"));
}

void KvStatisticsStatsTableOptionsWidgetTest::controlsAreNamed()
{
    QVERIFY(!widthBox()->accessibleName().isEmpty());
    QVERIFY(!widthBox()->toolTip().isEmpty());
    for (const QPushButton *button : m_panel->findChildren<QPushButton *>()) {
        QVERIFY(!button->accessibleName().isEmpty());
        QVERIFY(!button->toolTip().isEmpty());
    }
}

void KvStatisticsStatsTableOptionsWidgetTest::theTabKeyGoesDown()
{
    m_panel->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_panel.get()));
    widthBox()->setFocus();
    QStringList visited;
    for (int i = 0; i < 11; ++i) {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        const auto *button = qobject_cast<QAbstractButton *>(QApplication::focusWidget());
        QVERIFY(button);
        visited.append(button->text().isEmpty() ? button->accessibleName() : button->text());
    }
    // A pair of radio buttons is one stop: its checked one.
    QCOMPARE(visited, QStringList({"Align left", "Align center", "Align right", "Dark", "Object", "Min",
                                   "Max", "Average", "Sigma", "3 Sigma", "6 Sigma"}));
}

void KvStatisticsStatsTableOptionsWidgetTest::showsTheConfiguration_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("checkedAlignment");
    QTest::addColumn<int>("theme");
    QTest::addColumn<int>("grouping");
    QTest::addColumn<QStringList>("choices");
    QTest::addColumn<QSet<QString>>("columns");
    QTest::newRow("a new table") << 4 << 1 << 0 << 1 << QStringList{"Dark", "Object"}
                                 << QSet<QString>{"Min", "Max", "Average", "Sigma", "3 Sigma", "6 Sigma"};
    QTest::newRow("left, light") << 1 << 0 << 1 << 1 << QStringList{"Light", "Object"}
                                 << QSet<QString>{"Sigma"};
    QTest::newRow("right, by measurement")
        << 2 << 2 << 0 << 0 << QStringList{"Dark", "Measurement"} << QSet<QString>{};
    QTest::newRow("centred as other tables")
        << 132 << 1 << 1 << 0 << QStringList{"Light", "Measurement"} << QSet<QString>{"3 Sigma", "Max"};
}

void KvStatisticsStatsTableOptionsWidgetTest::showsTheConfiguration()
{
    QFETCH(int, alignment);
    QFETCH(int, checkedAlignment);
    QFETCH(int, theme);
    QFETCH(int, grouping);
    QFETCH(QStringList, choices);
    QFETCH(QSet<QString>, columns);
    Cfg cfg(nullptr);
    cfg.setAlignment(Qt::Alignment(alignment));
    cfg.setWidthPercent(59);
    cfg.setTheme(theme);
    cfg.setGroupBy(static_cast<Cfg::GroupBy>(grouping));
    cfg.setColumns(columns);
    const Cfg::Options before = cfg.options();
    const Panel fresh(&cfg, nullptr, true);
    m_panel->setFromConfig(&cfg);
    for (const Panel *panel : {&fresh, static_cast<const Panel *>(m_panel.get())}) {
        QCOMPARE(panel->findChild<QSpinBox *>()->value(), 59);
        const QStringList checked = checkedChoices(panel);
        QCOMPARE(QSet<QString>(checked.begin(), checked.end()),
                 QSet<QString>(choices.begin(), choices.end()));
        for (const QCheckBox *box : panel->findChildren<QCheckBox *>())
            QCOMPARE(box->isChecked(), columns.contains(box->text()));
        const auto buttons = panel->findChildren<QPushButton *>();
        for (int i = 0; i < 3; ++i)
            QCOMPARE(buttons.at(i)->isChecked(), i == checkedAlignment);
    }
    QVERIFY(cfg.options() == before); // showing writes nothing
    QCOMPARE(cfg.themeIndex(), theme);
}

void KvStatisticsStatsTableOptionsWidgetTest::fillingEmitsNothing()
{
    PanelSpies spies(m_panel.get());
    Cfg other(nullptr);
    other.setAlignment(Qt::AlignRight);
    other.setWidthPercent(12);
    other.setTheme(1);
    other.setGroupBy(Cfg::ByMeasurement);
    other.setColumns({QStringLiteral("Max")});
    const Cfg::Options before = m_cfg->options();
    m_panel->setFromConfig(&other);
    QCOMPARE(widthBox()->value(), 12);
    QCOMPARE(spies.total(), 0);
    QVERIFY(m_cfg->options() == before);
    QCOMPARE(m_cfg->themeIndex(), 0);
}

void KvStatisticsStatsTableOptionsWidgetTest::everyWidthIsGivenBack()
{
    PanelSpies spies(m_panel.get());
    for (int percent = 1; percent <= 100; ++percent) {
        m_cfg->setWidthPercent(percent);
        m_panel->setFromConfig(m_cfg.get());
        QCOMPARE(widthBox()->value(), percent);
    }
    QCOMPARE(spies.total(), 0);
    for (int percent = 99; percent >= 1; --percent) {
        QTest::keyClick(widthBox(), Qt::Key_Down);
        QCOMPARE(m_cfg->widthPercent(), percent);
        QCOMPARE(spies.width.last().first().toInt(), percent);
    }
    QTest::keyClick(widthBox(), Qt::Key_Down); // not below 1
    QCOMPARE(m_cfg->widthPercent(), 1);
    QCOMPARE(spies.width.count(), 99);
    QCOMPARE(spies.total(), 99);
}

void KvStatisticsStatsTableOptionsWidgetTest::alignmentIsClicked_data()
{
    QTest::addColumn<int>("before");
    QTest::addColumn<int>("button");
    QTest::addColumn<int>("alignment");
    QTest::newRow("left") << 4 << 0 << 1;
    QTest::newRow("centre") << 1 << 1 << 132;
    QTest::newRow("right") << 132 << 2 << 2;
}

void KvStatisticsStatsTableOptionsWidgetTest::alignmentIsClicked()
{
    QFETCH(int, before);
    QFETCH(int, button);
    QFETCH(int, alignment);
    m_cfg->setAlignment(Qt::Alignment(before));
    m_panel->setFromConfig(m_cfg.get());
    PanelSpies spies(m_panel.get());
    const auto buttons = PanelProbe::controls<QPushButton>(m_panel.get());
    for (int click = 1; click <= 2; ++click) { // a second click must not leave all buttons unchecked
        PanelProbe::click(buttons.at(button));
        QCOMPARE(int(m_cfg->alignment()), alignment);
        QCOMPARE(spies.alignment.count(), click);
        QCOMPARE(int(spies.alignment.last().first().value<Qt::Alignment>()), alignment);
        for (int i = 0; i < 3; ++i)
            QCOMPARE(buttons.at(i)->isChecked(), i == button);
    }
    QCOMPARE(spies.total(), 2);
}

void KvStatisticsStatsTableOptionsWidgetTest::aNewTableShowsTheCentre()
{
    QVERIFY(PanelProbe::controls<QPushButton>(m_panel.get()).at(1)->isChecked());
    QCOMPARE(int(m_cfg->alignment()), 4); // and the value stays as it was
}

void KvStatisticsStatsTableOptionsWidgetTest::themeIsClicked()
{
    PanelSpies spies(m_panel.get());
    PanelProbe::click(choice("Light"));
    QCOMPARE(m_cfg->themeIndex(), 1);
    QCOMPARE(spies.theme.count(), 2); // one button goes off, the other comes on
    for (const QList<QVariant> &arguments : spies.theme)
        QCOMPARE(arguments.first().value<KvChartThemes::ThemeType>(), KvChartThemes::Light);
    PanelProbe::click(choice("Light"));
    QCOMPARE(spies.theme.count(), 2);
    PanelProbe::click(choice("Dark"));
    QCOMPARE(m_cfg->themeIndex(), 0);
    QCOMPARE(spies.theme.last().first().value<KvChartThemes::ThemeType>(), KvChartThemes::Dark);
    QCOMPARE(spies.total(), spies.theme.count());
}

void KvStatisticsStatsTableOptionsWidgetTest::groupingIsClicked()
{
    PanelSpies spies(m_panel.get());
    PanelProbe::click(choice("Measurement"));
    QCOMPARE(m_cfg->groupBy(), Cfg::ByMeasurement);
    QCOMPARE(spies.groupBy.count(), 2);
    for (const QList<QVariant> &arguments : spies.groupBy)
        QCOMPARE(arguments.first().value<Cfg::GroupBy>(), Cfg::ByMeasurement);
    PanelProbe::click(choice("Measurement"));
    QCOMPARE(spies.groupBy.count(), 2);
    PanelProbe::click(choice("Object"));
    QCOMPARE(m_cfg->groupBy(), Cfg::ByObject);
    QCOMPARE(spies.groupBy.last().first().value<Cfg::GroupBy>(), Cfg::ByObject);
    QCOMPARE(spies.total(), spies.groupBy.count());
}

void KvStatisticsStatsTableOptionsWidgetTest::themeAndGroupingAreIndependent()
{
    PanelProbe::click(choice("Light"));
    PanelProbe::click(choice("Measurement"));
    QCOMPARE(checkedChoices(m_panel.get()), QStringList({"Light", "Measurement"}));
    QCOMPARE(m_cfg->themeIndex(), 1);
    PanelProbe::click(choice("Dark"));
    QCOMPARE(checkedChoices(m_panel.get()), QStringList({"Dark", "Measurement"}));
    QCOMPARE(m_cfg->groupBy(), Cfg::ByMeasurement);
}

void KvStatisticsStatsTableOptionsWidgetTest::unknownChoicesCheckNothing()
{
    QVERIFY(m_cfg->fromJson(
        {{"alignment", 0}, {"groupBy", 7}, {"widthPercent", 50}, {"columns", ""}, {"theme", "Blue"}}));
    PanelSpies spies(m_panel.get());
    m_panel->setFromConfig(m_cfg.get());
    QCOMPARE(checkedChoices(m_panel.get()), QStringList());
    for (const QPushButton *button : m_panel->findChildren<QPushButton *>())
        QVERIFY(!button->isChecked());
    QCOMPARE(spies.total(), 0);
    PanelProbe::click(choice("Dark"));
    PanelProbe::click(choice("Object"));
    QCOMPARE(m_cfg->themeIndex(), 0);
    QCOMPARE(m_cfg->groupBy(), Cfg::ByObject);
    QCOMPARE(spies.total(), 2);
}

void KvStatisticsStatsTableOptionsWidgetTest::columnsAreClicked()
{
    PanelSpies spies(m_panel.get());
    QSet<QString> columns = m_cfg->columns();
    for (const bool isOn : {false, true}) {
        for (const QString &name : Cfg::columnNames()) {
            spies.columns.clear();
            PanelProbe::click(PanelProbe::button<QCheckBox>(m_panel.get(), name));
            if (isOn)
                columns.insert(name);
            else
                columns.remove(name);
            QCOMPARE(m_cfg->columns(), columns);
            QCOMPARE(spies.columns.count(), 1);
            QCOMPARE(spies.columns.first().first().value<QSet<QString>>(), columns);
        }
        QCOMPARE(columns.size(), isOn ? 6 : 0);
    }
    QCOMPARE(spies.total(), spies.columns.count());
}

void KvStatisticsStatsTableOptionsWidgetTest::unknownColumnsAreKept()
{
    m_cfg->setColumns({QStringLiteral("Median"), QStringLiteral("Min")});
    m_panel->setFromConfig(m_cfg.get());
    PanelProbe::click(PanelProbe::button<QCheckBox>(m_panel.get(), QStringLiteral("Min")));
    QCOMPARE(m_cfg->columns(), QSet<QString>{"Median"});
}

void KvStatisticsStatsTableOptionsWidgetTest::withoutPlacementTwoRowsAreMissing()
{
    QWidget parent;
    auto *panel = new Panel(m_cfg.get(), &parent, false);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(!panel->findChild<QSpinBox *>());
    QVERIFY(panel->findChildren<QPushButton *>().isEmpty());
    QCOMPARE(panel->findChildren<QRadioButton *>().size(), 4);
    QCOMPARE(panel->findChildren<QCheckBox *>().size(), 6);
    m_cfg->setWidthPercent(3);
    panel->setFromConfig(m_cfg.get()); // nothing there to show width and alignment in
    QCOMPARE(m_cfg->widthPercent(), 3);
}

void KvStatisticsStatsTableOptionsWidgetTest::survivesItsConfiguration()
{
    PanelSpies spies(m_panel.get());
    m_cfg.reset();
    QTest::keyClick(widthBox(), Qt::Key_Up);
    PanelProbe::click(PanelProbe::controls<QPushButton>(m_panel.get()).first());
    PanelProbe::click(choice("Light"));
    PanelProbe::click(choice("Measurement"));
    PanelProbe::click(PanelProbe::button<QCheckBox>(m_panel.get(), QStringLiteral("Max")));
    QCOMPARE(spies.total(), 0);
}

void KvStatisticsStatsTableOptionsWidgetTest::ignoresOtherConfigurations()
{
    KvStatisticsMeasurementsTableNodeCfg other(nullptr);
    other.setWidthPercent(5);
    m_panel->setFromConfig(&other);
    m_panel->setFromConfig(nullptr);
    QCOMPARE(widthBox()->value(), 75);
}

STATREPORT_TEST_MAIN(KvStatisticsStatsTableOptionsWidgetTest)
#include "KvStatisticsStatsTableOptionsWidgetTest.moc"
