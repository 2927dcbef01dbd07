// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "TableProbe.h"
#include "blocks/table/KvBaseTableItemDelegate.h"
#include "blocks/table/KvTableContents.h"
#include "blocks/table/KvTableFonts.h"
#include "support/RightToLeft.h"
#include "templates/KvStatisticsThemedNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QHeaderView>
#include <QScrollBar>
#include <QTableView>

namespace {

std::shared_ptr<KvTableContents> makeContents(int bodyRows, int headerSpan = 1)
{
    auto contents = std::make_shared<KvTableContents>();
    contents->headerFont = KvTableFonts::header();
    contents->bodyFont = KvTableFonts::body();
    contents->header.setCell(0, 0, QStringLiteral("H0"), QColor(), headerSpan);
    for (int column = headerSpan; column < 4; ++column)
        contents->header.setCell(0, column, QStringLiteral("H%1").arg(column), QColor(), 1);
    for (int row = 0; row < bodyRows; ++row) {
        for (int column = 0; column < 4; ++column)
            contents->body.setCell(row, column, QStringLiteral("%1/%2").arg(row).arg(column), QColor(), 2);
    }
    return contents;
}

} // namespace

class KvStatisticSubTableTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void theViewComesOnRequest();
    void showsHeaderAndBodyRows();
    void rowsAre32PixelsHigh();
    void rowHeightReachesALaterView();
    void headersAreHidden();
    void headerSpansAreApplied();
    void spansOfOneCellAreNotApplied();
    void spansGoWithTheirContents();
    void styleSheetNamesTheGridColor_data();
    void styleSheetNamesTheGridColor();
    void placesTheTable_data();
    void placesTheTable();
    void columnsShareTheWidth();
    void heightFollowsTheRows();
    void theViewHasNoFrameOrScrollBars();
    void withoutAPageItScrolls();
    void readsFromLeftToRight();
    void looksTheSameFromRightToLeft();
    void bothWaysOfPaintingAgree_data();
    void bothWaysOfPaintingAgree();

private:
    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvStatisticsThemedNodeCfg> m_cfg;
    std::unique_ptr<KvBaseTableItemDelegate> m_delegate;
    std::unique_ptr<KvStatisticSubTable> m_piece;
};

void KvStatisticSubTableTest::init()
{
    StatReportTest::init();
    m_context = std::make_unique<KvTemplateContext>(nullptr);
    m_cfg = std::make_unique<KvStatisticsThemedNodeCfg>(m_context.get());
    m_delegate = std::make_unique<KvBaseTableItemDelegate>(m_cfg->themes());
    m_piece = std::make_unique<KvStatisticSubTable>(m_cfg.get(), m_delegate.get());
}

void KvStatisticSubTableTest::cleanup()
{
    m_piece.reset();
    m_delegate.reset();
    m_cfg.reset();
    m_context.reset();
    StatReportTest::cleanup();
}

void KvStatisticSubTableTest::theViewComesOnRequest()
{
    QVERIFY(!m_piece->tableView());
    m_piece->fill(makeContents(2), 0, 2);
    QVERIFY(!m_piece->tableView());
    m_piece->ensureView();
    QTableView *view = m_piece->tableView();
    QVERIFY(view);
    QCOMPARE(view->model(), m_piece->model());
    QCOMPARE(view->itemDelegate(), m_delegate.get());
    m_piece->ensureView();
    QCOMPARE(m_piece->tableView(), view);
    QCOMPARE(m_piece->findChildren<QTableView *>().size(), 1);
}

void KvStatisticSubTableTest::showsHeaderAndBodyRows()
{
    m_piece->fill(makeContents(25), 20, 5);
    const QAbstractItemModel &model = *m_piece->model();
    QCOMPARE(model.rowCount(), 6);
    QCOMPARE(TableProbe::rowTexts(model, 0), QStringList({"H0", "H1", "H2", "H3"}));
    QCOMPARE(TableProbe::rowTexts(model, 1), QStringList({"20/0", "20/1", "20/2", "20/3"}));
    QCOMPARE(TableProbe::rowTexts(model, 5), QStringList({"24/0", "24/1", "24/2", "24/3"}));
    m_piece->clear();
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.columnCount(), 0);
}

void KvStatisticSubTableTest::rowsAre32PixelsHigh()
{
    m_piece->ensureView();
    m_piece->fill(makeContents(3), 0, 3);
    const QHeaderView *header = m_piece->tableView()->verticalHeader();
    QCOMPARE(header->defaultSectionSize(), 32);
    QCOMPARE(header->sectionResizeMode(0), QHeaderView::Fixed);
    for (int row = 0; row < 4; ++row)
        QCOMPARE(m_piece->tableView()->rowHeight(row), 32);
}

void KvStatisticSubTableTest::rowHeightReachesALaterView()
{
    m_piece->setRowHeight(50);
    m_piece->ensureView();
    QCOMPARE(m_piece->tableView()->verticalHeader()->defaultSectionSize(), 50);
    m_piece->setRowHeight(20);
    QCOMPARE(m_piece->tableView()->verticalHeader()->defaultSectionSize(), 20);
}

void KvStatisticSubTableTest::headersAreHidden()
{
    m_piece->ensureView();
    m_piece->fill(makeContents(3), 0, 3);
    m_piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_piece.get()));
    QVERIFY(!m_piece->tableView()->verticalHeader()->isVisible());
    QVERIFY(!m_piece->tableView()->horizontalHeader()->isVisible());
}

void KvStatisticSubTableTest::headerSpansAreApplied()
{
    for (const bool viewFirst : {true, false}) {
        KvStatisticSubTable piece(m_cfg.get(), m_delegate.get());
        if (viewFirst)
            piece.ensureView();
        piece.fill(makeContents(3, 2), 0, 3);
        piece.ensureView();
        QCOMPARE(piece.tableView()->columnSpan(0, 0), 2);
        QCOMPARE(piece.tableView()->rowSpan(0, 0), 1);
        QCOMPARE(piece.tableView()->columnSpan(0, 2), 1);
        // The body's cells carry spans of 2, which do not count.
        for (int row = 1; row < 4; ++row)
            QCOMPARE(piece.tableView()->columnSpan(row, 0), 1);
    }
}

void KvStatisticSubTableTest::spansOfOneCellAreNotApplied()
{
    // Qt would warn of such a span.
    m_piece->ensureView();
    m_piece->fill(makeContents(3), 0, 3);
    m_piece->setSpan(1, 1, 1, 1);
    m_piece->setSpan(1, 1, 0, 0);
    QCOMPARE(m_piece->tableView()->columnSpan(1, 1), 1);
    m_piece->setSpan(1, 1, 2, 1);
    QCOMPARE(m_piece->tableView()->rowSpan(1, 1), 2);
    m_piece->setSpan(1, 2, 1, 2);
    QCOMPARE(m_piece->tableView()->columnSpan(1, 2), 2);
}

void KvStatisticSubTableTest::spansGoWithTheirContents()
{
    m_piece->ensureView();
    m_piece->fill(makeContents(3, 2), 0, 3);
    m_piece->fill(makeContents(3, 1), 0, 3);
    QCOMPARE(m_piece->tableView()->columnSpan(0, 0), 1);
    m_piece->fill(makeContents(3, 3), 0, 3);
    QCOMPARE(m_piece->tableView()->columnSpan(0, 0), 3);
    m_piece->clear();
    m_piece->fill(makeContents(3, 1), 0, 3);
    QCOMPARE(m_piece->tableView()->columnSpan(0, 0), 1);
}

void KvStatisticSubTableTest::styleSheetNamesTheGridColor_data()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<QString>("sheet");
    QTest::newRow("Dark") << 0
                          << QStringLiteral("QTableView { border: none; background: transparent; "
                                            "gridline-color: #4d4d4d; font: 12px {{Font}}; }");
    QTest::newRow("Light") << 1
                           << QStringLiteral("QTableView { border: none; background: transparent; "
                                             "gridline-color: #dddddd; font: 12px {{Font}}; }");
}

void KvStatisticSubTableTest::styleSheetNamesTheGridColor()
{
    QFETCH(int, theme);
    m_piece->ensureView();
    m_cfg->setTheme(1 - theme);
    m_piece->applyStyle();
    m_cfg->setTheme(theme);
    m_piece->fill(makeContents(1), 0, 1);
    QTEST(m_piece->tableView()->styleSheet(), "sheet");
}

void KvStatisticSubTableTest::placesTheTable_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("tableWidth");
    QTest::addColumn<QRect>("table");
    // A page's content is 724 wide; four rows of 32 stand 5 below the top.
    QTest::newRow("left") << 1 << 543 << QRect(0, 5, 543, 128);
    QTest::newRow("centred both ways") << 132 << 543 << QRect(90, 5, 543, 128);
    QTest::newRow("centred") << 4 << 543 << QRect(90, 5, 543, 128);
    QTest::newRow("right") << 2 << 543 << QRect(181, 5, 543, 128);
    QTest::newRow("no horizontal flag") << 128 << 543 << QRect(0, 5, 543, 128);
    QTest::newRow("full width") << 2 << 724 << QRect(0, 5, 724, 128);
    QTest::newRow("one percent") << 2 << 7 << QRect(717, 5, 7, 128);
    QTest::newRow("wider than the page") << 2 << 900 << QRect(0, 5, 724, 128);
    QTest::newRow("no width") << 132 << 0 << QRect(362, 5, 0, 128);
}

void KvStatisticSubTableTest::placesTheTable()
{
    QFETCH(int, alignment);
    QFETCH(int, tableWidth);
    m_piece->fill(makeContents(3), 0, 3);
    m_piece->ensureView();
    m_piece->setPlacement(724, tableWidth, Qt::Alignment(alignment));
    QCOMPARE(m_piece->size(), QSize(724, 138));
    QCOMPARE(m_piece->sizeHint(), QSize(724, 138));
    QTEST(m_piece->tableView()->geometry(), "table");
}

void KvStatisticSubTableTest::columnsShareTheWidth()
{
    m_piece->ensureView();
    m_piece->fill(makeContents(3), 0, 3);
    m_piece->setPlacement(724, 543, Qt::AlignLeft);
    m_piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_piece.get()));
    const QTableView *view = m_piece->tableView();
    QCOMPARE(view->viewport()->width(), 543);
    QCOMPARE(view->columnWidth(0), 135);
    QCOMPARE(view->columnWidth(1), 135);
    QCOMPARE(view->columnWidth(2), 135);
    QCOMPARE(view->columnWidth(3), 138);
    m_piece->setPlacement(724, 100, Qt::AlignLeft);
    QCOMPARE(view->columnWidth(0), 25);
    QCOMPARE(view->columnWidth(3), 25);

    // Other contents of the same width share it anew.
    auto contents = std::make_shared<KvTableContents>();
    for (int column = 0; column < 3; ++column)
        contents->header.setCell(0, column, QStringLiteral("H"), QColor(), 1);
    m_piece->fill(contents, 0, 0);
    QCOMPARE(view->columnWidth(0), 33);
    QCOMPARE(view->columnWidth(1), 33);
    QCOMPARE(view->columnWidth(2), 34);
}

void KvStatisticSubTableTest::heightFollowsTheRows()
{
    m_piece->ensureView();
    QCOMPARE(m_piece->contentsHeight(), 10);
    m_piece->fill(makeContents(0), 0, 0);
    QCOMPARE(m_piece->contentsHeight(), 42);
    m_piece->fill(makeContents(39), 0, 39);
    QCOMPARE(m_piece->contentsHeight(), 1290);
    m_piece->setPlacement(724, 724, Qt::AlignLeft);
    QCOMPARE(m_piece->height(), 1290);
    m_piece->setPlacement(-5, -5, Qt::AlignLeft); // a page without any width
    QCOMPARE(m_piece->width(), 0);
}

void KvStatisticSubTableTest::theViewHasNoFrameOrScrollBars()
{
    m_piece->ensureView();
    m_piece->fill(makeContents(39), 0, 39);
    m_piece->setPlacement(724, 543, Qt::AlignLeft);
    m_piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_piece.get()));
    const QTableView *view = m_piece->tableView();
    QCOMPARE(view->viewport()->geometry(), QRect(QPoint(0, 0), view->size()));
    QVERIFY(!view->verticalScrollBar()->isVisible());
    QVERIFY(!view->horizontalScrollBar()->isVisible());
    QCOMPARE(view->verticalScrollBar()->maximum(), 0);

    // So it is on a page, whose style sheet reaches the view.
    QWidget page;
    page.setStyleSheet(QStringLiteral("QWidget { background: white; }"));
    m_piece->setStyleSheet(QStringLiteral("QWidget { background: white; color: black;}"));
    m_piece->setParent(&page);
    m_piece->show();
    page.show();
    QVERIFY(QTest::qWaitForWindowExposed(&page));
    QCOMPARE(view->viewport()->geometry(), QRect(QPoint(0, 0), view->size()));
    m_piece->setParent(nullptr);
}

void KvStatisticSubTableTest::withoutAPageItScrolls()
{
    KvStatisticsThemedNodeCfg cfg(nullptr);
    KvStatisticSubTable piece(&cfg, m_delegate.get());
    piece.ensureView();
    piece.fill(makeContents(100), 0, 100);
    piece.resize(400, 300); // the window decides
    piece.show();
    QVERIFY(QTest::qWaitForWindowExposed(&piece));
    QCOMPARE(piece.size(), QSize(400, 300));
    QTableView *view = piece.tableView();
    QTRY_VERIFY(view->verticalScrollBar()->isVisible());
    QVERIFY(!view->horizontalScrollBar()->isVisible());
    view->scrollToBottom();
    QVERIFY(view->visualRect(piece.model()->index(100, 0)).bottom() <= view->viewport()->height());
    QVERIFY(view->viewport()->width() < 400);
    QCOMPARE(view->horizontalHeader()->length(), view->viewport()->width());
}

void KvStatisticSubTableTest::readsFromLeftToRight()
{
    const RightToLeft program;
    KvStatisticSubTable piece(m_cfg.get(), m_delegate.get());
    piece.ensureView();
    QCOMPARE(piece.layoutDirection(), Qt::LeftToRight);
    QCOMPARE(piece.tableView()->layoutDirection(), Qt::LeftToRight);
}

void KvStatisticSubTableTest::looksTheSameFromRightToLeft()
{
    const std::shared_ptr<KvTableContents> contents = makeContents(2);
    contents->body.setCell(0, 0, QStringLiteral("11.421 mm"), QColor(), 2);
    contents->body.setCell(1, 1, QStringLiteral("28.571 %"), QColor(), 2);
    const auto picture = [&](bool withView) {
        KvStatisticSubTable piece(m_cfg.get(), m_delegate.get());
        piece.fill(contents, 0, 2);
        if (withView)
            piece.ensureView();
        piece.setPlacement(724, 724, Qt::AlignLeft);
        return TableProbe::pagePicture(&piece, withView);
    };
    for (const bool withView : {false, true}) {
        const QImage expected = picture(withView);
        const RightToLeft program;
        QCOMPARE(picture(withView), expected);
    }
}

void KvStatisticSubTableTest::bothWaysOfPaintingAgree_data()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("alignment");
    for (const int theme : {0, 1}) {
        for (const int percent : {1, 53, 59, 100}) {
            for (const int alignment : {1, 132, 2})
                QTest::addRow("theme %d, %d %%, alignment %d", theme, percent, alignment)
                    << theme << percent << alignment;
        }
    }
}

void KvStatisticSubTableTest::bothWaysOfPaintingAgree()
{
    QFETCH(int, theme);
    QFETCH(int, percent);
    QFETCH(int, alignment);
    m_cfg->setTheme(theme);
    const std::shared_ptr<KvTableContents> contents = makeContents(6, 2);
    contents->body.setCell(1, 0, QStringLiteral("flagged"), QColor("#A90909"), 1);
    contents->body.setCell(2, 1, QString(500, QLatin1Char('w')), QColor(), 1);
    contents->body.setCell(3, 0, QStringLiteral("نتيجة القياس"), QColor(), 1);
    contents->body.setCell(3, 1, QStringLiteral("测量结果"), QColor(), 1);
    contents->body.setCell(4, 2, QStringLiteral("two\nlines"), QColor(), 1);
    contents->body.setCell(7, 2, QStringLiteral("below an empty row"), QColor(), 1);

    QImage pictures[2];
    for (const bool withView : {false, true}) {
        KvStatisticSubTable piece(m_cfg.get(), m_delegate.get());
        piece.fill(contents, 0, 8);
        if (withView)
            piece.ensureView();
        piece.setPlacement(724, 724 * percent / 100, Qt::Alignment(alignment));
        pictures[withView ? 1 : 0] = TableProbe::pagePicture(&piece, withView);
    }
    QCOMPARE(pictures[0].size(), QSize(724 + 16, 9 * 32 + 10 + 16));
    QCOMPARE(pictures[1], pictures[0]);

    // A picture of something: the page is white, the table is not.
    const int x = alignment == 1 ? 0 : alignment == 2 ? 723 : 361;
    QCOMPARE(pictures[0].pixelColor(8 + x, 8 + 5), QColor(theme == 0 ? "#4D4D4D" : "#DDDDDD"));
    QCOMPARE(pictures[0].pixelColor(8 + x, 8 + 4), QColor(Qt::white));
    QCOMPARE(pictures[0].pixelColor(8 + x, 8 + 5 + 9 * 32), QColor(Qt::white));
}

STATREPORT_TEST_MAIN(KvStatisticSubTableTest)
#include "KvStatisticSubTableTest.moc"
