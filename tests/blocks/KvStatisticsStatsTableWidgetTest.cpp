// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "MarkingTranslator.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "TableProbe.h"
#include "TableSpies.h"
#include "TypedMeasurements.h"
#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"
#include "blocks/statisticstable/KvStatisticsStatsTableWidget.h"
#include "blocks/table/KvBaseTableItemDelegate.h"
#include "blocks/table/KvTableGrid.h"
#include "kernel/ZtAppSettings.h"

#include <QCheckBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>
#include <QTableView>

#include <limits>

namespace {

using Cfg = KvStatisticsStatsTableNodeCfg;
using Table = KvStatisticsStatsTableWidget;
using Values = QVector<QVariant>;

const QStringList statistics{"Min", "Max", "Average", "Sigma", "3 Sigma", "6 Sigma"};

QString inKind(const QStringList &numbers, const QString &unit)
{
    return numbers.join(QLatin1Char(' ') + unit + QLatin1Char('|')) + QLatin1Char(' ') + unit;
}

} // namespace

class KvStatisticsStatsTableWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSlotsInOrder();
    void showsEveryStatistic_data();
    void showsEveryStatistic();
    void digitsAreTheUsers_data();
    void digitsAreTheUsers();
    void textsCountAsZero();
    void oddNumbersDoNoHarm();
    void theFirstRecordGivesTheKind();
    void groupsByMeasurement();
    void groupsByObject();
    void groupsAreInPlainOrder();
    void anyOtherGroupingIsByMeasurement();
    void columnsComeInTheirFixedOrder_data();
    void columnsComeInTheirFixedOrder();
    void textsAreTranslated();
    void withoutMeasurementsTheHeaderIsShown_data();
    void withoutMeasurementsTheHeaderIsShown();
    void cellsAreNeitherFlaggedNorSpanned();
    void refreshesWhenTheEngineReports();
    void aThemeChangeRepaints();
    void numbersAreNotCut();
    void allPiecesHaveTheSameColumns();
    void longTablesAreSplit();
    void thePageHeightSplitsAnew();
    void optionSlotsAnnounceRealChanges();
    void theSameOptionIsNotAnnounced();
    void thePanelDrivesTheTable();
    void panelsWithoutPlacement();
    void panelsOutliveTheirTable();
    void handlesHundredThousandValues();

private:
    QList<QStringList> shown(int piece = 0)
    {
        return TableProbe::allTexts(*TableProbe::piece(m_table->subWidgetAt(piece))->model());
    }

    std::unique_ptr<TypedMeasurements> m_host;
    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<Cfg> m_cfg;
    std::unique_ptr<Table> m_table;
};

void KvStatisticsStatsTableWidgetTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<TypedMeasurements>();
    m_context = std::make_unique<KvTemplateContext>(m_host->kernelData());
    m_context->setContentHeight(1304);
    m_cfg = std::make_unique<Cfg>(m_context.get());
    m_table = std::make_unique<Table>(nullptr, m_cfg.get());
}

void KvStatisticsStatsTableWidgetTest::cleanup()
{
    m_table.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    m_cfg.reset();
    m_context.reset();
    m_host.reset();
    ZtAppSettings::remove(QStringLiteral("Measurement"));
    StatReportTest::cleanup();
}

void KvStatisticsStatsTableWidgetTest::declaresSlotsInOrder()
{
    QCOMPARE(ownMethods(Table::staticMetaObject, QMetaMethod::Slot),
             QStringList({"slotUpdateTableContents()", "slotWidthChanged(int)",
                          "slotAlignmentChanged(Qt::Alignment)",
                          "slotGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy)",
                          "slotThemeChanged(kvCharts::KvChartThemes::ThemeType)",
                          "slotColumnsChanged(QSet<QString>)", "slotContentHeightChanged()"}));
    QVERIFY(ownMethods(Table::staticMetaObject, QMetaMethod::Signal).isEmpty());
}

void KvStatisticsStatsTableWidgetTest::showsEveryStatistic_data()
{
    QTest::addColumn<Values>("values");
    QTest::addColumn<int>("kind");
    QTest::addColumn<QString>("cells");
    const QString um = QStringLiteral("μm"); // Greek small letter mu
    // Population sigma: with n - 1 it would be 2.138.
    QTest::newRow("lengths") << Values{2.0, 4.0, 4.0, 4.0, 5.0, 5.0, 7.0, 9.0} << 1
                             << inKind({"2.000", "9.000", "5.000", "2.000", "6.000", "12.000"}, um);
    QTest::newRow("one length") << Values{20.0} << 1 << "20.000 μm|20.000 μm|20.000 μm|0 nm|0 nm|0 nm";
    QTest::newRow("equal lengths") << Values{1.5, 1.5, 1.5} << 1
                                   << "1.500 μm|1.500 μm|1.500 μm|0 nm|0 nm|0 nm";
    QTest::newRow("each cell has its unit")
        << Values{0.5, 5000.0} << 1 << "500.00 nm|5.000 mm|2.500 mm|2.500 mm|7.499 mm|1.500 cm";
    QTest::newRow("metres") << Values{2000000.0} << 1 << "2.000 m|2.000 m|2.000 m|0 nm|0 nm|0 nm";
    QTest::newRow("an area") << Values{1500000.0} << 2 << "1.500 mm²|1.500 mm²|1.500 mm²|0 nm²|0 nm²|0 nm²";
    QTest::newRow("areas") << Values{100.0, 300.0} << 2
                           << inKind({"100.00", "300.00", "200.00", "100.00", "300.00", "600.00"}, "μm²");
    QTest::newRow("angles") << Values{10.0, 20.0} << 3
                            << inKind({"10.000", "20.000", "15.000", "5.000", "15.000", "30.000"}, "deg(°)");
    QTest::newRow("counts") << Values{5, 7} << 4
                            << inKind({"5", "7", "6.000", "1.000", "3.000", "6.000"}, "pcs");
    QTest::newRow("percentages") << Values{40.0, 60.0} << 5
                                 << inKind({"40.000", "60.000", "50.000", "10.000", "30.000", "60.000"}, "%");
    QTest::newRow("no kind") << Values{1.0, 3.0} << 0
                             << inKind({"1.000", "3.000", "2.000", "1.000", "3.000", "6.000"}, QString());
    QTest::newRow("an unknown kind") << Values{1, 3} << 6
                                     << inKind({"1", "3", "2.000", "1.000", "3.000", "6.000"}, QString());
    QTest::newRow("integers and fractions")
        << Values{3, 0.5} << 1 << "500.00 nm|3.000 μm|1.750 μm|1.250 μm|3.750 μm|7.500 μm";
}

void KvStatisticsStatsTableWidgetTest::showsEveryStatistic()
{
    QFETCH(Values, values);
    QFETCH(int, kind);
    QFETCH(QString, cells);
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), values, kind);
    QCOMPARE(shown().size(), 2);
    QCOMPARE(shown().at(0), QStringList({"Object Type", "Measurement Type"}) + statistics);
    QCOMPARE(shown().at(1), QStringList({"Line", "Length"}) + cells.split(QLatin1Char('|')));
    m_table->slotGroupByChanged(Cfg::ByMeasurement); // the same numbers
    QCOMPARE(shown().at(1), QStringList({"Length"}) + cells.split(QLatin1Char('|')));
}

void KvStatisticsStatsTableWidgetTest::digitsAreTheUsers_data()
{
    QTest::addColumn<int>("digits");
    QTest::addColumn<QString>("cells");
    QTest::newRow("automatic") << 0 << "100.00 μm|300.00 μm|200.00 μm|100.00 μm|300.00 μm|600.00 μm";
    QTest::newRow("four") << 4 << "100.0 μm|300.0 μm|200.0 μm|100.0 μm|300.0 μm|600.0 μm";
    QTest::newRow("three") << 3 << "100 μm|300 μm|200 μm|100 μm|300 μm|600 μm";
    QTest::newRow("two") << 2 << "10∙10 μm|30∙10 μm|20∙10 μm|10∙10 μm|30∙10 μm|60∙10 μm";
}

void KvStatisticsStatsTableWidgetTest::digitsAreTheUsers()
{
    QFETCH(int, digits);
    QFETCH(QString, cells);
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), digits);
    ZtAppSettings::endGroup();
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {100.0, 300.0});
    QCOMPARE(shown().at(1).mid(2), cells.split(QLatin1Char('|')));
}

void KvStatisticsStatsTableWidgetTest::textsCountAsZero()
{
    m_table->slotColumnsChanged({QStringLiteral("Average"), QStringLiteral("Sigma")});
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {QStringLiteral("12.5"), 4.0});
    QCOMPARE(shown().at(1).mid(2), QStringList({"2.000 μm", "2.000 μm"}));
}

void KvStatisticsStatsTableWidgetTest::oddNumbersDoNoHarm()
{
    const double notANumber = std::numeric_limits<double>::quiet_NaN();
    const double infinity = std::numeric_limits<double>::infinity();
    int index = 0;
    for (const Values &values : {Values{notANumber}, Values{infinity, 1.0}, Values{-5.25}, Values{-4.0, 4.0},
                                 Values{1e300, -1e300}, Values{true}, Values{QStringLiteral("n/a")}}) {
        for (const int kind : {0, 1, 2, 3})
            m_host->add(QStringLiteral("Line"), QStringLiteral("v%1").arg(++index), values, kind);
    }
    const QList<QStringList> rows = shown();
    QCOMPARE(rows.size(), 1 + index);
    for (const QStringList &row : rows)
        QCOMPARE(row.size(), 8);
}

void KvStatisticsStatsTableWidgetTest::theFirstRecordGivesTheKind()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Size"), {4.0}, 1);
    m_host->add(QStringLiteral("Circle"), QStringLiteral("Size"), {16.0}, 2);
    m_table->slotGroupByChanged(Cfg::ByMeasurement);
    QCOMPARE(shown().at(1), QStringList({"Size", "4.000 μm", "16.000 μm", "10.000 μm", "6.000 μm",
                                         "18.000 μm", "36.000 μm"}));
    m_table->slotGroupByChanged(Cfg::ByObject);
    QCOMPARE(shown().at(1).mid(0, 3), QStringList({"Circle", "Size", "16.000 μm²"}));
    QCOMPARE(shown().at(2).mid(0, 3), QStringList({"Line", "Size", "4.000 μm"}));
}

void KvStatisticsStatsTableWidgetTest::groupsByMeasurement()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {1.0, 3.0});
    m_host->add(QStringLiteral("Circle"), QStringLiteral("Radius"), {8.0});
    m_host->add(QStringLiteral("Arc"), QStringLiteral("Length"), {8.0});
    m_table->slotColumnsChanged({QStringLiteral("Max"), QStringLiteral("Average")});
    m_table->slotGroupByChanged(Cfg::ByMeasurement);
    QCOMPARE(shown(), QList<QStringList>({{"Measurement Type", "Max", "Average"},
                                          {"Length", "8.000 μm", "4.000 μm"},
                                          {"Radius", "8.000 μm", "8.000 μm"}}));
}

void KvStatisticsStatsTableWidgetTest::groupsByObject()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {1.0, 3.0});
    m_host->add(QStringLiteral("Circle"), QStringLiteral("Radius"), {8.0});
    m_host->add(QStringLiteral("Circle"), QStringLiteral("Diameter"), {16.0});
    m_host->add(QStringLiteral("Arc"), QStringLiteral("Length"), {8.0});
    m_table->slotColumnsChanged({QStringLiteral("Max"), QStringLiteral("Average")});
    QCOMPARE(shown(), QList<QStringList>({{"Object Type", "Measurement Type", "Max", "Average"},
                                          {"Arc", "Length", "8.000 μm", "8.000 μm"},
                                          {"Circle", "Diameter", "16.000 μm", "16.000 μm"},
                                          {"Circle", "Radius", "8.000 μm", "8.000 μm"},
                                          {"Line", "Length", "3.000 μm", "2.000 μm"}}));
}

void KvStatisticsStatsTableWidgetTest::groupsAreInPlainOrder()
{
    for (const char *name : {"b", "A", "a", "Z"}) {
        m_host->add(QLatin1String(name), QStringLiteral("one"), {1.0});
        m_host->add(QStringLiteral("Type"), QLatin1String(name), {1.0});
    }
    m_table->slotColumnsChanged({});
    QStringList names;
    for (const QStringList &row : shown().mid(1))
        names.append(row.join(QLatin1Char('/')));
    QCOMPARE(names,
             QStringList({"A/one", "Type/A", "Type/Z", "Type/a", "Type/b", "Z/one", "a/one", "b/one"}));
    m_table->slotGroupByChanged(Cfg::ByMeasurement);
    QCOMPARE(shown(), QList<QStringList>({{"Measurement Type"}, {"A"}, {"Z"}, {"a"}, {"b"}, {"one"}}));
}

void KvStatisticsStatsTableWidgetTest::anyOtherGroupingIsByMeasurement()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {1.0});
    QVERIFY(m_cfg->fromJson({{"alignment", 4}, {"groupBy", 7}, {"widthPercent", 75}, {"columns", "Min"}}));
    m_table->slotUpdateTableContents();
    QCOMPARE(shown(), QList<QStringList>({{"Measurement Type", "Min"}, {"Length", "1.000 μm"}}));
}

void KvStatisticsStatsTableWidgetTest::columnsComeInTheirFixedOrder_data()
{
    QTest::addColumn<QString>("columns");
    QTest::addColumn<QStringList>("header");
    QTest::addColumn<QStringList>("cells");
    QTest::newRow("none") << "" << QStringList{} << QStringList{};
    QTest::newRow("sigma before min")
        << "Sigma;Min" << QStringList{"Min", "Sigma"} << QStringList{"2.000 μm", "1.000 μm"};
    QTest::newRow("the multiples") << "6 Sigma;3 Sigma" << QStringList{"3 Sigma", "6 Sigma"}
                                   << QStringList{"3.000 μm", "6.000 μm"};
    QTest::newRow("unknown ones show nothing")
        << "Median;Max;max" << QStringList{"Max"} << QStringList{"4.000 μm"};
}

void KvStatisticsStatsTableWidgetTest::columnsComeInTheirFixedOrder()
{
    QFETCH(QString, columns);
    QFETCH(QStringList, header);
    QFETCH(QStringList, cells);
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {2.0, 4.0});
    QVERIFY(m_cfg->fromJson({{"alignment", 4}, {"groupBy", 1}, {"widthPercent", 75}, {"columns", columns}}));
    m_table->slotUpdateTableContents();
    QCOMPARE(shown(), QList<QStringList>({QStringList{"Object Type", "Measurement Type"} + header,
                                          QStringList{"Line", "Length"} + cells}));
}

void KvStatisticsStatsTableWidgetTest::textsAreTranslated()
{
    MarkingTranslator names(QStringLiteral("KvStatisticsStatsTableNodeCfg"));
    MarkingTranslator table(QStringLiteral("KvStatisticsStatsTableWidget"));
    QCoreApplication::installTranslator(&names);
    QCoreApplication::installTranslator(&table);
    m_table->slotColumnsChanged({QStringLiteral("Min"), QStringLiteral("3 Sigma")});
    const QStringList header = shown().first();
    const std::unique_ptr<QWidget> panel(m_table->createOptionsWidget(nullptr, true));
    const QStringList boxes = PanelProbe::buttonTexts<QCheckBox>(panel.get());
    QCoreApplication::removeTranslator(&names);
    QCoreApplication::removeTranslator(&table);
    QCOMPARE(header, QStringList({"«Object Type»", "«Measurement Type»", "«Min»", "«3 Sigma»"}));
    QVERIFY(boxes.contains(QStringLiteral("«6 Sigma»")));
    // What is saved are the names, not their translations.
    QCOMPARE(m_cfg->columns(), QSet<QString>({"Min", "3 Sigma"}));
}

void KvStatisticsStatsTableWidgetTest::withoutMeasurementsTheHeaderIsShown_data()
{
    QTest::addColumn<int>("grouping");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("by object") << 1 << QStringList{"Object Type", "Measurement Type"};
    QTest::newRow("by measurement") << 0 << QStringList{"Measurement Type"};
}

void KvStatisticsStatsTableWidgetTest::withoutMeasurementsTheHeaderIsShown()
{
    QFETCH(int, grouping);
    QFETCH(QStringList, names);
    m_table->slotGroupByChanged(static_cast<Cfg::GroupBy>(grouping));
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(shown(), QList<QStringList>{names + statistics});
    QCOMPARE(m_table->subWidgetAt(0)->height(), 32 + 10);
}

void KvStatisticsStatsTableWidgetTest::cellsAreNeitherFlaggedNorSpanned()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {2.0});
    m_host->add(QStringLiteral("Line"), QStringLiteral("Width"), {4.0});
    KvStatisticSubTable *piece = TableProbe::piece(m_table->subWidgetAt(0));
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 8; ++column) {
            const QModelIndex index = piece->model()->index(row, column);
            QVERIFY(!qvariant_cast<QColor>(index.data(Qt::ForegroundRole)).isValid());
            QCOMPARE(piece->tableView()->columnSpan(row, column), 1);
            QCOMPARE(piece->tableView()->rowSpan(row, column), 1);
            const QFont font = qvariant_cast<QFont>(index.data(Qt::FontRole));
            QCOMPARE(font.family(), QStringLiteral("Segoe UI"));
            QCOMPARE(font.pixelSize(), 12);
        }
    }
}

void KvStatisticsStatsTableWidgetTest::refreshesWhenTheEngineReports()
{
    m_table->subWidgetAt(0);
    TableSpies spies(*m_table, m_context.get());
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {2.0});
    QCOMPARE(shown().size(), 2);
    QCOMPARE(m_table->subWidgetAt(0)->height(), 2 * 32 + 10);
    QCOMPARE(spies.changed.count(), 1);
    QCOMPARE(spies.pieces.count(), 0);
    // New measurements are no change of the template.
    QCOMPARE(spies.modified.count(), 0);
    QCOMPARE(spies.config.count(), 0);
}

void KvStatisticsStatsTableWidgetTest::aThemeChangeRepaints()
{
    QWidget *piece = m_table->subWidgetAt(0);
    piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(piece));
    const QPoint inTable(724 / 2 + 3, 10);
    QCOMPARE(piece->grab().toImage().pixelColor(inTable), QColor("#4D4D4D"));
    m_cfg->setTheme(1);
    QCOMPARE(m_table->subWidgetAt(0), piece);
    QCOMPARE(piece->grab().toImage().pixelColor(inTable), QColor("#DDDDDD"));
}

void KvStatisticsStatsTableWidgetTest::numbersAreNotCut()
{
    m_host->add(QStringLiteral("Iris versicolor"), QStringLiteral("petal length"),
                {30000.0, 47000.0, 51000.0});
    m_host->add(QStringLiteral("Iris virginica"), QStringLiteral("petal width"), {14000.0, 20000.0, 25000.0});
    // The defaults: eight columns at three quarters of the width.
    KvStatisticSubTable *piece = TableProbe::piece(m_table->subWidgetAt(0));
    const int width = m_context->usableWidth() * 3 / 4;
    const QVector<int> edges = piece->model()->columnEdges(0, width);
    QCOMPARE(edges.size(), 9);
    QCOMPARE(edges.last(), width);
    const KvBaseTableItemDelegate delegate(m_cfg->themes());
    for (int row = 0; row < piece->model()->rowCount(); ++row) {
        for (int column = 2; column < 8; ++column) {
            const QString text = piece->model()->cell(row, column)->text;
            const int cellWidth = edges.at(column + 1) - edges.at(column) - 1;
            QVERIFY2(!delegate.isShortened(text, piece->model()->rowFont(row), cellWidth), qPrintable(text));
        }
    }
    // The view on the screen has the columns of the print. The picture delivers the events of its new size.
    piece->grab();
    for (int column = 0; column < 8; ++column)
        QCOMPARE(piece->tableView()->columnViewportPosition(column), edges.at(column));
}

void KvStatisticsStatsTableWidgetTest::allPiecesHaveTheSameColumns()
{
    for (int i = 0; i < 45; ++i)
        m_host->add(QStringLiteral("A"), QStringLiteral("v%1").arg(i, i == 44 ? 40 : 2, 10, QLatin1Char('0')),
                    {1.0});
    QCOMPARE(m_table->subWidgetCount(), 2);
    const auto edges = [this](int index) {
        return TableProbe::piece(m_table->subWidgetAt(index))->model()->columnEdges(0, 600);
    };
    QCOMPARE(edges(0), edges(1));
    QVERIFY(edges(0).at(2) - edges(0).at(1) > 600 / 8);
}

void KvStatisticsStatsTableWidgetTest::longTablesAreSplit()
{
    for (int i = 0; i < 45; ++i)
        m_host->add(i < 30 ? QStringLiteral("A") : QStringLiteral("B"),
                    QStringLiteral("v%1").arg(i, 2, 10, QLatin1Char('0')), {1.0});
    QCOMPARE(m_table->subWidgetCount(), 2); // 39 rows on a page
    QCOMPARE(shown(0).size(), 40);
    QCOMPARE(shown(1).size(), 7);
    QCOMPARE(shown(1).first(), shown(0).first());
    QCOMPARE(shown(0).at(30).mid(0, 2), QStringList({"A", "v29"}));
    QCOMPARE(shown(1).at(1).mid(0, 2), QStringList({"B", "v39"})); // the type's name stands in every row
}

void KvStatisticsStatsTableWidgetTest::thePageHeightSplitsAnew()
{
    for (int i = 0; i < 10; ++i)
        m_host->add(QStringLiteral("Line"), QStringLiteral("v%1").arg(i), {1.0});
    TableSpies spies(*m_table, m_context.get());
    m_context->setContentHeight(32 * 5 + 10); // four rows
    QCOMPARE(m_table->subWidgetCount(), 3);
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(shown(2).size(), 3);
    QCOMPARE(spies.modified.count(), 0);
    for (int height = 1; height <= 80; ++height) {
        m_context->setContentHeight(height);
        QVERIFY(m_table->subWidgetAt(0));
    }
}

void KvStatisticsStatsTableWidgetTest::optionSlotsAnnounceRealChanges()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {2.0});
    QTableView *view = TableProbe::piece(m_table->subWidgetAt(0))->tableView();
    TableSpies spies(*m_table, m_context.get());
    m_table->slotWidthChanged(50);
    QCOMPARE(m_cfg->widthPercent(), 50);
    QCOMPARE(view->geometry(), QRect(181, 5, 362, 64));
    m_table->slotAlignmentChanged(Qt::AlignRight);
    QCOMPARE(int(m_cfg->alignment()), 2);
    QCOMPARE(view->geometry(), QRect(362, 5, 362, 64));
    m_table->slotGroupByChanged(Cfg::ByMeasurement);
    QCOMPARE(m_cfg->groupBy(), Cfg::ByMeasurement);
    QCOMPARE(shown().first().first(), QStringLiteral("Measurement Type"));
    m_table->slotThemeChanged(kvCharts::KvChartThemes::Light);
    QCOMPARE(m_cfg->themeIndex(), 1);
    m_table->slotColumnsChanged({QStringLiteral("Max")});
    QCOMPARE(shown().first(), QStringList({"Measurement Type", "Max"}));
    QCOMPARE(spies.config.count(), 5);
    QCOMPARE(spies.modified.count(), 5);
    QCOMPARE(spies.changed.count(), 5);
    for (int i = 0; i < 5; ++i)
        QCOMPARE(configArgument(spies.config, i), m_cfg.get());
}

void KvStatisticsStatsTableWidgetTest::theSameOptionIsNotAnnounced()
{
    TableSpies spies(*m_table, m_context.get());
    m_table->slotWidthChanged(75);
    m_table->slotAlignmentChanged(Qt::AlignHCenter);
    m_table->slotGroupByChanged(Cfg::ByObject);
    m_table->slotThemeChanged(kvCharts::KvChartThemes::Dark);
    m_table->slotColumnsChanged(m_cfg->columns());
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 0);
    QCOMPARE(spies.changed.count() + spies.pieces.count(), 0);
}

void KvStatisticsStatsTableWidgetTest::thePanelDrivesTheTable()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {2.0, 4.0});
    QWidget parent;
    QWidget *panel = m_table->createOptionsWidget(&parent, true);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(PanelProbe::show(&parent));
    QTableView *view = TableProbe::piece(m_table->subWidgetAt(0))->tableView();
    TableSpies spies(*m_table, m_context.get());

    QTest::keyClick(panel->findChild<QSpinBox *>(), Qt::Key_Down);
    QCOMPARE(view->width(), 535); // 724 x 0.74
    QCOMPARE(spies.config.count(), 1);

    QPushButton *left = PanelProbe::controls<QPushButton>(panel).first();
    PanelProbe::click(left);
    QCOMPARE(view->x(), 0);
    QCOMPARE(spies.config.count(), 2);
    PanelProbe::click(left); // where it stands already
    QCOMPARE(spies.config.count(), 2);

    PanelProbe::click(PanelProbe::button<QRadioButton>(panel, QStringLiteral("Light")));
    QCOMPARE(spies.config.count(), 3); // once, though two buttons changed
    PanelProbe::click(PanelProbe::button<QRadioButton>(panel, QStringLiteral("Measurement")));
    QCOMPARE(spies.config.count(), 4);
    QCOMPARE(shown().at(1).mid(0, 2), QStringList({"Length", "2.000 μm"}));

    PanelProbe::click(PanelProbe::button<QCheckBox>(panel, QStringLiteral("Min")));
    QCOMPARE(shown().first(), QStringList{"Measurement Type"} + statistics.mid(1));
    QCOMPARE(spies.config.count(), 5);
    QCOMPARE(spies.modified.count(), 5);
    QCOMPARE(spies.changed.count(), 5);
    QCOMPARE(spies.pieces.count(), 0);
}

void KvStatisticsStatsTableWidgetTest::panelsWithoutPlacement()
{
    const std::unique_ptr<QWidget> panel(m_table->createOptionsWidget(nullptr, false));
    QVERIFY(panel);
    QVERIFY(!panel->findChild<QSpinBox *>());
    QVERIFY(panel->findChildren<QPushButton *>().isEmpty());
    QCOMPARE(panel->findChildren<QCheckBox *>().size(), 6);
}

void KvStatisticsStatsTableWidgetTest::panelsOutliveTheirTable()
{
    const std::unique_ptr<QWidget> panel(m_table->createOptionsWidget(nullptr, true));
    QVERIFY(PanelProbe::show(panel.get()));
    m_table.reset();
    PanelProbe::click(PanelProbe::button<QCheckBox>(panel.get(), QStringLiteral("Max")));
    QVERIFY(!m_cfg->columns().contains(QStringLiteral("Max")));
}

void KvStatisticsStatsTableWidgetTest::handlesHundredThousandValues()
{
    QVector<QVariant> values;
    for (int i = 1; i <= 100000; ++i)
        values.append(static_cast<double>(i));
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), values);
    // Sigma of 1..n is the root of (n² - 1) / 12.
    QCOMPARE(shown().at(1).mid(2),
             QStringList({"1.000 μm", "10.000 cm", "5.000 cm", "2.887 cm", "8.660 cm", "17.321 cm"}));
}

STATREPORT_TEST_MAIN(KvStatisticsStatsTableWidgetTest)
#include "KvStatisticsStatsTableWidgetTest.moc"
