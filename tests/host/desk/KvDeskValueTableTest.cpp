// SPDX-License-Identifier: MIT
#include "KvDeskValueTable.h"

#include "DeskValues.h"
#include "KvDeskEmptyState.h"
#include "KvDeskPanelHeader.h"

#include <QHeaderView>
#include <QLineEdit>
#include <QScrollBar>

class KvDeskValueTableTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void emptyState();
    void countIsShown();
    void copiesTheSelection();
    void filtersWhileTyping();
    void filterWithoutMatch();
    void filterByKeys();
    void filterNeedsValues();
    void longNumbersBelowAreNotCut();
    void sortsByHeader();
    void numbersAreNeverCut();
    void columnsKeepTheirWidths();
    void columnsFollowTheirTexts();

private:
    void open() { QVERIFY(m_values->openDemo()); }

    std::unique_ptr<DeskValues> m_values;
    KvDeskValueTable *m_table = nullptr;
};

void KvDeskValueTableTest::init()
{
    StatReportTest::init();
    m_values = std::make_unique<DeskValues>();
    m_table = &m_values->table;
}

void KvDeskValueTableTest::cleanup()
{
    m_values.reset();
    StatReportTest::cleanup();
}

void KvDeskValueTableTest::emptyState()
{
    const auto *const state = m_table->findChild<KvDeskEmptyState *>();
    QVERIFY(state->isVisible());
    QVERIFY(!m_table->view()->horizontalHeader()->isVisible());
    open();
    QVERIFY(!state->isVisible());
    QVERIFY(m_table->view()->horizontalHeader()->isVisible());
    m_values->document.clear();
    m_table->model()->flush();
    QVERIFY(state->isVisible());
}

void KvDeskValueTableTest::countIsShown()
{
    QCOMPARE(m_table->header()->note(), QString());
    open();
    QCOMPARE(m_table->header()->note(), QStringLiteral("65"));
}

void KvDeskValueTableTest::copiesTheSelection()
{
    open();
    m_table->view()->selectRow(0);
    m_table->view()->slotCopy();
    QCOMPARE(QGuiApplication::clipboard()->text(),
             QStringLiteral("Type\tObject\tValue name\tValue\nRectangle\tRectangle 1\tWidth\t1.072 mm\n"));
}

void KvDeskValueTableTest::sortsByHeader()
{
    open();
    const QAbstractItemModel *const shown = m_table->view()->model();
    QCOMPARE(shown->index(0, 0).data().toString(), QStringLiteral("Rectangle"));
    m_table->view()->sortByColumn(KvDeskValueTableModel::TypeColumn, Qt::AscendingOrder);
    QCOMPARE(shown->index(0, 0).data().toString(), QStringLiteral("Arc"));
}

void KvDeskValueTableTest::numbersAreNeverCut()
{
    open();
    const QFontMetrics metrics(m_table->view()->font());
    const int needed = metrics.horizontalAdvance(QStringLiteral("519616.6")) +
                       metrics.horizontalAdvance(QStringLiteral("μm²"));
    for (const int width : {416, 330}) {
        m_table->resize(width, 500);
        QTRY_VERIFY(m_table->view()->columnWidth(KvDeskValueTableModel::ValueColumn) >= needed + 20);
        QTRY_COMPARE(m_table->view()->horizontalScrollBar()->maximum(), 0);
    }
}

void KvDeskValueTableTest::columnsKeepTheirWidths()
{
    open();
    m_table->view()->setColumnWidth(0, 120);
    m_table->resize(260, 500);
    QTRY_VERIFY(m_table->view()->columnWidth(0) < 120);
    m_table->resize(700, 500);
    QTRY_COMPARE(m_table->view()->columnWidth(0), 120);
}

// Of a long name at least as much is seen as of a short one before.
void KvDeskValueTableTest::columnsFollowTheirTexts()
{
    open();
    m_table->resize(900, 500);
    const int column = KvDeskValueTableModel::ObjectColumn;
    const QFontMetrics metrics(m_table->view()->font());
    const QString name = QStringLiteral("Rectangle of the third sample 1");
    QTRY_VERIFY(m_table->view()->columnWidth(column) < metrics.horizontalAdvance(name));
    m_values->editor.rename({ZtDrawnType::Rectangle, 1}, name);
    m_table->model()->flush();
    QTRY_VERIFY(m_table->view()->columnWidth(column) > metrics.horizontalAdvance(name));
    // The user's own width stays.
    m_table->view()->setColumnWidth(column, 90);
    m_values->editor.rename({ZtDrawnType::Rectangle, 2}, name + name);
    m_table->model()->flush();
    QCoreApplication::processEvents();
    QCOMPARE(m_table->view()->columnWidth(column), 90);
    // In a narrow table, too, the number of an object is seen.
    m_table->resize(330, 500);
    QTRY_VERIFY(m_table->view()->columnWidth(column) >= 72);
}

void KvDeskValueTableTest::filtersWhileTyping()
{
    open();
    const QAbstractItemModel *const shown = m_table->view()->model();
    QSignalSpy resets(shown, SIGNAL(modelReset()));
    QTest::keyClicks(m_table->filterField(), QStringLiteral("circle"));
    // Not at every key.
    QCOMPARE(shown->rowCount(), 65);
    QVERIFY(resets.wait(5000));
    QCOMPARE(resets.count(), 1);
    QCOMPARE(shown->rowCount(), 30);
    QCOMPARE(m_table->header()->note(), QStringLiteral("30 of 65"));
    m_table->slotClearFilter();
    QCOMPARE(shown->rowCount(), 65);
    QCOMPARE(m_table->header()->note(), QStringLiteral("65"));
}

void KvDeskValueTableTest::filterWithoutMatch()
{
    open();
    m_table->filterField()->setText(QStringLiteral("no such thing"));
    QTest::keyClick(m_table->filterField(), Qt::Key_Return);
    QCOMPARE(m_table->view()->model()->rowCount(), 0);
    const QList<KvDeskEmptyState *> states = m_table->findChildren<KvDeskEmptyState *>();
    QCOMPARE(states.size(), 2);
    QVERIFY(!states.at(0)->isVisible());
    QVERIFY(states.at(1)->isVisible());
    QCOMPARE(states.at(1)->findChild<QLabel *>()->text(),
             QStringLiteral("No measured value matches the filter"));
    QVERIFY(m_table->view()->horizontalHeader()->isVisible());
    QTest::mouseClick(states.at(1)->findChild<QPushButton *>(), Qt::LeftButton);
    QCOMPARE(m_table->filterField()->text(), QString());
    QCOMPARE(m_table->view()->model()->rowCount(), 65);
    QVERIFY(!states.at(1)->isVisible());
}

void KvDeskValueTableTest::filterByKeys()
{
    open();
    m_table->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_table));
    QLineEdit *const field = m_table->filterField();
    QVERIFY(field->isClearButtonEnabled());
    m_table->slotFocusFilter();
    QVERIFY(field->hasFocus());
    QTest::keyClicks(field, QStringLiteral("arc"));
    QTest::keyClick(field, Qt::Key_Down);
    QVERIFY(m_table->view()->hasFocus());
    QCOMPARE(m_table->view()->model()->rowCount(), 4);
    m_table->slotFocusFilter();
    QTest::keyClick(field, Qt::Key_Escape);
    QVERIFY(field->hasFocus());
    QCOMPARE(m_table->view()->model()->rowCount(), 65);
    QTest::keyClick(field, Qt::Key_Escape);
    QVERIFY(m_table->view()->hasFocus());
}

void KvDeskValueTableTest::filterNeedsValues()
{
    QVERIFY(!m_table->filterField()->isEnabled());
    open();
    QVERIFY(m_table->filterField()->isEnabled());
    m_table->filterField()->setText(QStringLiteral("circle"));
    QTest::keyClick(m_table->filterField(), Qt::Key_Return);
    m_values->document.clear();
    m_table->model()->flush();
    // The filter that is still there can be taken back.
    QVERIFY(m_table->filterField()->isEnabled());
}

// The table measures what it shows; the rest comes when it is scrolled to.
void KvDeskValueTableTest::longNumbersBelowAreNotCut()
{
    QByteArray text("Object,Mass [g]\n");
    for (int i = 0; i < 3000; ++i)
        text += "Bolt " + QByteArray::number(i) + (i == 2998 ? ",12345678901234\n" : ",5\n");
    ZtFault fault;
    QVERIFY(m_values->document.importTable(DeskFiles::text(QStringLiteral("long.csv"), text),
                                           ZtTableImportOptions(), &fault));
    m_table->model()->flush();
    const QFontMetrics metrics(m_table->view()->font());
    const int needed = metrics.horizontalAdvance(QStringLiteral("12345678901234 g"));
    m_table->resize(300, 500);
    m_table->view()->scrollToBottom();
    QTRY_VERIFY(m_table->view()->columnWidth(KvDeskValueTableModel::ValueColumn) >= needed + 16);
}

STATREPORT_TEST_MAIN(KvDeskValueTableTest)
#include "KvDeskValueTableTest.moc"
