// SPDX-License-Identifier: MIT
#include "KvDeskValueSelection.h"

#include "DeskValues.h"
#include "KvDeskSelectionStatistics.h"
#include "kernel/ZtGsManipulator.h"

#include <QLineEdit>
#include <QScrollBar>

namespace {

const KvDeskObjectId line2{ZtDrawnType::Line, 2};
const KvDeskObjectId rectangle1{ZtDrawnType::Rectangle, 1};
const KvDeskObjectId circle15{ZtDrawnType::Circle, 15};

} // namespace

class KvDeskValueSelectionTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void clickedRowSelectsItsObject();
    void severalRowsSelectTheirObjects();
    void allRowsSelectAllObjects();
    void selectedObjectSelectsItsRows();
    void severalObjectsSelectTheirRows();
    void selectionSurvivesNewObjects();
    void selectionSurvivesAReset();
    void selectionOfARemovedObjectIsGone();
    void selectedRowsSurviveTheFilter();
    void selectedRowsSurviveSorting();
    void newObjectIsSelectedOnceItIsThere();
    void selectionStaysAmongManyObjects();
    void statisticsOfObjects();
    void statisticsOfRows();
    void statisticsLeaveOutFilteredRows();
    void statisticsFollowChanges();
    void hiddenValuesAreLeftOut();

private:
    std::unique_ptr<DeskValues> m_values;
};

void KvDeskValueSelectionTest::init()
{
    StatReportTest::init();
    m_values = std::make_unique<DeskValues>();
    QVERIFY(m_values->openDemo());
}

void KvDeskValueSelectionTest::cleanup()
{
    m_values.reset();
    StatReportTest::cleanup();
}

void KvDeskValueSelectionTest::clickedRowSelectsItsObject()
{
    const QSignalSpy spy(&m_values->selection, SIGNAL(signalSelectionChanged()));
    KvDeskTableView *const view = m_values->table.view();
    const QPoint place = view->visualRect(view->model()->index(1, 1)).center();
    QTest::mouseClick(view->viewport(), Qt::LeftButton, {}, place);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(m_values->selection.objects(), QSet<KvDeskObjectId>({rectangle1}));
    // Not the other values of the rectangle: this one alone may be looked at.
    QCOMPARE(m_values->selectedRows().size(), 1);
    view->clearSelection();
    QVERIFY(m_values->selection.isEmpty());
}

void KvDeskValueSelectionTest::severalRowsSelectTheirObjects()
{
    KvDeskTableView *const view = m_values->table.view();
    const auto click = [view](int row) {
        const QModelIndex index = view->model()->index(row, 1);
        view->scrollTo(index);
        QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::ControlModifier,
                          view->visualRect(index).center());
    };
    click(0);
    click(19); // the second line
    QCOMPARE(m_values->selection.objects(), QSet<KvDeskObjectId>({rectangle1, line2}));
    QCOMPARE(m_values->selection.current(), line2);
    click(0);
    QCOMPARE(m_values->selection.objects(), QSet<KvDeskObjectId>({line2}));
}

void KvDeskValueSelectionTest::allRowsSelectAllObjects()
{
    m_values->table.view()->setFocus();
    QTest::keyClick(m_values->table.view(), Qt::Key_A, Qt::ControlModifier);
    QCOMPARE(m_values->selection.objects().size(), 6 + 4 + 2 + 1 + 1 + 2 + 2 + 15);
    QCOMPARE(m_values->table.selection()->values().size(), 65);
}

void KvDeskValueSelectionTest::selectedObjectSelectsItsRows()
{
    KvDeskTableView *const view = m_values->table.view();
    m_values->selection.select(circle15);
    QCOMPARE(m_values->selectedRows().size(), 2);
    QVERIFY(m_values->selectedRows().first().startsWith(QStringLiteral("Circle\tCircle 15\tDiameter\t")));
    QVERIFY(view->viewport()->rect().intersects(view->visualRect(view->currentIndex())));
    m_values->selection.clear();
    QCOMPARE(m_values->selectedRows(), QStringList());
}

void KvDeskValueSelectionTest::severalObjectsSelectTheirRows()
{
    m_values->selection.set({circle15, rectangle1}, rectangle1);
    QCOMPARE(m_values->selectedRows().size(), 5);
    QCOMPARE(m_values->table.view()->currentIndex().row(), 0);
    QCOMPARE(m_values->selection.objects().size(), 2);
}

void KvDeskValueSelectionTest::selectionSurvivesNewObjects()
{
    m_values->selection.select(line2);
    const int scrolled = m_values->table.view()->verticalScrollBar()->value();
    const QSignalSpy spy(&m_values->selection, SIGNAL(signalSelectionChanged()));
    m_values->add(ZtDrawnType::Rectangle);
    QCOMPARE(m_values->table.model()->rowCount(), 68);
    QCOMPARE(m_values->selectedRows().size(), 1);
    QVERIFY(m_values->selectedRows().first().startsWith(QStringLiteral("Line\tLine 2\t")));
    QCOMPARE(m_values->table.view()->verticalScrollBar()->value(), scrolled);
    QCOMPARE(spy.count(), 0);
}

void KvDeskValueSelectionTest::selectionSurvivesAReset()
{
    m_values->table.view()->selectRow(0);
    const QSignalSpy resets(m_values->table.model(), SIGNAL(modelReset()));
    for (int i = 0; i < 2 * KvDeskValueTableModel::maximumMoves; ++i)
        m_values->document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(5, 5)}));
    m_values->table.model()->flush();
    QCOMPARE(resets.count(), 1);
    QCOMPARE(m_values->selectedRows(),
             QStringList(QStringLiteral("Rectangle\tRectangle 1\tWidth\t1.072 mm")));
    QCOMPARE(m_values->selection.objects(), QSet<KvDeskObjectId>({rectangle1}));
}

void KvDeskValueSelectionTest::selectionOfARemovedObjectIsGone()
{
    m_values->selection.select(line2);
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 2);
    m_values->table.model()->flush();
    QCOMPARE(m_values->selectedRows(), QStringList());
    QVERIFY(m_values->selection.isEmpty());
    QVERIFY(m_values->table.selection()->values().isEmpty());
}

void KvDeskValueSelectionTest::selectedRowsSurviveTheFilter()
{
    m_values->table.view()->selectRow(1);
    const QStringList selected = m_values->selectedRows();
    m_values->table.filterField()->setText(QStringLiteral("circle"));
    QTest::keyClick(m_values->table.filterField(), Qt::Key_Return);
    QCOMPARE(m_values->selectedRows(), QStringList());
    QCOMPARE(m_values->selection.objects(), QSet<KvDeskObjectId>({rectangle1}));
    m_values->table.slotClearFilter();
    QCOMPARE(m_values->selectedRows(), selected);
}

void KvDeskValueSelectionTest::selectedRowsSurviveSorting()
{
    m_values->selection.select(rectangle1);
    QStringList selected = m_values->selectedRows();
    m_values->table.view()->sortByColumn(KvDeskValueTableModel::ValueColumn, Qt::DescendingOrder);
    QStringList sorted = m_values->selectedRows();
    QVERIFY(sorted != selected);
    sorted.sort();
    selected.sort();
    QCOMPARE(sorted, selected);
    QCOMPARE(m_values->selection.objects(), QSet<KvDeskObjectId>({rectangle1}));
}

void KvDeskValueSelectionTest::newObjectIsSelectedOnceItIsThere()
{
    KvDeskTableView *const view = m_values->table.view();
    const KvDeskObjectId object =
        m_values->editor.create(ZtDrawnType::Circle, polygon({QPointF(0, 0), QPointF(5, 5)}));
    QCOMPARE(m_values->selectedRows(), QStringList());
    m_values->table.model()->flush();
    QCOMPARE(m_values->selectedRows().size(), 2);
    QVERIFY(view->viewport()->rect().intersects(view->visualRect(view->currentIndex())));
    QCOMPARE(m_values->selection.current(), object);
}

// Half of the rows, no two of them next to each other.
void KvDeskValueSelectionTest::selectionStaysAmongManyObjects()
{
    m_values->document.clear();
    for (int i = 0; i < 2000; ++i)
        m_values->document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(5, i)}));
    m_values->table.model()->flush();
    QSet<KvDeskObjectId> objects;
    for (int id = 1; id < 2000; id += 2)
        objects.insert({ZtDrawnType::Line, id});
    m_values->selection.set(objects, {ZtDrawnType::Line, 1});
    QCOMPARE(m_values->selectedRows().size(), 1000);
    m_values->selection.set({{ZtDrawnType::Line, 2}, {ZtDrawnType::Line, 4}}, {ZtDrawnType::Line, 2});
    QCOMPARE(m_values->selectedRows().size(), 2);
    QCOMPARE(m_values->selection.objects().size(), 2);
}

void KvDeskValueSelectionTest::statisticsOfObjects()
{
    QSignalSpy spy(&m_values->table, SIGNAL(signalStatisticsChanged(QString,QString)));
    m_values->selection.set({{ZtDrawnType::Circle, 1}, {ZtDrawnType::Circle, 2}}, {ZtDrawnType::Circle, 1});
    const KvDeskSelectionStatistics statistics = m_values->table.selection()->statistics();
    QVERIFY(statistics.isMixed());
    QCOMPARE(statistics.count(), 4);
    QCOMPARE(statistics.numbers().count(), 2);
    QVERIFY(!spy.isEmpty());
    QVERIFY(
        spy.last().at(0).toString().startsWith(QStringLiteral("Selected values: 4; Diameter: n = 2, mean ")));
    QCOMPARE(spy.last().at(1).toString(), statistics.details());
    m_values->selection.clear();
    QCOMPARE(spy.last().at(0).toString(), QString());
}

void KvDeskValueSelectionTest::statisticsOfRows()
{
    m_values->table.filterField()->setText(QStringLiteral("circle area"));
    QTest::keyClick(m_values->table.filterField(), Qt::Key_Return);
    m_values->table.view()->selectAll();
    const KvDeskSelectionStatistics statistics = m_values->table.selection()->statistics();
    QVERIFY(!statistics.isMixed());
    QCOMPARE(statistics.numbers().count(), 15);
    QCOMPARE(m_values->selection.objects().size(), 15);
}

// Objects are selected with all of their values; those that the filter hides do not count until it shows
// them.
void KvDeskValueSelectionTest::statisticsLeaveOutFilteredRows()
{
    const auto filter = [this](const QString &text) {
        m_values->table.filterField()->setText(text);
        QTest::keyClick(m_values->table.filterField(), Qt::Key_Return);
    };
    QSignalSpy spy(&m_values->table, SIGNAL(signalStatisticsChanged(QString,QString)));
    m_values->selection.set({{ZtDrawnType::Circle, 1}, {ZtDrawnType::Circle, 2}, rectangle1}, rectangle1);
    QCOMPARE(m_values->table.selection()->statistics().count(), 7);
    filter(QStringLiteral("circle area"));
    QCOMPARE(m_values->table.selection()->statistics().count(), 2);
    QVERIFY(spy.last().first().toString().startsWith(QStringLiteral("n = 2, mean ")));
    filter(QStringLiteral("line"));
    QCOMPARE(spy.last().first().toString(), QString());
    filter(QString());
    QVERIFY(spy.last().first().toString().startsWith(QStringLiteral("Selected values: 7; ")));
}

void KvDeskValueSelectionTest::statisticsFollowChanges()
{
    m_values->document.clear();
    const KvDeskObjectId line = m_values->add(ZtDrawnType::Line);
    m_values->selection.select(line);
    QSignalSpy spy(&m_values->table, SIGNAL(signalStatisticsChanged(QString,QString)));
    m_values->editor.setPoints(line, polygon({QPointF(0, 0), QPointF(6, 8)}));
    m_values->table.model()->flush();
    QVERIFY(!spy.isEmpty());
    QCOMPARE(spy.last().first().toString(), QStringLiteral("10.000 px"));
}

void KvDeskValueSelectionTest::hiddenValuesAreLeftOut()
{
    m_values->selection.select(rectangle1);
    m_values->editor.setValueShown(rectangle1, 1, false);
    m_values->table.model()->flush();
    QCOMPARE(m_values->selectedRows().size(), 2);
    QCOMPARE(m_values->table.selection()->statistics().count(), 2);
}

STATREPORT_TEST_MAIN(KvDeskValueSelectionTest)
#include "KvDeskValueSelectionTest.moc"
