// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "MetaMethods.h"
#include "PanelProbe.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableOptionsWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"

#include <QCheckBox>
#include <QComboBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>

using kvCharts::KvChartThemes;

namespace {

using Cfg = KvStatisticsMeasurementsTableNodeCfg;
using Panel = KvStatisticsMeasurementsTableOptionsWidget;

/** Counts all that the panel says. */
struct PanelSpies
{
    explicit PanelSpies(Panel *panel)
        : width(panel, SIGNAL(signalWidthChanged(int)))
                , alignment(panel, SIGNAL(signalAlignmentChanged(Qt::Alignment)))
                            , theme(panel, SIGNAL(signalThemeChanged(kvCharts::KvChartThemes::ThemeType)))
                                    , columns(panel, SIGNAL(signalColumnsChanged(QSet<QString>)))
                                              , order(panel, SIGNAL(signalOrderByChanged(QString, bool)))
    {}

    int total() const
    {
        return width.count() + alignment.count() + theme.count() + columns.count() + order.count();
    }

    QSignalSpy width;
    QSignalSpy alignment;
    QSignalSpy theme;
    QSignalSpy columns;
    QSignalSpy order;
};

} // namespace

class KvStatisticsMeasurementsTableOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSignalsAndSlotsInOrder();
    void rowsStandInOrder();
    void textsAreLiteral();
    void showsTheConfiguration_data();
    void showsTheConfiguration();
    void fillingEmitsNothing();
    void widthIsTyped();
    void everyWidthIsGivenBack();
    void alignmentIsClicked_data();
    void alignmentIsClicked();
    void anyCentredAlignmentChecksTheCentre();
    void themeIsClicked();
    void anUnknownThemeChecksNothing();
    void columnsAreClicked();
    void unknownColumnsAreKept();
    void columnsAreToggledByKey();
    void orderIsChosen_data();
    void orderIsChosen();
    void defaultOrderIsChosen();
    void anUnknownOrderShowsDefault();
    void withoutPlacementTwoRowsAreMissing();
    void survivesItsConfiguration();
    void ignoresOtherConfigurations();

private:
    QComboBox *orderBox() const { return m_panel->findChild<QComboBox *>(); }
    QSpinBox *widthBox() const { return m_panel->findChild<QSpinBox *>(); }

    std::unique_ptr<Cfg> m_cfg;
    std::unique_ptr<Panel> m_panel;
};

void KvStatisticsMeasurementsTableOptionsWidgetTest::init()
{
    StatReportTest::init();
    m_cfg = std::make_unique<Cfg>(nullptr);
    m_panel = std::make_unique<Panel>(m_cfg.get(), nullptr, true);
    QVERIFY(PanelProbe::show(m_panel.get()));
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::cleanup()
{
    m_panel.reset();
    m_cfg.reset();
    StatReportTest::cleanup();
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::declaresSignalsAndSlotsInOrder()
{
    const QMetaObject &metaObject = Panel::staticMetaObject;
    QCOMPARE(ownMethods(metaObject, QMetaMethod::Signal),
             QStringList({"signalWidthChanged(int)", "signalAlignmentChanged(Qt::Alignment)",
                          "signalThemeChanged(kvCharts::KvChartThemes::ThemeType)",
                          "signalColumnsChanged(QSet<QString>)", "signalOrderByChanged(QString,bool)"}));
    QCOMPARE(
        ownMethods(metaObject, QMetaMethod::Slot),
        QStringList({"slotAlignLeftClicked()", "slotAlignCenterClicked()", "slotAlignRightClicked()",
                     "slotThemeToggled()", "slotColumnStateChanged(QString,int)", "slotOrderBySelected()"}));
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::rowsStandInOrder()
{
    const auto top = [this](const QWidget *control) {
        return control->mapTo(m_panel.get(), QPoint(0, 0)).y();
    };
    const auto bottom = [top](const QWidget *control) { return top(control) + control->height(); };
    const auto buttons = PanelProbe::controls<QPushButton>(m_panel.get());
    const auto choices = PanelProbe::controls<QRadioButton>(m_panel.get());
    const auto boxes = PanelProbe::controls<QCheckBox>(m_panel.get());
    QCOMPARE(buttons.size(), 3);
    QCOMPARE(choices.size(), 2);
    QCOMPARE(boxes.size(), 4);

    QVERIFY(bottom(m_panel->findChild<QLabel *>(QStringLiteral("sideHeader"))) <= top(widthBox()));
    QVERIFY(bottom(widthBox()) <= top(buttons.first()));
    QCOMPARE(top(buttons.at(1)), top(buttons.first()));
    QCOMPARE(top(buttons.at(2)), top(buttons.first()));
    QVERIFY(bottom(buttons.first()) <= top(choices.first()));
    QCOMPARE(top(choices.at(1)), top(choices.first()));
    QVERIFY(bottom(choices.first()) <= top(boxes.first()));
    for (int i = 1; i < 4; ++i)
        QVERIFY(bottom(boxes.at(i - 1)) <= top(boxes.at(i)));
    QVERIFY(bottom(boxes.last()) <= top(orderBox()));
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::textsAreLiteral()
{
    const QStringList labels = PanelProbe::labelTexts(m_panel.get());
    QCOMPARE(labels.mid(labels.size() - 3), QStringList({"Color theme:", "Select columns:", "Order by:"}));
    QCOMPARE(PanelProbe::buttonTexts<QRadioButton>(m_panel.get()), QStringList({"Dark", "Light"}));
    QCOMPARE(PanelProbe::buttonTexts<QCheckBox>(m_panel.get()),
             QStringList({"Object Name", "Object Type", "Value Name", "Value"}));
    QCOMPARE(orderBox()->itemText(0), QStringLiteral("default"));
    QCOMPARE(orderBox()->count(), 9); // each column in both directions
    QStringList orders;
    for (int i = 0; i < orderBox()->count(); ++i)
        orders.append(orderBox()->itemText(i));
    QCOMPARE(orders.removeDuplicates(), 0);
    for (int i = 0; i < 4; ++i) {
        QVERIFY(orders.at(2 * i + 1).startsWith(Cfg::columnNames().at(i)));
        QVERIFY(orders.at(2 * i + 2).startsWith(Cfg::columnNames().at(i)));
    }
    QCOMPARE(widthBox()->suffix(), QStringLiteral("%"));
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::showsTheConfiguration_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("checkedAlignment");
    QTest::addColumn<int>("theme");
    QTest::addColumn<QSet<QString>>("columns");
    QTest::addColumn<QString>("orderColumn");
    QTest::addColumn<bool>("ascending");
    QTest::addColumn<int>("orderIndex");
    QTest::newRow("a new table") << 132 << 1 << 0
                                 << QSet<QString>{"Object Name", "Object Type", "Value Name", "Value"} << ""
                                 << true << 0;
    QTest::newRow("left, light, by value") << 1 << 0 << 1 << QSet<QString>{"Value"} << "Value" << true << 7;
    QTest::newRow("right, by name down") << 2 << 2 << 0 << QSet<QString>{} << "Object Name" << false << 2;
    QTest::newRow("by type up") << 2 << 2 << 0 << QSet<QString>{"Object Type"} << "Object Type" << true << 3;
    QTest::newRow("default, descending") << 2 << 2 << 0 << QSet<QString>{"Value Name"} << "" << false << 0;
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::showsTheConfiguration()
{
    QFETCH(int, alignment);
    QFETCH(int, checkedAlignment);
    QFETCH(int, theme);
    QFETCH(QSet<QString>, columns);
    QFETCH(QString, orderColumn);
    QFETCH(bool, ascending);
    QFETCH(int, orderIndex);
    Cfg cfg(nullptr);
    cfg.setAlignment(Qt::Alignment(alignment));
    cfg.setWidthPercent(59);
    cfg.setTheme(theme);
    cfg.setColumns(columns);
    cfg.setOrder(orderColumn, ascending);
    const Cfg::Options before = cfg.options();
    Panel fresh(&cfg, nullptr, true);
    m_panel->setFromConfig(&cfg);
    for (const Panel *panel :
         {static_cast<const Panel *>(&fresh), static_cast<const Panel *>(m_panel.get())}) {
        QCOMPARE(panel->findChild<QSpinBox *>()->value(), 59);
        const auto choices = panel->findChildren<QRadioButton *>();
        QCOMPARE(choices.at(0)->isChecked(), theme == 0);
        QCOMPARE(choices.at(1)->isChecked(), theme == 1);
        for (const QCheckBox *box : panel->findChildren<QCheckBox *>())
            QCOMPARE(box->isChecked(), columns.contains(box->text()));
        QCOMPARE(panel->findChild<QComboBox *>()->currentIndex(), orderIndex);
        const auto buttons = panel->findChildren<QPushButton *>();
        for (int i = 0; i < 3; ++i)
            QCOMPARE(buttons.at(i)->isChecked(), i == checkedAlignment);
    }
    QVERIFY(cfg.options() == before); // showing writes nothing
    QCOMPARE(cfg.themeIndex(), theme);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::fillingEmitsNothing()
{
    PanelSpies spies(m_panel.get());
    Cfg other(nullptr);
    other.setAlignment(Qt::AlignRight);
    other.setWidthPercent(12);
    other.setTheme(1);
    other.setColumns({QStringLiteral("Value")});
    other.setOrder(QStringLiteral("Value"), false);
    const Cfg::Options before = m_cfg->options();
    m_panel->setFromConfig(&other);
    QCOMPARE(widthBox()->value(), 12);
    QCOMPARE(orderBox()->currentIndex(), 8);
    QCOMPARE(spies.total(), 0);
    QVERIFY(m_cfg->options() == before);
    QCOMPARE(m_cfg->themeIndex(), 0);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::widthIsTyped()
{
    PanelSpies spies(m_panel.get());
    widthBox()->setFocus();
    widthBox()->selectAll();
    QTest::keyClicks(widthBox(), QStringLiteral("53"));
    QCOMPARE(m_cfg->widthPercent(), 53);
    QVERIFY(spies.width.count() >= 1);
    QCOMPARE(spies.width.last().first().toInt(), 53);
    const int typed = spies.width.count();
    QTest::keyClick(widthBox(), Qt::Key_Up);
    QCOMPARE(m_cfg->widthPercent(), 54);
    QCOMPARE(spies.width.count(), typed + 1);
    QCOMPARE(spies.width.last().first().toInt(), 54);
    QCOMPARE(spies.total(), spies.width.count());
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::everyWidthIsGivenBack()
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
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::alignmentIsClicked_data()
{
    QTest::addColumn<int>("before");
    QTest::addColumn<int>("button");
    QTest::addColumn<int>("alignment");
    QTest::newRow("left") << 132 << 0 << 1;
    QTest::newRow("centre") << 1 << 1 << 132;
    QTest::newRow("right") << 132 << 2 << 2;
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::alignmentIsClicked()
{
    QFETCH(int, before);
    QFETCH(int, button);
    QFETCH(int, alignment);
    m_cfg->setAlignment(Qt::Alignment(before));
    m_panel->setFromConfig(m_cfg.get());
    PanelSpies spies(m_panel.get());
    const auto buttons = PanelProbe::controls<QPushButton>(m_panel.get());
    PanelProbe::click(buttons.at(button));
    QCOMPARE(int(m_cfg->alignment()), alignment);
    QCOMPARE(spies.alignment.count(), 1);
    QCOMPARE(int(spies.alignment.first().first().value<Qt::Alignment>()), alignment);
    QCOMPARE(spies.total(), 1);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(buttons.at(i)->isChecked(), i == button);

    // A second click must not leave all buttons unchecked.
    PanelProbe::click(buttons.at(button));
    QVERIFY(buttons.at(button)->isChecked());
    QCOMPARE(int(m_cfg->alignment()), alignment);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::anyCentredAlignmentChecksTheCentre()
{
    m_cfg->setAlignment(Qt::Alignment(4));
    m_panel->setFromConfig(m_cfg.get());
    QVERIFY(PanelProbe::controls<QPushButton>(m_panel.get()).at(1)->isChecked());
    QCOMPARE(int(m_cfg->alignment()), 4); // and the value stays as it was
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::themeIsClicked()
{
    PanelSpies spies(m_panel.get());
    PanelProbe::click(PanelProbe::button<QRadioButton>(m_panel.get(), QStringLiteral("Light")));
    QCOMPARE(m_cfg->themeIndex(), 1);
    QVERIFY(!PanelProbe::button<QRadioButton>(m_panel.get(), QStringLiteral("Dark"))->isChecked());
    QCOMPARE(spies.theme.count(), 2); // one button goes off, the other comes on
    for (const QList<QVariant> &arguments : spies.theme)
        QCOMPARE(arguments.first().value<KvChartThemes::ThemeType>(), KvChartThemes::Light);
    PanelProbe::click(PanelProbe::button<QRadioButton>(m_panel.get(), QStringLiteral("Light")));
    QCOMPARE(spies.theme.count(), 2);
    PanelProbe::click(PanelProbe::button<QRadioButton>(m_panel.get(), QStringLiteral("Dark")));
    QCOMPARE(m_cfg->themeIndex(), 0);
    QCOMPARE(spies.theme.last().first().value<KvChartThemes::ThemeType>(), KvChartThemes::Dark);
    QCOMPARE(spies.total(), spies.theme.count());
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::anUnknownThemeChecksNothing()
{
    QVERIFY(m_cfg->fromJson({{"theme", "Blue"}}));
    PanelSpies spies(m_panel.get());
    m_panel->setFromConfig(m_cfg.get());
    for (const QRadioButton *button : m_panel->findChildren<QRadioButton *>())
        QVERIFY(!button->isChecked());
    QCOMPARE(spies.total(), 0);
    PanelProbe::click(PanelProbe::button<QRadioButton>(m_panel.get(), QStringLiteral("Dark")));
    QCOMPARE(m_cfg->themeIndex(), 0);
    QCOMPARE(spies.theme.count(), 1);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::columnsAreClicked()
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
        QCOMPARE(columns.size(), isOn ? 4 : 0);
    }
    QCOMPARE(spies.total(), spies.columns.count());
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::unknownColumnsAreKept()
{
    m_cfg->setColumns({QStringLiteral("Colour"), QStringLiteral("Value")});
    m_panel->setFromConfig(m_cfg.get());
    PanelProbe::click(PanelProbe::button<QCheckBox>(m_panel.get(), QStringLiteral("Value")));
    QCOMPARE(m_cfg->columns(), QSet<QString>{"Colour"});
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::columnsAreToggledByKey()
{
    PanelSpies spies(m_panel.get());
    QTest::keyClick(PanelProbe::button<QCheckBox>(m_panel.get(), QStringLiteral("Object Type")),
                    Qt::Key_Space);
    QVERIFY(!m_cfg->columns().contains(QStringLiteral("Object Type")));
    QCOMPARE(spies.columns.count(), 1);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::orderIsChosen_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("column");
    QTest::addColumn<bool>("ascending");
    for (int i = 0; i < 4; ++i) {
        const QString name = Cfg::columnNames().at(i);
        QTest::addRow("%s up", qPrintable(name)) << 2 * i + 1 << name << true;
        QTest::addRow("%s down", qPrintable(name)) << 2 * i + 2 << name << false;
    }
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::orderIsChosen()
{
    QFETCH(int, index);
    QFETCH(QString, column);
    QFETCH(bool, ascending);
    PanelSpies spies(m_panel.get());
    orderBox()->setFocus();
    for (int i = 0; i < index; ++i)
        QTest::keyClick(orderBox(), Qt::Key_Down);
    QCOMPARE(orderBox()->currentIndex(), index);
    QCOMPARE(m_cfg->orderColumn(), column);
    QCOMPARE(m_cfg->isOrderAscending(), ascending);
    QCOMPARE(spies.order.count(), index); // one for each step of the key
    QCOMPARE(spies.order.last().at(0).toString(), column);
    QCOMPARE(spies.order.last().at(1).toBool(), ascending);
    QCOMPARE(spies.total(), spies.order.count());

    m_panel->setFromConfig(m_cfg.get());
    QCOMPARE(orderBox()->currentIndex(), index);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::defaultOrderIsChosen()
{
    m_cfg->setOrder(QStringLiteral("Value"), false);
    m_panel->setFromConfig(m_cfg.get());
    PanelSpies spies(m_panel.get());
    QTest::keyClick(orderBox(), Qt::Key_Home);
    QCOMPARE(orderBox()->currentText(), QStringLiteral("default"));
    QCOMPARE(m_cfg->orderColumn(), QString());
    QCOMPARE(spies.order.count(), 1);
    QCOMPARE(spies.order.first().at(0).toString(), QString());
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::anUnknownOrderShowsDefault()
{
    m_cfg->setOrder(QStringLiteral("Colour"), true);
    PanelSpies spies(m_panel.get());
    m_panel->setFromConfig(m_cfg.get());
    QCOMPARE(orderBox()->currentIndex(), 0);
    QCOMPARE(m_cfg->orderColumn(), QStringLiteral("Colour"));
    QCOMPARE(spies.total(), 0);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::withoutPlacementTwoRowsAreMissing()
{
    QWidget parent;
    auto *panel = new Panel(m_cfg.get(), &parent, false);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(!panel->findChild<QSpinBox *>());
    QVERIFY(panel->findChildren<QPushButton *>().isEmpty());
    QCOMPARE(panel->findChildren<QRadioButton *>().size(), 2);
    QCOMPARE(panel->findChildren<QCheckBox *>().size(), 4);
    QVERIFY(panel->findChild<QComboBox *>());
    m_cfg->setWidthPercent(3);
    panel->setFromConfig(m_cfg.get()); // nothing there to show width and alignment in
    QCOMPARE(m_cfg->widthPercent(), 3);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::survivesItsConfiguration()
{
    PanelSpies spies(m_panel.get());
    m_cfg.reset();
    QTest::keyClick(widthBox(), Qt::Key_Up);
    PanelProbe::click(PanelProbe::controls<QPushButton>(m_panel.get()).first());
    PanelProbe::click(PanelProbe::button<QRadioButton>(m_panel.get(), QStringLiteral("Light")));
    PanelProbe::click(PanelProbe::button<QCheckBox>(m_panel.get(), QStringLiteral("Value")));
    QTest::keyClick(orderBox(), Qt::Key_Down);
    QCOMPARE(spies.total(), 0);
}

void KvStatisticsMeasurementsTableOptionsWidgetTest::ignoresOtherConfigurations()
{
    KvTextDocumentNodeCfg text(nullptr);
    m_panel->setFromConfig(&text);
    m_panel->setFromConfig(nullptr);
    QCOMPARE(widthBox()->value(), 75);
}

STATREPORT_TEST_MAIN(KvStatisticsMeasurementsTableOptionsWidgetTest)
#include "KvStatisticsMeasurementsTableOptionsWidgetTest.moc"
