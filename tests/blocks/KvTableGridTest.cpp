// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/table/KvTableGrid.h"

class KvTableGridTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsEmpty();
    void growsToItsCells_data();
    void growsToItsCells();
    void keepsWhatACellHolds();
    void replacesACell();
    void leavesHolesWithoutCells();
    void keepsCellsWhenItGetsWider();
    void ignoresNegativePositions();
    void aSpanIsOneAtLeast();
    void knowsWhetherCellsSpan();
    void clearLeavesNothingBehind();
    void reservingAddsNoCells();
    void holdsManyRows();
};

void KvTableGridTest::startsEmpty()
{
    const KvTableGrid grid;
    QCOMPARE(grid.rowCount(), 0);
    QCOMPARE(grid.columnCount(), 0);
    QVERIFY(!grid.hasSpans());
    QVERIFY(!grid.cell(0, 0));
}

void KvTableGridTest::growsToItsCells_data()
{
    QTest::addColumn<QPoint>("first");
    QTest::addColumn<QPoint>("second");
    QTest::addColumn<int>("rows");
    QTest::addColumn<int>("columns");
    // Points are (column, row).
    QTest::newRow("one corner") << QPoint(0, 0) << QPoint(0, 0) << 1 << 1;
    QTest::newRow("a column further right") << QPoint(0, 0) << QPoint(3, 0) << 1 << 4;
    QTest::newRow("a row further down") << QPoint(0, 0) << QPoint(0, 5) << 6 << 1;
    QTest::newRow("backwards") << QPoint(4, 2) << QPoint(0, 0) << 3 << 5;
    QTest::newRow("wide row first") << QPoint(6, 0) << QPoint(1, 1) << 2 << 7;
}

void KvTableGridTest::growsToItsCells()
{
    QFETCH(QPoint, first);
    QFETCH(QPoint, second);
    KvTableGrid grid;
    grid.setCell(first.y(), first.x(), QStringLiteral("first"), QColor(), 1);
    grid.setCell(second.y(), second.x(), QStringLiteral("second"), QColor(), 1);
    QTEST(grid.rowCount(), "rows");
    QTEST(grid.columnCount(), "columns");
    QCOMPARE(grid.cell(second.y(), second.x())->text, QStringLiteral("second"));
    if (first != second)
        QCOMPARE(grid.cell(first.y(), first.x())->text, QStringLiteral("first"));
}

void KvTableGridTest::keepsWhatACellHolds()
{
    KvTableGrid grid;
    grid.setCell(1, 2, QStringLiteral("12 µm"), QColor(Qt::red), 3);
    const KvTableCell *cell = grid.cell(1, 2);
    QVERIFY(cell);
    QCOMPARE(cell->text, QStringLiteral("12 µm"));
    QCOMPARE(cell->color, QColor(Qt::red));
    QCOMPARE(cell->columnSpan, 3);
}

void KvTableGridTest::replacesACell()
{
    KvTableGrid grid;
    grid.setCell(0, 0, QStringLiteral("old"), QColor(Qt::red), 2);
    grid.setCell(0, 0, QStringLiteral("new"), QColor(), 1);
    QCOMPARE(grid.cell(0, 0)->text, QStringLiteral("new"));
    QVERIFY(!grid.cell(0, 0)->color.isValid());
    QCOMPARE(grid.cell(0, 0)->columnSpan, 1);
    QCOMPARE(grid.rowCount(), 1);
}

void KvTableGridTest::leavesHolesWithoutCells()
{
    KvTableGrid grid;
    grid.setCell(2, 1, QString(), QColor(), 1); // an empty text is a cell all the same
    QVERIFY(grid.cell(2, 1));
    QVERIFY(!grid.cell(0, 0));
    QVERIFY(!grid.cell(2, 0));
    QVERIFY(!grid.cell(2, 2));
    QVERIFY(!grid.cell(3, 1));
    QVERIFY(!grid.cell(-1, 1));
    QVERIFY(!grid.cell(2, -1));
}

void KvTableGridTest::keepsCellsWhenItGetsWider()
{
    KvTableGrid grid;
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column <= 2 * row; ++column)
            grid.setCell(row, column, QStringLiteral("%1/%2").arg(row).arg(column), QColor(), 1);
    }
    QCOMPARE(grid.columnCount(), 5);
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 5; ++column) {
            const KvTableCell *cell = grid.cell(row, column);
            QCOMPARE(cell != nullptr, column <= 2 * row);
            if (cell)
                QCOMPARE(cell->text, QStringLiteral("%1/%2").arg(row).arg(column));
        }
    }
}

void KvTableGridTest::ignoresNegativePositions()
{
    KvTableGrid grid;
    grid.setCell(-1, 0, QStringLiteral("x"), QColor(), 1);
    grid.setCell(0, -1, QStringLiteral("x"), QColor(), 1);
    QCOMPARE(grid.rowCount(), 0);
    QCOMPARE(grid.columnCount(), 0);
}

void KvTableGridTest::aSpanIsOneAtLeast()
{
    KvTableGrid grid;
    grid.setCell(0, 0, QStringLiteral("x"), QColor(), 0);
    grid.setCell(0, 1, QStringLiteral("y"), QColor(), -4);
    QCOMPARE(grid.cell(0, 0)->columnSpan, 1);
    QCOMPARE(grid.cell(0, 1)->columnSpan, 1);
}

void KvTableGridTest::knowsWhetherCellsSpan()
{
    KvTableGrid grid;
    grid.setCell(0, 0, QStringLiteral("x"), QColor(), 1);
    QVERIFY(!grid.hasSpans());
    grid.setCell(1, 0, QStringLiteral("y"), QColor(), 2);
    QVERIFY(grid.hasSpans());
    QCOMPARE(grid.columnCount(), 1); // columns are counted by where cells stand, not by how far they reach
}

void KvTableGridTest::clearLeavesNothingBehind()
{
    KvTableGrid grid;
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 4; ++column)
            grid.setCell(row, column, QStringLiteral("old"), QColor(Qt::red), 2);
    }
    grid.clear();
    QCOMPARE(grid.rowCount(), 0);
    QCOMPARE(grid.columnCount(), 0);
    QVERIFY(!grid.hasSpans());
    QVERIFY(!grid.cell(0, 0));

    grid.setCell(3, 3, QStringLiteral("new"), QColor(), 1);
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 4; ++column)
            QCOMPARE(grid.cell(row, column) != nullptr, row == 3 && column == 3);
    }
}

void KvTableGridTest::reservingAddsNoCells()
{
    KvTableGrid grid;
    grid.reserve(100, 4);
    QCOMPARE(grid.rowCount(), 0);
    QCOMPARE(grid.columnCount(), 0);
    QVERIFY(!grid.cell(0, 0));
    grid.setCell(0, 1, QStringLiteral("x"), QColor(), 1);
    QCOMPARE(grid.columnCount(), 2);

    grid.reserve(200, 8); // cells that are there stay
    QCOMPARE(grid.cell(0, 1)->text, QStringLiteral("x"));
    QCOMPARE(grid.columnCount(), 2);
}

void KvTableGridTest::holdsManyRows()
{
    KvTableGrid grid;
    QElapsedTimer stopwatch;
    stopwatch.start();
    grid.reserve(100000, 4);
    for (int row = 0; row < 100000; ++row) {
        for (int column = 0; column < 4; ++column)
            grid.setCell(row, column, QString::number(row), QColor(), 1);
    }
    QVERIFY2(stopwatch.elapsed() < 5000, "filling 400 000 cells takes far longer than it should");
    QCOMPARE(grid.rowCount(), 100000);
    QCOMPARE(grid.cell(99999, 3)->text, QStringLiteral("99999"));
}

STATREPORT_TEST_MAIN(KvTableGridTest)
#include "KvTableGridTest.moc"
