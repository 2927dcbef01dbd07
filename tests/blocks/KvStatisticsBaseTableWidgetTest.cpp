// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "PlainTable.h"
#include "TableProbe.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvStatisticsThemedNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QTableView>

namespace {

/** Counts what a table tells the page layout. */
struct LayoutSpies
{
    explicit LayoutSpies(const KvBaseDisplayWidget &table)
        : pieces(table.displaySignals(), SIGNAL(signalSubWidgetsChanged()))
                 , size(table.displaySignals(), SIGNAL(signalWidgetChanged()))
                        , config(table.displaySignals(),
                                 SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg *)))
    {}

    void clear()
    {
        pieces.clear();
        size.clear();
        config.clear();
    }

    QSignalSpy pieces;
    QSignalSpy size;
    QSignalSpy config;
};

void deleteLaterNow()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

} // namespace

class KvStatisticsBaseTableWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void anEmptyTableHasOneEmptyPiece();
    void countsColumnsOfHeaderAndBody();
    void withoutBodyRowsTheHeaderIsShown();
    void splitsRowsUnderRepeatedHeaders();
    void flaggedCellsAreRed();
    void clearEmptiesGridAndPieces();
    void piecesAreMadeOnRequest();
    void printedPiecesHaveNoView();
    void fewerRowsDropPieces();
    void moreRowsAnnouncePieces();
    void equallyManyPiecesAnnounceAChange();
    void thePageHeightSplitsAnew();
    void lowPagesKeepEverythingTogether();
    void noPieceIsHigherThanThePage();
    void tellsOnceThatThePieceCountChanged();
    void aLayoutInsideTheSignalSeesTheNewPieces();
    void widthIsAPercentage_data();
    void widthIsAPercentage();
    void followsThePageWidth();
    void placementIsAnnounced();
    void optionChangesAreAnnounced();
    void withoutContextAllRowsAreInOnePiece();
    void deletedPiecesAreMadeAgain();
    void aPieceKeepsItsRowsWhenAnotherOneDies();
    void addedPiecesBelongToTheTable();
    void piecesOutliveTheTableForAMoment();
    void piecesBelongToTheDisplayParent();
    void handlesHundredThousandRows();
    void handlesLongTexts();

private:
    QStringList firstColumn(QWidget *widget) const;

    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvStatisticsThemedNodeCfg> m_cfg;
    std::unique_ptr<PlainTable> m_table;
};

void KvStatisticsBaseTableWidgetTest::init()
{
    StatReportTest::init();
    m_context = std::make_unique<KvTemplateContext>(nullptr);
    m_context->setContentHeight(362); // ten body rows under one header row
    m_cfg = std::make_unique<KvStatisticsThemedNodeCfg>(m_context.get());
    m_table = std::make_unique<PlainTable>(m_cfg.get());
}

void KvStatisticsBaseTableWidgetTest::cleanup()
{
    m_table.reset();
    deleteLaterNow();
    m_cfg.reset();
    m_context.reset();
    StatReportTest::cleanup();
}

QStringList KvStatisticsBaseTableWidgetTest::firstColumn(QWidget *widget) const
{
    QStringList texts;
    const QAbstractItemModel *model = TableProbe::piece(widget)->model();
    for (int row = 0; row < model->rowCount(); ++row)
        texts.append(model->index(row, 0).data().toString());
    return texts;
}

void KvStatisticsBaseTableWidgetTest::anEmptyTableHasOneEmptyPiece()
{
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(m_table->bodyRowCount(), 0);
    QCOMPARE(m_table->columnCount(), 0);
    QWidget *piece = m_table->subWidgetAt(0);
    QVERIFY(piece);
    QCOMPARE(piece->height(), 10);
    QCOMPARE(TableProbe::piece(piece)->model()->rowCount(), 0);
    QVERIFY(!m_table->subWidgetAt(1));
    QVERIFY(!m_table->subWidgetAt(-1));
}

void KvStatisticsBaseTableWidgetTest::countsColumnsOfHeaderAndBody()
{
    m_table->setHeaderCell(0, 4, QStringLiteral("h"), 1);
    QCOMPARE(m_table->columnCount(), 5);
    QCOMPARE(m_table->bodyRowCount(), 0);
    m_table->setCell(7, 2, QStringLiteral("b"), false, 1);
    QCOMPARE(m_table->columnCount(), 5);
    QCOMPARE(m_table->bodyRowCount(), 8);
    m_table->setCell(0, 6, QStringLiteral("b"), false, 1);
    QCOMPARE(m_table->columnCount(), 7);
}

void KvStatisticsBaseTableWidgetTest::withoutBodyRowsTheHeaderIsShown()
{
    m_table->showRows(0);
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(firstColumn(m_table->subWidgetAt(0)), QStringList{"H0"});
    QCOMPARE(m_table->subWidgetAt(0)->height(), 42);
}

void KvStatisticsBaseTableWidgetTest::splitsRowsUnderRepeatedHeaders()
{
    m_table->showRows(25);
    QCOMPARE(m_table->subWidgetCount(), 3);
    QList<QStringList> expected;
    for (int page = 0; page < 3; ++page) {
        QStringList rows{QStringLiteral("H0")};
        for (int row = 10 * page; row < qMin(25, 10 * page + 10); ++row)
            rows.append(QStringLiteral("%1/0").arg(row));
        expected.append(rows);
    }
    for (int page = 0; page < 3; ++page)
        QCOMPARE(firstColumn(m_table->subWidgetAt(page)), expected.at(page));
    QCOMPARE(m_table->subWidgetAt(2)->height(), 6 * 32 + 10);
    QVERIFY(!m_table->subWidgetAt(3));
}

void KvStatisticsBaseTableWidgetTest::flaggedCellsAreRed()
{
    m_table->setHeaderCell(0, 0, QStringLiteral("h"), 1);
    m_table->setCell(0, 0, QStringLiteral("flagged"), true, 1);
    m_table->setCell(1, 0, QStringLiteral("plain"), false, 1);
    m_table->finishUpdate();
    const QAbstractItemModel *model = TableProbe::piece(m_table->subWidgetAt(0))->model();
    QVERIFY(!qvariant_cast<QColor>(model->index(0, 0).data(Qt::ForegroundRole)).isValid());
    QCOMPARE(qvariant_cast<QColor>(model->index(1, 0).data(Qt::ForegroundRole)), QColor("#A90909"));
    QVERIFY(!qvariant_cast<QColor>(model->index(2, 0).data(Qt::ForegroundRole)).isValid());
}

void KvStatisticsBaseTableWidgetTest::clearEmptiesGridAndPieces()
{
    m_table->setHeaderCell(0, 0, QStringLiteral("wide"), 2);
    m_table->setHeaderCell(0, 2, QStringLiteral("h"), 1);
    m_table->setCell(3, 0, QStringLiteral("b"), false, 1);
    m_table->finishUpdate();
    KvStatisticSubTable *piece = TableProbe::piece(m_table->subWidgetAt(0));
    QCOMPARE(piece->tableView()->columnSpan(0, 0), 2);
    m_table->clear();
    QCOMPARE(m_table->columnCount(), 0);
    QCOMPARE(m_table->bodyRowCount(), 0);
    QCOMPARE(piece->model()->rowCount(), 0);
    QCOMPARE(piece->model()->columnCount(), 0);
    m_table->showRows(1);
    QCOMPARE(piece->tableView()->columnSpan(0, 0), 1);
}

void KvStatisticsBaseTableWidgetTest::piecesAreMadeOnRequest()
{
    m_table->showRows(25);
    QCOMPARE(m_table->subTables().size(), 0);
    QWidget *last = m_table->subWidgetAt(2);
    QCOMPARE(m_table->subTables().size(), 3);
    QCOMPARE(m_table->subWidgetAt(2), last);
    QCOMPARE(firstColumn(m_table->subWidgetAt(1)).value(1), QStringLiteral("10/0"));
}

void KvStatisticsBaseTableWidgetTest::printedPiecesHaveNoView()
{
    m_context->setPrinting(true);
    m_table->showRows(25);
    KvStatisticSubTable *piece = TableProbe::piece(m_table->subWidgetAt(0));
    QVERIFY(!piece->tableView());
    QCOMPARE(firstColumn(piece).size(), 11);
    m_context->setPrinting(false);
    QCOMPARE(m_table->subWidgetAt(0), piece); // on screen the same piece gets its view
    QVERIFY(piece->tableView());
    m_context->setPrinting(true);
    QCOMPARE(m_table->subWidgetAt(0), piece);
    QVERIFY(piece->tableView());
}

void KvStatisticsBaseTableWidgetTest::fewerRowsDropPieces()
{
    m_table->showRows(40);
    QCOMPARE(m_table->subWidgetCount(), 4);
    QList<QPointer<QWidget>> pieces;
    for (int page = 0; page < 4; ++page)
        pieces.append(m_table->subWidgetAt(page));
    LayoutSpies spies(*m_table);
    m_table->showRows(5);
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(m_table->subTables().size(), 1);
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(spies.size.count(), 0);
    QCOMPARE(firstColumn(m_table->subWidgetAt(0)).size(), 6);
    QCOMPARE(m_table->subWidgetAt(0), pieces.at(0).data());
    // The page that shows the others is rebuilt later; until then they are there, and empty.
    for (int page = 1; page < 4; ++page) {
        QVERIFY(pieces.at(page));
        QCOMPARE(TableProbe::piece(pieces.at(page))->model()->rowCount(), 0);
    }
    deleteLaterNow();
    QVERIFY(pieces.at(0));
    for (int page = 1; page < 4; ++page)
        QVERIFY(!pieces.at(page));
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(m_table->subWidgetCount(), 1);
}

void KvStatisticsBaseTableWidgetTest::moreRowsAnnouncePieces()
{
    m_table->showRows(5);
    m_table->subWidgetAt(0);
    LayoutSpies spies(*m_table);
    m_table->showRows(11);
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(spies.size.count(), 0);
    // Count and rows are there at once: a print does not wait.
    QCOMPARE(m_table->subWidgetCount(), 2);
    QCOMPARE(firstColumn(m_table->subWidgetAt(1)), QStringList({"H0", "10/0"}));
}

void KvStatisticsBaseTableWidgetTest::equallyManyPiecesAnnounceAChange()
{
    m_table->showRows(5);
    QWidget *piece = m_table->subWidgetAt(0);
    LayoutSpies spies(*m_table);
    m_table->showRows(7);
    QCOMPARE(spies.pieces.count(), 0);
    QCOMPARE(spies.size.count(), 1);
    QCOMPARE(m_table->subWidgetAt(0), piece);
    QCOMPARE(piece->height(), 8 * 32 + 10);
    QCOMPARE(spies.config.count(), 0);
}

void KvStatisticsBaseTableWidgetTest::thePageHeightSplitsAnew()
{
    m_table->showRows(25);
    QWidget *first = m_table->subWidgetAt(0);
    m_table->subWidgetAt(2);
    LayoutSpies spies(*m_table);

    m_context->setContentHeight(362 - 32); // nine rows: still three pieces
    m_table->updatePageSplit();
    QCOMPARE(m_table->subWidgetCount(), 3);
    QCOMPARE(spies.pieces.count(), 0);
    QCOMPARE(spies.size.count(), 1);
    QCOMPARE(firstColumn(m_table->subWidgetAt(2)).value(1), QStringLiteral("18/0"));

    spies.clear();
    m_context->setContentHeight(1304);
    m_table->updatePageSplit();
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(spies.size.count(), 0);
    QCOMPARE(m_table->subWidgetAt(0), first);
    QCOMPARE(firstColumn(first).size(), 26);
}

void KvStatisticsBaseTableWidgetTest::lowPagesKeepEverythingTogether()
{
    m_table->showRows(40);
    for (int height = 1; height <= 80; ++height) {
        m_context->setContentHeight(height);
        m_table->updatePageSplit();
        QCOMPARE(m_table->subWidgetCount(), height < 74 ? 1 : 40);
        QCOMPARE(firstColumn(m_table->subWidgetAt(0)).size(), height < 74 ? 41 : 2);
        QVERIFY(height < 74 || m_table->subWidgetAt(39)->height() <= height);
        deleteLaterNow();
    }
}

void KvStatisticsBaseTableWidgetTest::noPieceIsHigherThanThePage()
{
    m_table->showRows(23);
    for (int height = 74; height < 900; height += 13) {
        m_context->setContentHeight(height);
        m_table->updatePageSplit();
        int rows = 0;
        for (int page = 0; page < m_table->subWidgetCount(); ++page) {
            QWidget *piece = m_table->subWidgetAt(page);
            QVERIFY2(piece->height() <= height,
                     qPrintable(QStringLiteral("%1 on a page of %2").arg(piece->height()).arg(height)));
            QCOMPARE(piece->sizeHint().height(), piece->height());
            rows += TableProbe::piece(piece)->model()->rowCount() - 1;
        }
        QCOMPARE(rows, 23);
        deleteLaterNow();
    }
}

void KvStatisticsBaseTableWidgetTest::tellsOnceThatThePieceCountChanged()
{
    LayoutSpies spies(*m_table);
    m_table->showRows(25);
    m_table->showRows(25);
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(spies.size.count(), 1);
    for (int page = 0; page < 3; ++page)
        m_table->subWidgetAt(page); // making pieces changes nothing
    QCOMPARE(spies.pieces.count(), 1);
    QCOMPARE(spies.size.count(), 1);
}

void KvStatisticsBaseTableWidgetTest::aLayoutInsideTheSignalSeesTheNewPieces()
{
    // A layout that asks for all pieces while it is told of them must not be told again.
    LayoutSpies spies(*m_table);
    QList<int> heights;
    connect(m_table->displaySignals(), &KvBaseDisplayWidgetSignals::signalSubWidgetsChanged, this, [&]() {
        heights.clear();
        for (int page = 0; page < m_table->subWidgetCount(); ++page)
            heights.append(m_table->subWidgetAt(page)->height());
    });
    m_table->showRows(25);
    QCOMPARE(heights, QList<int>({362, 362, 202}));
    m_table->showRows(12);
    QCOMPARE(heights, QList<int>({362, 106}));
    QCOMPARE(spies.pieces.count(), 2);
    QCOMPARE(spies.size.count(), 0);
}

void KvStatisticsBaseTableWidgetTest::widthIsAPercentage_data()
{
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("width");
    QTest::newRow("default") << 75 << 543; // 724 x 0.75
    QTest::newRow("least") << 1 << 7;
    QTest::newRow("53") << 53 << 383; // 383.72
    QTest::newRow("59") << 59 << 427; // 427.16
    QTest::newRow("whole width") << 100 << 724;
    QTest::newRow("from a damaged file: 0") << 0 << 7;
    QTest::newRow("from a damaged file: 400") << 400 << 724;
    QTest::newRow("from a damaged file: -3") << -3 << 7;
}

void KvStatisticsBaseTableWidgetTest::widthIsAPercentage()
{
    QFETCH(int, percent);
    m_table->width = percent;
    m_table->place = Qt::AlignLeft;
    m_table->showRows(3);
    QWidget *piece = m_table->subWidgetAt(0);
    QCOMPARE(piece->width(), 724);
    QTEST(TableProbe::piece(piece)->tableView()->width(), "width");
}

void KvStatisticsBaseTableWidgetTest::followsThePageWidth()
{
    m_table->showRows(3);
    m_table->subWidgetAt(0);
    m_context->setPageWidth(600); // margins of 72
    QCOMPARE(m_table->subWidgetAt(0)->width(), 456);
    QCOMPARE(TableProbe::piece(m_table->subWidgetAt(0))->tableView()->width(), 342);
    for (const int pageWidth : {40, 20, 1, 0, -5}) {
        m_context->setPageWidth(pageWidth);
        QVERIFY(m_table->subWidgetAt(0)->width() <= 40);
    }
}

void KvStatisticsBaseTableWidgetTest::placementIsAnnounced()
{
    m_table->showRows(3);
    QTableView *view = TableProbe::piece(m_table->subWidgetAt(0))->tableView();
    LayoutSpies spies(*m_table);
    m_table->width = 50;
    m_table->place = Qt::AlignRight;
    m_table->updatePlacement();
    QCOMPARE(view->geometry(), QRect(362, 5, 362, 128));
    QCOMPARE(spies.size.count(), 1);
    QCOMPARE(spies.pieces.count(), 0);
}

void KvStatisticsBaseTableWidgetTest::optionChangesAreAnnounced()
{
    QSignalSpy modified(m_context.get(), SIGNAL(signalTemplateModified()));
    LayoutSpies spies(*m_table);
    m_table->announceConfigChanged();
    QCOMPARE(modified.count(), 1);
    QCOMPARE(spies.config.count(), 1);
    QCOMPARE(configArgument(spies.config, 0), m_cfg.get());
    QCOMPARE(spies.size.count() + spies.pieces.count(), 0);
}

void KvStatisticsBaseTableWidgetTest::withoutContextAllRowsAreInOnePiece()
{
    KvStatisticsThemedNodeCfg cfg(nullptr);
    PlainTable table(&cfg);
    table.showRows(200);
    QCOMPARE(table.subWidgetCount(), 1);
    KvStatisticSubTable *piece = TableProbe::piece(table.subWidgetAt(0));
    QVERIFY(piece->tableView());
    QCOMPARE(piece->model()->rowCount(), 201);
    table.announceConfigChanged();
}

void KvStatisticsBaseTableWidgetTest::deletedPiecesAreMadeAgain()
{
    m_table->showRows(25);
    m_table->subWidgetAt(2);
    const QList<KvStatisticSubTable *> pieces = m_table->subTables();
    qDeleteAll(pieces);
    QCOMPARE(m_table->subTables().size(), 0);
    QCOMPARE(m_table->subWidgetCount(), 3);
    QCOMPARE(firstColumn(m_table->subWidgetAt(1)).value(1), QStringLiteral("10/0"));
    m_table->showRows(3);
    QCOMPARE(m_table->subTables().size(), 1);
}

void KvStatisticsBaseTableWidgetTest::aPieceKeepsItsRowsWhenAnotherOneDies()
{
    m_table->showRows(25);
    m_table->subWidgetAt(2);
    delete m_table->subWidgetAt(1);
    QCOMPARE(m_table->subTables().size(), 2);
    for (int page = 0; page < 3; ++page)
        QCOMPARE(firstColumn(m_table->subWidgetAt(page)).value(1), QStringLiteral("%1/0").arg(10 * page));
    QCOMPARE(m_table->subWidgetAt(1)->height(), 11 * 32 + 10);
    QCOMPARE(m_table->subWidgetAt(2)->height(), 6 * 32 + 10);
}

void KvStatisticsBaseTableWidgetTest::addedPiecesBelongToTheTable()
{
    m_table->showRows(25);
    KvStatisticSubTable *piece = m_table->addSubTable();
    QCOMPARE(m_table->subTables(), QList<KvStatisticSubTable *>{piece});
    m_table->fillSubTable(piece, 1);
    QCOMPARE(firstColumn(piece).value(1), QStringLiteral("10/0"));
    m_table->fillSubTable(piece, 0);
    QCOMPARE(firstColumn(piece).value(1), QStringLiteral("0/0"));
    delete piece;
    QVERIFY(m_table->subTables().isEmpty());
}

void KvStatisticsBaseTableWidgetTest::piecesOutliveTheTableForAMoment()
{
    m_table->showRows(25);
    QWidget page;
    QPointer<QWidget> onPage = m_table->subWidgetAt(0);
    QPointer<QWidget> loose = m_table->subWidgetAt(1);
    onPage->setParent(&page);
    onPage->show();
    page.show();
    QVERIFY(QTest::qWaitForWindowExposed(&page));
    m_table.reset();
    m_cfg.reset();
    QVERIFY(onPage);
    QVERIFY(!onPage->isVisible());
    page.grab(); // paints nothing of the table, which has no configuration any more
    deleteLaterNow();
    QVERIFY(!onPage);
    QVERIFY(!loose);
}

void KvStatisticsBaseTableWidgetTest::piecesBelongToTheDisplayParent()
{
    auto parent = std::make_unique<QWidget>();
    PlainTable table(m_cfg.get(), parent.get());
    table.showRows(25);
    QCOMPARE(table.subWidgetAt(1)->parentWidget(), parent.get());
    parent.reset();
    QCOMPARE(table.subTables().size(), 0);
    QVERIFY(table.subWidgetAt(0));
    QVERIFY(!table.subWidgetAt(0)->parentWidget());
}

void KvStatisticsBaseTableWidgetTest::handlesHundredThousandRows()
{
    m_context->setContentHeight(1304);
    QElapsedTimer stopwatch;
    stopwatch.start();
    m_table->showRows(100000, 4);
    QCOMPARE(m_table->subWidgetCount(), 2565); // 2564 pages of 39 rows and one of 4
    m_context->setPrinting(true);
    QWidget *last = m_table->subWidgetAt(2564);
    QCOMPARE(firstColumn(last), QStringList({"H0", "99996/0", "99997/0", "99998/0", "99999/0"}));
    m_table->showRows(100000, 4);
    QVERIFY2(stopwatch.elapsed() < 20000, "a long table takes far longer than it should");

    m_context->setContentHeight(20); // too low for a row: all of them in one piece, on the screen
    m_context->setPrinting(false);
    m_table->updatePageSplit();
    QCOMPARE(m_table->subWidgetCount(), 1);
    QCOMPARE(m_table->subWidgetAt(0)->height(), 100001 * 32 + 10);
    QVERIFY2(stopwatch.elapsed() < 40000, "a long table takes far longer than it should");
}

void KvStatisticsBaseTableWidgetTest::handlesLongTexts()
{
    QElapsedTimer stopwatch;
    stopwatch.start();
    m_table->setHeaderCell(0, 0, QString(10000, QLatin1Char('h')), 1);
    for (int row = 0; row < 10; ++row) {
        m_table->setCell(row, 0, QString(10000, QLatin1Char('w')), false, 1);
        m_table->setCell(row, 1, QString(10000, QChar(0x6D4B)), false, 1);
        m_table->setCell(row, 2, QStringLiteral("قياس ").repeated(2000), false, 1);
    }
    m_table->finishUpdate();
    const QImage image = TableProbe::pagePicture(m_table->subWidgetAt(0), true);
    QCOMPARE(image.width(), 724 + 16);
    QCOMPARE(image.pixelColor(8 + 10, 100), QColor(Qt::white)); // the table does not get wider
    QVERIFY2(stopwatch.elapsed() < 10000, "long texts take far longer than they should");
}

STATREPORT_TEST_MAIN(KvStatisticsBaseTableWidgetTest)
#include "KvStatisticsBaseTableWidgetTest.moc"
