// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "FakeMeasurements.h"
#include "MarkingTranslator.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "TableProbe.h"
#include "TableSpies.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableOptionsWidget.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableWidget.h"

#include <QCheckBox>
#include <QComboBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSpinBox>
#include <QTableView>

#include <limits>

namespace {

using Cfg = KvStatisticsMeasurementsTableNodeCfg;
using Table = KvStatisticsMeasurementsTableWidget;

QVector<FakeRow> threeRows()
{
    return {{QStringLiteral("Edge"), QStringLiteral("Line"), QStringLiteral("length"), 9.0,
             QStringLiteral("9 µm")},
            {QStringLiteral("Hole"), QStringLiteral("Circle"), QStringLiteral("diameter"), 20.0,
             QStringLiteral("20 µm")},
            {QStringLiteral("Corner"), QStringLiteral("Arc"), QStringLiteral("angle"), 100.0,
             QStringLiteral("100°")}};
}

} // namespace

class KvStatisticsMeasurementsTableWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void declaresSlotsInOrder();
    void listsEveryValue();
    void columnsComeInTheirFixedOrder_data();
    void columnsComeInTheirFixedOrder();
    void rowsAreOrdered_data();
    void rowsAreOrdered();
    void arrowsMarkTheOrder_data();
    void arrowsMarkTheOrder();
    void labelsAreTranslated();
    void aHiddenOrderColumnStillOrders();
    void mixedValuesAreOrdered();
    void withoutMeasurementsTheHeaderIsShown();
    void withoutDataSourceTheHeaderIsShown();
    void noCellIsFlagged();
    void refreshesWhenTheEngineReports();
    void aThemeChangeRepaints();
    void longTablesAreSplit();
    void thePageHeightSplitsAnew();
    void thePageSplitDoesNotReadTheRecordsAgain();
    void optionSlotsAnnounceRealChanges();
    void theSameOptionIsNotAnnounced();
    void thePanelDrivesTheTable();
    void theThemeIsAnnouncedOnce();
    void togglingColumnsKeepsThePieces();
    void panelsWithoutPlacement();
    void panelsOutliveTheirTable();
    void blockStyleDoesNotReachTheCells_data();
    void blockStyleDoesNotReachTheCells();
    void rightToLeftAndChineseTexts();
    void handlesHundredThousandRows();

private:
    QList<QStringList> shown(int piece = 0);

    std::unique_ptr<FakeMeasurements> m_host;
    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<Cfg> m_cfg;
    std::unique_ptr<Table> m_table;
};

void KvStatisticsMeasurementsTableWidgetTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<FakeMeasurements>();
    m_host->setRows(threeRows());
    m_context = std::make_unique<KvTemplateContext>(m_host->kernelData());
    m_context->setContentHeight(1304);
    m_cfg = std::make_unique<Cfg>(m_context.get());
    m_table = std::make_unique<Table>(nullptr, m_cfg.get());
}

void KvStatisticsMeasurementsTableWidgetTest::cleanup()
{
    m_table.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    m_cfg.reset();
    m_context.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

QList<QStringList> KvStatisticsMeasurementsTableWidgetTest::shown(int piece)
{
    return TableProbe::allTexts(*TableProbe::piece(m_table->subWidgetAt(piece))->model());
}

void KvStatisticsMeasurementsTableWidgetTest::declaresSlotsInOrder()
{
    QCOMPARE(ownMethods(Table::staticMetaObject, QMetaMethod::Slot),
             QStringList(
                 {"slotUpdateTableContents()", "slotWidthChanged(int)", "slotAlignmentChanged(Qt::Alignment)",
                  "slotThemeChanged(kvCharts::KvChartThemes::ThemeType)", "slotColumnsChanged(QSet<QString>)",
                  "slotContentHeightChanged()", "slotOrderBySelected(QString,bool)"}));
    QVERIFY(ownMethods(Table::staticMetaObject, QMetaMethod::Signal).isEmpty());
}

void KvStatisticsMeasurementsTableWidgetTest::listsEveryValue()
{
    QCOMPARE(m_table->displayName(), QStringLiteral("Measurements Table"));
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(shown(), QList<QStringList>({{"Object Name", "Object Type", "Value Name", "Value"},
                                          {"Edge", "Line", "length", "9 µm"},
                                          {"Hole", "Circle", "diameter", "20 µm"},
                                          {"Corner", "Arc", "angle", "100°"}}));
    QCOMPARE(m_table->subWidgetAt(0)->height(), 4 * 32 + 10);
}

void KvStatisticsMeasurementsTableWidgetTest::columnsComeInTheirFixedOrder_data()
{
    QTest::addColumn<QString>("columns");
    QTest::addColumn<QStringList>("header");
    QTest::addColumn<QStringList>("row");
    QTest::newRow("value before name")
        << "Value;Object Name" << QStringList{"Object Name", "Value"} << QStringList{"Edge", "9 µm"};
    QTest::newRow("type and value name")
        << "Value Name;Object Type" << QStringList{"Object Type", "Value Name"}
        << QStringList{"Line", "length"};
    QTest::newRow("unknown ones show nothing")
        << "Colour;Value;value" << QStringList{"Value"} << QStringList{"9 µm"};
}

void KvStatisticsMeasurementsTableWidgetTest::columnsComeInTheirFixedOrder()
{
    QFETCH(QString, columns);
    QFETCH(QStringList, header);
    QFETCH(QStringList, row);
    QVERIFY(m_cfg->fromJson({{"columns", columns}}));
    m_table->slotUpdateTableContents();
    QCOMPARE(shown().size(), 4);
    QCOMPARE(shown().at(0), header);
    QCOMPARE(shown().at(1), row);
}

void KvStatisticsMeasurementsTableWidgetTest::rowsAreOrdered_data()
{
    QTest::addColumn<QString>("column");
    QTest::addColumn<bool>("ascending");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("default") << "" << true << QStringList{"Edge", "Hole", "Corner"};
    QTest::newRow("default, descending") << "" << false << QStringList{"Edge", "Hole", "Corner"};
    QTest::newRow("unknown") << "Colour" << false << QStringList{"Edge", "Hole", "Corner"};
    QTest::newRow("name") << "Object Name" << true << QStringList{"Corner", "Edge", "Hole"};
    QTest::newRow("name, descending") << "Object Name" << false << QStringList{"Hole", "Edge", "Corner"};
    QTest::newRow("type") << "Object Type" << true << QStringList{"Corner", "Hole", "Edge"};
    QTest::newRow("value name") << "Value Name" << true << QStringList{"Corner", "Hole", "Edge"};
    // By number: as texts "100°" would come before "20 µm" and "9 µm".
    QTest::newRow("value") << "Value" << true << QStringList{"Edge", "Hole", "Corner"};
    QTest::newRow("value, descending") << "Value" << false << QStringList{"Corner", "Hole", "Edge"};
}

void KvStatisticsMeasurementsTableWidgetTest::rowsAreOrdered()
{
    QFETCH(QString, column);
    QFETCH(bool, ascending);
    m_table->slotOrderBySelected(column, ascending);
    QStringList names;
    for (const QStringList &row : shown().mid(1))
        names.append(row.first());
    QTEST(names, "names");
}

void KvStatisticsMeasurementsTableWidgetTest::arrowsMarkTheOrder_data()
{
    QTest::addColumn<QString>("column");
    QTest::addColumn<bool>("ascending");
    QTest::addColumn<QStringList>("header");
    const QString up = QStringLiteral(" ") + QChar(0x02C4);
    const QString down = QStringLiteral(" ") + QChar(0x02C5);
    QTest::newRow("none") << "" << true << QStringList{"Object Name", "Object Type", "Value Name", "Value"};
    QTest::newRow("none, descending")
        << "" << false << QStringList{"Object Name", "Object Type", "Value Name", "Value"};
    QTest::newRow("unknown") << "Colour" << true
                             << QStringList{"Object Name", "Object Type", "Value Name", "Value"};
    QTest::newRow("name up") << "Object Name" << true
                             << QStringList{"Object Name" + up, "Object Type", "Value Name", "Value"};
    QTest::newRow("type down") << "Object Type" << false
                               << QStringList{"Object Name", "Object Type" + down, "Value Name", "Value"};
    QTest::newRow("value name up") << "Value Name" << true
                                   << QStringList{"Object Name", "Object Type", "Value Name" + up, "Value"};
    QTest::newRow("value down") << "Value" << false
                                << QStringList{"Object Name", "Object Type", "Value Name", "Value" + down};
}

void KvStatisticsMeasurementsTableWidgetTest::arrowsMarkTheOrder()
{
    QFETCH(QString, column);
    QFETCH(bool, ascending);
    m_table->slotOrderBySelected(column, ascending);
    QTEST(shown().first(), "header");
}

void KvStatisticsMeasurementsTableWidgetTest::labelsAreTranslated()
{
    MarkingTranslator translator(QStringLiteral("KvStatisticsMeasurementsTableNodeCfg"));
    QCoreApplication::installTranslator(&translator);
    m_table->slotOrderBySelected(QStringLiteral("Value"), true);
    const QStringList header = shown().first();
    KvStatisticsMeasurementsTableOptionsWidget panel(m_cfg.get(), nullptr, true);
    const QStringList boxes = PanelProbe::buttonTexts<QCheckBox>(&panel);
    QCoreApplication::removeTranslator(&translator);
    QCOMPARE(header, QStringList({"«Object Name»", "«Object Type»", "«Value Name»",
                                  QStringLiteral("«Value» ") + QChar(0x02C4)}));
    QCOMPARE(QSet<QString>(boxes.begin(), boxes.end()),
             QSet<QString>({"«Object Name»", "«Object Type»", "«Value Name»", "«Value»"}));
    // What is saved are the names, not their translations.
    QCOMPARE(m_cfg->orderColumn(), QStringLiteral("Value"));
}

void KvStatisticsMeasurementsTableWidgetTest::aHiddenOrderColumnStillOrders()
{
    m_table->slotColumnsChanged({QStringLiteral("Value")});
    m_table->slotOrderBySelected(QStringLiteral("Object Name"), true);
    QCOMPARE(shown(), QList<QStringList>({{"Value"}, {"100°"}, {"9 µm"}, {"20 µm"}}));
}

void KvStatisticsMeasurementsTableWidgetTest::mixedValuesAreOrdered()
{
    QVector<FakeRow> rows;
    const QVariantList values{QStringLiteral("a"), std::numeric_limits<double>::quiet_NaN(), 2.0,
                              QStringLiteral("A"), 1};
    for (int i = 0; i < 200; ++i)
        rows.append({QStringLiteral("o%1").arg(i), QStringLiteral("t"), QStringLiteral("v"),
                     values.at(i % values.size()), values.at(i % values.size()).toString()});
    m_host->setRows(rows);
    m_table->slotColumnsChanged({QStringLiteral("Value")});
    for (const bool ascending : {true, false}) {
        m_table->slotOrderBySelected(QStringLiteral("Value"), ascending);
        QStringList texts;
        for (int piece = 0; piece < m_table->subWidgetCount(); ++piece) {
            for (const QStringList &row : shown(piece).mid(1)) {
                if (ascending)
                    texts.append(row.first());
                else
                    texts.prepend(row.first());
            }
        }
        QStringList expected;
        for (const QString &text : {QStringLiteral("1"), QStringLiteral("2"), QStringLiteral("nan"),
                                    QStringLiteral("A"), QStringLiteral("a")}) {
            for (int i = 0; i < 40; ++i)
                expected.append(text);
        }
        QCOMPARE(texts, expected);
    }
}

void KvStatisticsMeasurementsTableWidgetTest::withoutMeasurementsTheHeaderIsShown()
{
    m_host->setRows({});
    QCOMPARE(shown(), QList<QStringList>({{"Object Name", "Object Type", "Value Name", "Value"}}));
    m_table->slotColumnsChanged({});
    QCOMPARE(shown(), QList<QStringList>());
    m_host->setRows(threeRows());
    QCOMPARE(shown(), QList<QStringList>()); // no columns, no cells
    QCOMPARE(m_table->columnCount(), 0);
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(m_table->subWidgetAt(0)->height(), 10);
    m_table->subWidgetAt(0)->grab();
}

void KvStatisticsMeasurementsTableWidgetTest::withoutDataSourceTheHeaderIsShown()
{
    KvStatisticsEngine::instance().setKernelData(nullptr);
    m_table->slotUpdateTableContents();
    QCOMPARE(shown().size(), 1);
}

void KvStatisticsMeasurementsTableWidgetTest::noCellIsFlagged()
{
    const QAbstractItemModel *model = TableProbe::piece(m_table->subWidgetAt(0))->model();
    for (int row = 0; row < model->rowCount(); ++row) {
        for (int column = 0; column < model->columnCount(); ++column)
            QVERIFY(!qvariant_cast<QColor>(model->index(row, column).data(Qt::ForegroundRole)).isValid());
    }
    // Both fonts are of one family and set in pixels, which no screen changes.
    const QFont header = qvariant_cast<QFont>(model->index(0, 0).data(Qt::FontRole));
    const QFont body = qvariant_cast<QFont>(model->index(1, 0).data(Qt::FontRole));
    for (const QFont &font : {header, body}) {
        QCOMPARE(font.family(), QStringLiteral("Segoe UI"));
        QCOMPARE(font.pixelSize(), 12);
    }
}

void KvStatisticsMeasurementsTableWidgetTest::refreshesWhenTheEngineReports()
{
    m_table->subWidgetAt(0);
    TableSpies spies(*m_table, m_context.get());
    m_host->setRows(FakeMeasurements::lines(2));
    QCOMPARE(shown().mid(1), QList<QStringList>({{"Line 0", "Line", "length", "0 µm"},
                                                 {"Line 1", "Line", "length", "1 µm"}}));
    QCOMPARE(m_table->subWidgetAt(0)->height(), 3 * 32 + 10);
    QCOMPARE(spies.changed.count(), 1);
    QCOMPARE(spies.pieces.count(), 0);
    m_host->setRows(FakeMeasurements::lines(100));
    QCOMPARE(spies.changed.count(), 1);
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(m_table->subWidgetCount(), 3);
    // New measurements are no change of the template.
    QCOMPARE(spies.modified.count(), 0);
    QCOMPARE(spies.config.count(), 0);
}

void KvStatisticsMeasurementsTableWidgetTest::aThemeChangeRepaints()
{
    QWidget *piece = m_table->subWidgetAt(0);
    piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(piece));
    const QPoint inTable(724 / 2, 20);
    QCOMPARE(piece->grab().toImage().pixelColor(inTable), QColor("#4D4D4D"));
    m_cfg->setTheme(1);
    QCOMPARE(m_table->subWidgetAt(0), piece);
    QCOMPARE(piece->grab().toImage().pixelColor(inTable), QColor("#DDDDDD"));
    QVERIFY(TableProbe::piece(piece)->tableView()->styleSheet().contains(QStringLiteral("#dddddd")));
    m_cfg->setTheme(0);
    QCOMPARE(piece->grab().toImage().pixelColor(inTable), QColor("#4D4D4D"));
}

void KvStatisticsMeasurementsTableWidgetTest::longTablesAreSplit()
{
    m_host->setRows(FakeMeasurements::lines(100));
    QCOMPARE(m_table->subWidgetCount(), 3); // 39 rows on a page
    QCOMPARE(shown(0).size(), 40);
    QCOMPARE(shown(1).size(), 40);
    QCOMPARE(shown(2).size(), 23);
    for (int piece = 0; piece < 3; ++piece) {
        QCOMPARE(shown(piece).first().first(), QStringLiteral("Object Name"));
        QCOMPARE(shown(piece).at(1).first(), QStringLiteral("Line %1").arg(39 * piece));
        QVERIFY(m_table->subWidgetAt(piece)->height() <= m_context->contentHeight());
    }
}

void KvStatisticsMeasurementsTableWidgetTest::thePageHeightSplitsAnew()
{
    m_host->setRows(FakeMeasurements::lines(40));
    QCOMPARE(m_table->subWidgetCount(), 2);
    TableSpies spies(*m_table, m_context.get());
    m_context->setContentHeight(1336); // 40 rows
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(spies.pieces.count(), 1);
    m_context->setContentHeight(1304);
    QCOMPARE(m_table->subWidgetCount(), 2);
    QCOMPARE(spies.pieces.count(), 2);
    QCOMPARE(spies.changed.count(), 0);
    m_context->setContentHeight(1272); // 38 rows, still two pieces
    QCOMPARE(m_table->subWidgetCount(), 2);
    QCOMPARE(spies.pieces.count(), 2);
    QCOMPARE(spies.changed.count(), 1);
    QCOMPARE(shown(1).at(1).first(), QStringLiteral("Line 38"));
    QCOMPARE(spies.modified.count(), 0);
    for (int height = 1; height <= 80; ++height) {
        m_context->setContentHeight(height);
        QVERIFY(m_table->subWidgetAt(0));
        QVERIFY(height < 74 || m_table->subWidgetAt(0)->height() <= height);
    }
}

void KvStatisticsMeasurementsTableWidgetTest::thePageSplitDoesNotReadTheRecordsAgain()
{
    m_host->setRows(FakeMeasurements::lines(40));
    m_table->subWidgetAt(1);
    KvStatisticsEngine::instance().setKernelData(nullptr); // reading again would find nothing
    m_context->setContentHeight(362);
    QCOMPARE(m_table->subWidgetCount(), 4);
    QCOMPARE(shown(3).size(), 11);
}

void KvStatisticsMeasurementsTableWidgetTest::optionSlotsAnnounceRealChanges()
{
    QTableView *view = TableProbe::piece(m_table->subWidgetAt(0))->tableView();
    TableSpies spies(*m_table, m_context.get());
    m_table->slotWidthChanged(50);
    QCOMPARE(m_cfg->widthPercent(), 50);
    QCOMPARE(view->geometry(), QRect(181, 5, 362, 128));
    m_table->slotAlignmentChanged(Qt::AlignRight);
    QCOMPARE(int(m_cfg->alignment()), 2);
    QCOMPARE(view->geometry(), QRect(362, 5, 362, 128));
    m_table->slotThemeChanged(kvCharts::KvChartThemes::Light);
    QCOMPARE(m_cfg->themeIndex(), 1);
    m_table->slotColumnsChanged({QStringLiteral("Value")});
    QCOMPARE(shown().first(), QStringList{"Value"});
    m_table->slotOrderBySelected(QStringLiteral("Value"), false);
    QCOMPARE(shown().at(1), QStringList{"100°"});
    QCOMPARE(spies.config.count(), 5);
    QCOMPARE(spies.modified.count(), 5);
    QCOMPARE(spies.changed.count(), 5);
    for (int i = 0; i < 5; ++i)
        QCOMPARE(configArgument(spies.config, i), m_cfg.get());
}

void KvStatisticsMeasurementsTableWidgetTest::theSameOptionIsNotAnnounced()
{
    TableSpies spies(*m_table, m_context.get());
    m_table->slotWidthChanged(75);
    m_table->slotAlignmentChanged(Qt::AlignHCenter | Qt::AlignVCenter);
    m_table->slotThemeChanged(kvCharts::KvChartThemes::Dark);
    m_table->slotColumnsChanged(m_cfg->columns());
    m_table->slotOrderBySelected(QString(), true);
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 0);
    QCOMPARE(spies.changed.count() + spies.pieces.count(), 0);
}

void KvStatisticsMeasurementsTableWidgetTest::thePanelDrivesTheTable()
{
    QWidget parent;
    QWidget *panel = m_table->createOptionsWidget(&parent, true);
    QCOMPARE(panel->parentWidget(), &parent);
    QVERIFY(PanelProbe::show(&parent));
    QTableView *view = TableProbe::piece(m_table->subWidgetAt(0))->tableView();
    TableSpies spies(*m_table, m_context.get());

    QTest::keyClick(panel->findChild<QSpinBox *>(), Qt::Key_Down);
    QCOMPARE(view->width(), 535); // 724 x 0.74
    QCOMPARE(spies.config.count(), 1);

    QPushButton *left = panel->findChildren<QPushButton *>().first();
    PanelProbe::click(left);
    QCOMPARE(view->x(), 0);
    QCOMPARE(spies.config.count(), 2);
    PanelProbe::click(left); // where it stands already
    QCOMPARE(spies.config.count(), 2);

    PanelProbe::click(PanelProbe::button<QCheckBox>(panel, QStringLiteral("Object Type")));
    QCOMPARE(shown().first(), QStringList({"Object Name", "Value Name", "Value"}));
    QCOMPARE(spies.config.count(), 3);

    QTest::keyClick(panel->findChild<QComboBox *>(), Qt::Key_Down);
    QCOMPARE(shown().at(1).first(), QStringLiteral("Corner"));
    QCOMPARE(spies.config.count(), 4);

    QCOMPARE(spies.modified.count(), 4);
    QCOMPARE(spies.pieces.count(), 0);
}

void KvStatisticsMeasurementsTableWidgetTest::theThemeIsAnnouncedOnce()
{
    const std::unique_ptr<QWidget> panel(m_table->createOptionsWidget(nullptr, true));
    QVERIFY(PanelProbe::show(panel.get()));
    TableSpies spies(*m_table, m_context.get());
    PanelProbe::click(PanelProbe::button<QRadioButton>(panel.get(), QStringLiteral("Light")));
    QCOMPARE(m_cfg->themeIndex(), 1);
    QCOMPARE(spies.config.count(), 1);
    QCOMPARE(spies.modified.count(), 1);
    QCOMPARE(spies.changed.count(), 1); // refilled once
}

void KvStatisticsMeasurementsTableWidgetTest::togglingColumnsKeepsThePieces()
{
    m_host->setRows(FakeMeasurements::lines(100));
    QWidget *piece = m_table->subWidgetAt(1);
    m_table->slotColumnsChanged({});
    QCOMPARE(m_table->subWidgetCount(), 1); // no columns, no rows
    m_table->slotColumnsChanged({QStringLiteral("Value")});
    QCOMPARE(m_table->subWidgetCount(), 3);
    QCOMPARE(shown(1).at(1), QStringList{"39 µm"});
    QVERIFY(m_table->subWidgetAt(1) != piece); // the old one is on its way out
}

void KvStatisticsMeasurementsTableWidgetTest::panelsWithoutPlacement()
{
    const std::unique_ptr<QWidget> panel(m_table->createOptionsWidget(nullptr, false));
    QVERIFY(panel);
    QVERIFY(!panel->findChild<QSpinBox *>());
    QVERIFY(panel->findChildren<QPushButton *>().isEmpty());
    QCOMPARE(panel->findChildren<QCheckBox *>().size(), 4);
}

void KvStatisticsMeasurementsTableWidgetTest::panelsOutliveTheirTable()
{
    const std::unique_ptr<QWidget> panel(m_table->createOptionsWidget(nullptr, true));
    QVERIFY(PanelProbe::show(panel.get()));
    m_table.reset();
    PanelProbe::click(PanelProbe::button<QCheckBox>(panel.get(), QStringLiteral("Value")));
    QVERIFY(!m_cfg->columns().contains(QStringLiteral("Value")));
}

void KvStatisticsMeasurementsTableWidgetTest::blockStyleDoesNotReachTheCells_data()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<QColor>("background");
    QTest::newRow("Dark") << 0 << QColor("#4D4D4D");
    QTest::newRow("Light") << 1 << QColor("#DDDDDD");
}

void KvStatisticsMeasurementsTableWidgetTest::blockStyleDoesNotReachTheCells()
{
    QFETCH(int, theme);
    QFETCH(QColor, background);
    m_cfg->setTheme(theme);
    m_cfg->setWidthPercent(100);
    // The white style sheet of a page's frame cascades into the table's view.
    const QImage image = TableProbe::pagePicture(m_table->subWidgetAt(0), true);
    QCOMPARE(image.pixelColor(4, 4), QColor(Qt::white));
    QCOMPARE(image.pixelColor(8 + 2, 8 + 5 + 2), background);
    QCOMPARE(image.pixelColor(8 + 700, 8 + 5 + 100), background);
}

void KvStatisticsMeasurementsTableWidgetTest::rightToLeftAndChineseTexts()
{
    m_host->setRows({{QStringLiteral("دائرة ١"), QStringLiteral("دائرة"), QStringLiteral("القطر"), 3.5,
                      QStringLiteral("3.5 µm")},
                     {QStringLiteral("圆形 1"), QStringLiteral("圆形"), QStringLiteral("直径"), 2.5,
                      QStringLiteral("2.5 µm")}});
    QCOMPARE(shown().at(1), QStringList({"دائرة ١", "دائرة", "القطر", "3.5 µm"}));
    const QColor background(QStringLiteral("#4D4D4D"));
    const QImage image = TableProbe::pagePicture(m_table->subWidgetAt(0), true);
    // Both rows show ink at the left of every column: tables read from left to right whatever they hold.
    const int left = 8 + (724 - 543) / 2;
    for (const int row : {1, 2}) {
        for (int column = 0; column < 4; ++column) {
            bool hasInk = false;
            for (int x = left + 135 * column + 4; x < left + 135 * column + 40; ++x) {
                for (int y = 8 + 5 + 32 * row + 4; y < 8 + 5 + 32 * row + 28; ++y)
                    hasInk = hasInk || image.pixelColor(x, y) != background;
            }
            QVERIFY2(hasInk, qPrintable(QStringLiteral("row %1, column %2").arg(row).arg(column)));
        }
    }
}

void KvStatisticsMeasurementsTableWidgetTest::handlesHundredThousandRows()
{
    QElapsedTimer stopwatch;
    stopwatch.start();
    m_host->setRows(FakeMeasurements::lines(100000));
    QCOMPARE(m_table->subWidgetCount(), 2565);
    m_table->slotOrderBySelected(QStringLiteral("Value"), false);
    QCOMPARE(shown(0).at(1).first(), QStringLiteral("Line 99999"));
    m_table->slotOrderBySelected(QStringLiteral("Object Name"), true);
    QCOMPARE(shown(0).at(3).first(), QStringLiteral("Line 10"));
    QVERIFY2(stopwatch.elapsed() < 40000, "a long table takes far longer than it should");
}

STATREPORT_TEST_MAIN(KvStatisticsMeasurementsTableWidgetTest)
#include "KvStatisticsMeasurementsTableWidgetTest.moc"
