// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartBlocks.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "charts/common/KvStatisticsChartOptionsWidget.h"
#include "charts/counterpie/KvStatisticsCounterPieNodeCfg.h"
#include "charts/counterpie/KvStatisticsCounterPieOptionsWidget.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxOptionsWidget.h"
#include "charts/trend/KvStatisticsTrendOptionsWidget.h"

#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>

using kvCharts::KvChartThemes;

namespace {

KvStatisticsChartOptionsWidget *makePanel(KvStatisticsChartNodeCfg *cfg, bool withPlacement)
{
    if (auto *box = qobject_cast<KvStatisticsMinMedMaxBoxNodeCfg *>(cfg))
        return new KvStatisticsMinMedMaxBoxOptionsWidget(box, nullptr, withPlacement);
    if (auto *trend = qobject_cast<KvStatisticsTrendNodeCfg *>(cfg))
        return new KvStatisticsTrendOptionsWidget(trend, nullptr, withPlacement);
    auto *pie = qobject_cast<KvStatisticsCounterPieNodeCfg *>(cfg);
    return new KvStatisticsCounterPieOptionsWidget(pie, nullptr, withPlacement);
}

QByteArray groupBySignal(const QString &block)
{
    return QByteArray("2signalGroupByChanged(KvStatistics") + block.toLatin1() + "NodeCfg::GroupBy)";
}

/** Counts all that a panel says. */
struct PanelSpies
{
    PanelSpies(const QWidget *panel, const QString &block)
        : width(panel, SIGNAL(signalWidthChanged(int)))
                , alignment(panel, SIGNAL(signalAlignmentChanged(Qt::Alignment)))
                            , theme(panel, SIGNAL(signalThemeChanged(kvCharts::KvChartThemes::ThemeType)))
    {
        if (ChartBlocks::isGrouped(block))
            grouping = std::make_unique<QSignalSpy>(panel, groupBySignal(block).constData());
    }

    int groupingCount() const { return grouping ? grouping->count() : 0; }
    int total() const { return width.count() + alignment.count() + theme.count() + groupingCount(); }

    QSignalSpy width;
    QSignalSpy alignment;
    QSignalSpy theme;
    std::unique_ptr<QSignalSpy> grouping;
};

} // namespace

/** The options panels of all charts. */
class KvStatisticsChartOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();
    void declaresSignalsAndSlotsInOrder_data();
    void declaresSignalsAndSlotsInOrder();
    void textsAreLiteral_data();
    void textsAreLiteral();
    void rowsStandInOrder_data() { ChartBlocks::addBlockRows(); }
    void rowsStandInOrder();
    void showsTheConfiguration_data();
    void showsTheConfiguration();
    void showingEmitsNothing_data() { ChartBlocks::addBlockRows(); }
    void showingEmitsNothing();
    void widthIsTyped_data() { ChartBlocks::addBlockRows(); }
    void widthIsTyped();
    void everyWidthIsGivenBack_data() { ChartBlocks::addBlockRows(); }
    void everyWidthIsGivenBack();
    void alignmentIsClicked_data();
    void alignmentIsClicked();
    void themeIsClicked_data() { ChartBlocks::addBlockRows(); }
    void themeIsClicked();
    void groupingIsClicked_data();
    void groupingIsClicked();
    void themeAndGroupingAreApart_data();
    void themeAndGroupingAreApart();
    void unknownNumbersCheckNothing_data() { ChartBlocks::addBlockRows(); }
    void unknownNumbersCheckNothing();
    void withoutPlacementTwoRowsAreMissing_data() { ChartBlocks::addBlockRows(); }
    void withoutPlacementTwoRowsAreMissing();
    void ignoresOtherConfigurations_data() { ChartBlocks::addBlockRows(); }
    void ignoresOtherConfigurations();
    void survivesItsConfiguration_data() { ChartBlocks::addBlockRows(); }
    void survivesItsConfiguration();

private:
    void make(const QString &block, bool withPlacement = true)
    {
        m_cfg = ChartBlocks::makeConfig(block, nullptr);
        m_panel.reset(makePanel(m_cfg.get(), withPlacement));
        QVERIFY(PanelProbe::show(m_panel.get()));
    }
    QSpinBox *widthBox() const { return m_panel->findChild<QSpinBox *>(); }
    QList<QPushButton *> buttons() const { return PanelProbe::controls<QPushButton>(m_panel.get()); }
    QRadioButton *radio(const char *text) const
    {
        return PanelProbe::button<QRadioButton>(m_panel.get(), QString::fromLatin1(text));
    }
    QStringList checkedRadios() const
    {
        QStringList texts;
        for (const QRadioButton *button : PanelProbe::controls<QRadioButton>(m_panel.get())) {
            if (button->isChecked())
                texts.append(button->text());
        }
        return texts;
    }

    std::unique_ptr<KvStatisticsChartNodeCfg> m_cfg;
    std::unique_ptr<KvStatisticsChartOptionsWidget> m_panel;
};

void KvStatisticsChartOptionsWidgetTest::cleanup()
{
    m_panel.reset();
    m_cfg.reset();
    StatReportTest::cleanup();
}

void KvStatisticsChartOptionsWidgetTest::declaresSignalsAndSlotsInOrder_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<QStringList>("signalList");
    QTest::addColumn<QStringList>("slotList");
    const QString width = "signalWidthChanged(int)";
    const QString alignment = "signalAlignmentChanged(Qt::Alignment)";
    const QString theme = "signalThemeChanged(kvCharts::KvChartThemes::ThemeType)";
    const QStringList slotsOfAll{"slotAlignLeftClicked()", "slotAlignCenterClicked()",
                                 "slotAlignRightClicked()", "slotThemeToggled()"};
    for (const QString &block : ChartBlocks::names()) {
        QStringList signalList{width, alignment, theme};
        QStringList slotList = slotsOfAll;
        if (ChartBlocks::isGrouped(block)) {
            signalList.insert(2, QString::fromLatin1(groupBySignal(block).mid(1)));
            slotList.append(QStringLiteral("slotGroupByToggled()"));
        }
        QTest::newRow(qPrintable(block)) << block << signalList << slotList;
    }
}

void KvStatisticsChartOptionsWidgetTest::declaresSignalsAndSlotsInOrder()
{
    QFETCH(QString, block);
    make(block);
    QTEST(ownMethods(*m_panel->metaObject(), QMetaMethod::Signal), "signalList");
    QTEST(ownMethods(*m_panel->metaObject(), QMetaMethod::Slot), "slotList");
}

void KvStatisticsChartOptionsWidgetTest::textsAreLiteral_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<QStringList>("labels");
    QTest::addColumn<QStringList>("choices");
    QTest::newRow("box") << "MinMedMaxBox"
                         << QStringList{"Min / Median / Max Box", "W", "Color theme:", "Group by:"}
                         << QStringList{"Dark", "Light", "Object", "Measurement"};
    QTest::newRow("trend") << "Trend" << QStringList{"Trend", "W", "Color theme:", "Group by:"}
                           << QStringList{"Dark", "Light", "Object", "Measurement"};
    QTest::newRow("pie") << "Counters" << QStringList{"Counters", "W", "Color theme:"}
                         << QStringList{"Dark", "Light"};
}

void KvStatisticsChartOptionsWidgetTest::textsAreLiteral()
{
    QFETCH(QString, block);
    make(block);
    QTEST(PanelProbe::labelTexts(m_panel.get()), "labels");
    QTEST(PanelProbe::buttonTexts<QRadioButton>(m_panel.get()), "choices");
    QCOMPARE(PanelProbe::controls<QLabel>(m_panel.get()).first()->objectName(), QStringLiteral("sideHeader"));
    QCOMPARE(widthBox()->suffix(), QStringLiteral("%"));
    QCOMPARE(widthBox()->minimum(), 1);
    QCOMPARE(widthBox()->maximum(), 100);
    QCOMPARE(widthBox()->buttonSymbols(), QAbstractSpinBox::NoButtons);
    QCOMPARE(m_panel->sizePolicy(), QSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred));
    QCOMPARE(buttons().size(), 3);
    for (const QPushButton *button : buttons()) {
        QVERIFY(button->isCheckable());
        QCOMPARE(button->size(), QSize(24, 24));
        QCOMPARE(button->iconSize(), QSize(24, 24));
        QVERIFY(!button->toolTip().isEmpty());
        QVERIFY(!button->accessibleName().isEmpty());
    }
}

void KvStatisticsChartOptionsWidgetTest::rowsStandInOrder()
{
    QFETCH(QString, block);
    make(block);
    const auto top = [this](const QWidget *control) {
        return control->mapTo(m_panel.get(), QPoint(0, 0)).y();
    };
    const auto bottom = [top](const QWidget *control) { return top(control) + control->height(); };
    QVERIFY(bottom(m_panel->findChild<QLabel *>(QStringLiteral("sideHeader"))) <= top(widthBox()));
    QVERIFY(bottom(widthBox()) <= top(buttons().first()));
    for (const QPushButton *button : buttons())
        QCOMPARE(top(button), top(buttons().first()));
    QVERIFY(bottom(buttons().first()) <= top(radio("Dark")));
    QCOMPARE(top(radio("Light")), top(radio("Dark")));
    if (!ChartBlocks::isGrouped(block))
        return;
    QVERIFY(bottom(radio("Dark")) <= top(radio("Object")));
    QCOMPARE(top(radio("Measurement")), top(radio("Object")));
}

void KvStatisticsChartOptionsWidgetTest::showsTheConfiguration_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("checkedButton");
    QTest::addColumn<int>("theme");
    QTest::addColumn<int>("grouping");
    QTest::addColumn<QStringList>("checked");
    for (const QString &block : ChartBlocks::names()) {
        const bool grouped = ChartBlocks::isGrouped(block);
        const QStringList object = grouped ? QStringList{"Object"} : QStringList();
        const QStringList measurement = grouped ? QStringList{"Measurement"} : QStringList();
        QTest::addRow("new %s", qPrintable(block))
            << block << 132 << 1 << 0 << 1 << QStringList{"Dark"} + object;
        QTest::addRow("left, light %s", qPrintable(block))
            << block << 1 << 0 << 1 << 1 << QStringList{"Light"} + object;
        QTest::addRow("right %s", qPrintable(block))
            << block << 2 << 2 << 0 << 0 << QStringList{"Dark"} + measurement;
    }
}

void KvStatisticsChartOptionsWidgetTest::showsTheConfiguration()
{
    QFETCH(QString, block);
    QFETCH(int, alignment);
    QFETCH(int, checkedButton);
    QFETCH(int, theme);
    QFETCH(int, grouping);
    make(block);
    m_cfg->setAlignment(Qt::Alignment(alignment));
    m_cfg->setWidthPercent(53);
    m_cfg->setTheme(theme);
    if (KvStatisticsGroupedChartNodeCfg *grouped = ChartBlocks::grouped(m_cfg.get()))
        grouped->setGroupBy(static_cast<KvStatisticsGroupedChartNodeCfg::GroupBy>(grouping));
    m_panel.reset(makePanel(m_cfg.get(), true));
    QVERIFY(PanelProbe::show(m_panel.get()));
    QCOMPARE(widthBox()->value(), 53);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(buttons().at(i)->isChecked(), i == checkedButton);
    QTEST(checkedRadios(), "checked");
}

void KvStatisticsChartOptionsWidgetTest::showingEmitsNothing()
{
    QFETCH(QString, block);
    make(block);
    const PanelSpies spies(m_panel.get(), block);
    const auto other = ChartBlocks::makeConfig(block, nullptr);
    other->setAlignment(Qt::AlignRight);
    other->setWidthPercent(12);
    other->setTheme(1);
    m_panel->setFromConfig(other.get());
    QCOMPARE(widthBox()->value(), 12);
    QVERIFY(radio("Light")->isChecked());
    QCOMPARE(spies.total(), 0);
}

void KvStatisticsChartOptionsWidgetTest::widthIsTyped()
{
    QFETCH(QString, block);
    make(block);
    const PanelSpies spies(m_panel.get(), block);
    widthBox()->setFocus();
    widthBox()->selectAll();
    QTest::keyClicks(widthBox(), QStringLiteral("53"));
    QVERIFY(spies.width.count() >= 1);
    QCOMPARE(spies.width.last().first().toInt(), 53);
    QTest::keyClick(widthBox(), Qt::Key_Up);
    QCOMPARE(spies.width.last().first().toInt(), 54);
    QCOMPARE(spies.total(), spies.width.count());
    // The chart stores what the panel announces.
    QCOMPARE(m_cfg->widthPercent(), 75);
}

void KvStatisticsChartOptionsWidgetTest::everyWidthIsGivenBack()
{
    QFETCH(QString, block);
    make(block);
    const PanelSpies spies(m_panel.get(), block);
    for (int percent = 1; percent <= 100; ++percent) {
        m_cfg->setWidthPercent(percent);
        m_panel->setFromConfig(m_cfg.get());
        QCOMPARE(widthBox()->value(), percent);
    }
    QCOMPARE(spies.total(), 0);
    for (int percent = 99; percent >= 1; --percent) {
        QTest::keyClick(widthBox(), Qt::Key_Down);
        QCOMPARE(spies.width.last().first().toInt(), percent);
    }
}

void KvStatisticsChartOptionsWidgetTest::alignmentIsClicked_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<int>("before");
    QTest::addColumn<int>("button");
    QTest::addColumn<int>("alignment");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s left", qPrintable(block)) << block << 132 << 0 << 1;
        QTest::addRow("%s centre", qPrintable(block)) << block << 1 << 1 << 132;
        QTest::addRow("%s right", qPrintable(block)) << block << 132 << 2 << 2;
    }
}

void KvStatisticsChartOptionsWidgetTest::alignmentIsClicked()
{
    QFETCH(QString, block);
    QFETCH(int, before);
    QFETCH(int, button);
    QFETCH(int, alignment);
    make(block);
    m_cfg->setAlignment(Qt::Alignment(before));
    m_panel->setFromConfig(m_cfg.get());
    const PanelSpies spies(m_panel.get(), block);
    PanelProbe::click(buttons().at(button));
    QCOMPARE(spies.alignment.count(), 1);
    QCOMPARE(int(spies.alignment.first().first().value<Qt::Alignment>()), alignment);
    QCOMPARE(spies.total(), 1);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(buttons().at(i)->isChecked(), i == button);
    PanelProbe::click(buttons().at(button)); // must not leave all unchecked
    QVERIFY(buttons().at(button)->isChecked());
}

void KvStatisticsChartOptionsWidgetTest::themeIsClicked()
{
    QFETCH(QString, block);
    make(block);
    const PanelSpies spies(m_panel.get(), block);
    PanelProbe::click(radio("Light"));
    QCOMPARE(spies.theme.count(), 2); // one button goes off, the other comes on
    for (const QList<QVariant> &arguments : spies.theme)
        QCOMPARE(arguments.first().value<KvChartThemes::ThemeType>(), KvChartThemes::Light);
    PanelProbe::click(radio("Dark"));
    QCOMPARE(spies.theme.last().first().value<KvChartThemes::ThemeType>(), KvChartThemes::Dark);
    QCOMPARE(spies.total(), spies.theme.count());
}

void KvStatisticsChartOptionsWidgetTest::groupingIsClicked_data()
{
    QTest::addColumn<QString>("block");
    QTest::newRow("box") << "MinMedMaxBox";
    QTest::newRow("trend") << "Trend";
}

void KvStatisticsChartOptionsWidgetTest::groupingIsClicked()
{
    QFETCH(QString, block);
    make(block);
    const PanelSpies spies(m_panel.get(), block);
    PanelProbe::click(radio("Measurement"));
    QCOMPARE(spies.groupingCount(), 2);
    for (const QList<QVariant> &arguments : *spies.grouping)
        QCOMPARE(int(arguments.first().value<KvStatisticsGroupedChartNodeCfg::GroupBy>()), 0);
    PanelProbe::click(radio("Object"));
    QCOMPARE(int(spies.grouping->last().first().value<KvStatisticsGroupedChartNodeCfg::GroupBy>()), 1);
    QCOMPARE(spies.total(), spies.groupingCount());
}

void KvStatisticsChartOptionsWidgetTest::themeAndGroupingAreApart_data()
{
    groupingIsClicked_data();
}

void KvStatisticsChartOptionsWidgetTest::themeAndGroupingAreApart()
{
    QFETCH(QString, block);
    make(block);
    PanelProbe::click(radio("Light"));
    PanelProbe::click(radio("Measurement"));
    QCOMPARE(checkedRadios(), QStringList({"Light", "Measurement"}));
}

void KvStatisticsChartOptionsWidgetTest::unknownNumbersCheckNothing()
{
    QFETCH(QString, block);
    make(block);
    m_cfg->setTheme(-1);
    if (KvStatisticsGroupedChartNodeCfg *grouped = ChartBlocks::grouped(m_cfg.get()))
        grouped->setGroupBy(static_cast<KvStatisticsGroupedChartNodeCfg::GroupBy>(7));
    const PanelSpies spies(m_panel.get(), block);
    m_panel->setFromConfig(m_cfg.get());
    QCOMPARE(checkedRadios(), QStringList());
    QCOMPARE(spies.total(), 0);
    PanelProbe::click(radio("Dark"));
    QCOMPARE(spies.theme.count(), 1);
    QCOMPARE(spies.total(), 1);
}

void KvStatisticsChartOptionsWidgetTest::withoutPlacementTwoRowsAreMissing()
{
    QFETCH(QString, block);
    make(block, false);
    QVERIFY(!widthBox());
    QVERIFY(buttons().isEmpty());
    QCOMPARE(m_panel->findChildren<QRadioButton *>().size(), ChartBlocks::isGrouped(block) ? 4 : 2);
    QVERIFY(m_panel->findChild<QLabel *>(QStringLiteral("sideHeader")));
    m_panel->setFromConfig(m_cfg.get()); // nothing there to show width and alignment in
}

void KvStatisticsChartOptionsWidgetTest::ignoresOtherConfigurations()
{
    QFETCH(QString, block);
    make(block);
    const KvTextDocumentNodeCfg text(nullptr);
    m_panel->setFromConfig(&text);
    m_panel->setFromConfig(nullptr);
    QCOMPARE(widthBox()->value(), 75);
}

void KvStatisticsChartOptionsWidgetTest::survivesItsConfiguration()
{
    QFETCH(QString, block);
    make(block);
    m_cfg.reset();
    const PanelSpies spies(m_panel.get(), block);
    QTest::keyClick(widthBox(), Qt::Key_Up);
    PanelProbe::click(buttons().first());
    PanelProbe::click(radio("Light"));
    QCOMPARE(spies.total(), 4);
}

STATREPORT_TEST_MAIN(KvStatisticsChartOptionsWidgetTest)
#include "KvStatisticsChartOptionsWidgetTest.moc"
