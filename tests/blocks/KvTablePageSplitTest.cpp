// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/table/KvTablePageSplit.h"

#include <limits>

class KvTablePageSplitTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void rowsAndPieces_data();
    void rowsAndPieces();
    void twentyFiveRowsOnPagesOfTen();
    void withoutLimitEverythingIsInOnePiece();
    void lowPagesHoldEverything();
    void everyRowIsOnOnePageOnce();
    void noPieceIsHigherThanItsPage();
    void countsPiecesOfHugeTables();
};

void KvTablePageSplitTest::rowsAndPieces_data()
{
    QTest::addColumn<int>("contentHeight");
    QTest::addColumn<int>("headerRows");
    QTest::addColumn<int>("bodyRows");
    QTest::addColumn<int>("rowsPerPage");
    QTest::addColumn<int>("pieces");
    // Rows per page: (height - 32 x header rows - 10) / 32, the fraction dropped.
    QTest::newRow("no limit") << 0 << 1 << 500 << -1 << 1;
    QTest::newRow("negative height") << -100 << 1 << 500 << -1 << 1;
    QTest::newRow("no body rows") << 362 << 1 << 0 << 10 << 1;
    QTest::newRow("one body row") << 362 << 1 << 1 << 10 << 1;
    QTest::newRow("a full page") << 362 << 1 << 10 << 10 << 1;
    QTest::newRow("one row too many") << 362 << 1 << 11 << 10 << 2;
    QTest::newRow("three pages, the last half full") << 362 << 1 << 25 << 10 << 3;
    QTest::newRow("three full pages") << 362 << 1 << 30 << 10 << 3;
    QTest::newRow("a fourth page for one row") << 362 << 1 << 31 << 10 << 4;
    QTest::newRow("a pixel less is a row less") << 361 << 1 << 25 << 9 << 3;
    QTest::newRow("31 pixels more are no row more") << 393 << 1 << 25 << 10 << 3;
    QTest::newRow("no header") << 362 << 0 << 25 << 11 << 3;
    QTest::newRow("two header rows") << 362 << 2 << 25 << 9 << 3;
    QTest::newRow("an A4 page at its usual size") << 1304 << 1 << 100 << 39 << 3;
    QTest::newRow("the lowest page with rows") << 74 << 1 << 40 << 1 << 40;
    QTest::newRow("a pixel too low for a row") << 73 << 1 << 40 << -1 << 1;
    QTest::newRow("lower than the header") << 20 << 1 << 40 << -1 << 1;
    QTest::newRow("no header, one row") << 42 << 0 << 3 << 1 << 3;
}

void KvTablePageSplitTest::rowsAndPieces()
{
    QFETCH(int, contentHeight);
    QFETCH(int, headerRows);
    QFETCH(int, bodyRows);
    const KvTablePageSplit split = KvTablePageSplit::compute(contentHeight, headerRows, bodyRows);
    QTEST(split.rowsPerPage, "rowsPerPage");
    QTEST(split.pieceCount, "pieces");
}

void KvTablePageSplitTest::twentyFiveRowsOnPagesOfTen()
{
    const KvTablePageSplit split = KvTablePageSplit::compute(362, 1, 25);
    QCOMPARE(split.firstRow(0), 0);
    QCOMPARE(split.firstRow(1), 10);
    QCOMPARE(split.firstRow(2), 20);
    QCOMPARE(split.rowCount(0, 25), 10);
    QCOMPARE(split.rowCount(1, 25), 10);
    QCOMPARE(split.rowCount(2, 25), 5);
    QCOMPARE(split.rowCount(3, 25), 0); // a piece that is about to be dropped
}

void KvTablePageSplitTest::withoutLimitEverythingIsInOnePiece()
{
    const KvTablePageSplit split = KvTablePageSplit::compute(0, 1, 100000);
    QCOMPARE(split.firstRow(0), 0);
    QCOMPARE(split.rowCount(0, 100000), 100000);
}

void KvTablePageSplitTest::lowPagesHoldEverything()
{
    for (int height = 1; height <= 80; ++height) {
        const KvTablePageSplit split = KvTablePageSplit::compute(height, 1, 40);
        QCOMPARE(split.pieceCount, height < 74 ? 1 : 40);
        QCOMPARE(split.rowCount(0, 40), height < 74 ? 40 : 1);
    }
}

void KvTablePageSplitTest::everyRowIsOnOnePageOnce()
{
    for (int height = 1; height < 1500; height += 7) {
        for (int bodyRows = 0; bodyRows <= 90; bodyRows += 3) {
            const KvTablePageSplit split = KvTablePageSplit::compute(height, 1, bodyRows);
            int next = 0;
            for (int page = 0; page < split.pieceCount; ++page) {
                QCOMPARE(split.firstRow(page), next);
                next += split.rowCount(page, bodyRows);
                QVERIFY(bodyRows == 0 || split.rowCount(page, bodyRows) > 0);
            }
            QCOMPARE(next, bodyRows);
        }
    }
}

void KvTablePageSplitTest::noPieceIsHigherThanItsPage()
{
    for (int headerRows = 0; headerRows <= 3; ++headerRows) {
        for (int height = headerRows * 32 + 42; height < 1500; ++height) {
            const KvTablePageSplit split = KvTablePageSplit::compute(height, headerRows, 1000);
            QVERIFY(split.rowsPerPage > 0);
            QVERIFY((headerRows + split.rowsPerPage) * 32 + 10 <= height);
        }
    }
}

void KvTablePageSplitTest::countsPiecesOfHugeTables()
{
    const int rows = std::numeric_limits<int>::max();
    QCOMPARE(KvTablePageSplit::compute(74, 1, rows).pieceCount, rows);
    QCOMPARE(KvTablePageSplit::compute(106, 1, rows).pieceCount, 1073741824);
}

STATREPORT_TEST_MAIN(KvTablePageSplitTest)
#include "KvTablePageSplitTest.moc"
