// SPDX-License-Identifier: MIT
#include "KvDeskValueTable.h"

#include "DeskFiles.h"
#include "KvDeskEmptyState.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskResources.h"
#include "KvDeskTableView.h"
#include "KvDeskValueTableModel.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

class KvDeskValueTableTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void emptyState();
    void countIsShown();
    void selectingARowEmits();
    void selectingAnObjectSelectsItsRows();
    void selectionSurvivesNewObjects();
    void selectionOfARemovedObjectIsGone();
    void copiesTheSelection();
    void sortsByHeader();
    void numbersAreNeverCut();
    void columnsKeepTheirWidths();

private:
    void open();
    QStringList selectedRows() const
    {
        return m_table->view()->selectedText().split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    }

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskValueTable> m_table;
};

void KvDeskValueTableTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_table = std::make_unique<KvDeskValueTable>();
    m_table->resize(416, 500);
    m_table->show();
}

void KvDeskValueTableTest::cleanup()
{
    m_table.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskValueTableTest::open()
{
    ZtFault fault;
    QVERIFY(m_document->loadSession(DeskFiles::demoSession(), &fault));
    m_table->model()->flush();
}

void KvDeskValueTableTest::emptyState()
{
    const auto *const state = m_table->findChild<KvDeskEmptyState *>();
    QVERIFY(state->isVisible());
    QVERIFY(!m_table->view()->horizontalHeader()->isVisible());
    open();
    QVERIFY(!state->isVisible());
    QVERIFY(m_table->view()->horizontalHeader()->isVisible());
    m_document->clear();
    m_table->model()->flush();
    QVERIFY(state->isVisible());
}

void KvDeskValueTableTest::countIsShown()
{
    QCOMPARE(m_table->header()->note(), QString());
    open();
    QCOMPARE(m_table->header()->note(), QStringLiteral("65"));
}

void KvDeskValueTableTest::selectingARowEmits()
{
    open();
    QSignalSpy spy(m_table.get(), SIGNAL(signalObjectSelected(int,int)));
    m_table->view()->selectRow(19); // the second line
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.first(), QList<QVariant>({static_cast<int>(ZtDrawnType::Line), 2}));
    m_table->view()->clearSelection();
    QCOMPARE(spy.count(), 2);
    QCOMPARE(spy.last(), QList<QVariant>({0, 0}));
}

void KvDeskValueTableTest::selectingAnObjectSelectsItsRows()
{
    open();
    QSignalSpy spy(m_table.get(), SIGNAL(signalObjectSelected(int,int)));
    m_table->slotSelectObject(ZtDrawnType::Circle, 15);
    QCOMPARE(selectedRows().size(), 2);
    QVERIFY(selectedRows().first().startsWith(QStringLiteral("Circle\tCircle 15\tDiameter\t")));
    const QModelIndex current = m_table->view()->currentIndex();
    QVERIFY(m_table->view()->viewport()->rect().intersects(m_table->view()->visualRect(current)));
    m_table->slotSelectObject(0, 0);
    QCOMPARE(selectedRows(), QStringList());
    QCOMPARE(spy.count(), 0);
}

void KvDeskValueTableTest::selectionSurvivesNewObjects()
{
    open();
    m_table->slotSelectObject(ZtDrawnType::Line, 2);
    const int scrolled = m_table->view()->verticalScrollBar()->value();
    QSignalSpy spy(m_table.get(), SIGNAL(signalObjectSelected(int,int)));
    m_document->addObject(ZtDrawnType::Rectangle, polygon({QPointF(0, 0), QPointF(5, 5)}));
    m_table->model()->flush();
    QCOMPARE(m_table->model()->rowCount(), 68);
    QCOMPARE(selectedRows().size(), 1);
    QVERIFY(selectedRows().first().startsWith(QStringLiteral("Line\tLine 2\t")));
    QCOMPARE(m_table->view()->verticalScrollBar()->value(), scrolled);
    QCOMPARE(spy.count(), 0);
}

void KvDeskValueTableTest::selectionOfARemovedObjectIsGone()
{
    open();
    m_table->slotSelectObject(ZtDrawnType::Line, 2);
    QSignalSpy spy(m_table.get(), SIGNAL(signalObjectSelected(int,int)));
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 2);
    m_table->model()->flush();
    QCOMPARE(selectedRows(), QStringList());
    QVERIFY(m_table->selectedObject().isNull());
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.last(), QList<QVariant>({0, 0}));
}

void KvDeskValueTableTest::copiesTheSelection()
{
    open();
    m_table->view()->selectRow(0);
    m_table->view()->slotCopy();
    QCOMPARE(QGuiApplication::clipboard()->text(),
             QStringLiteral("Rectangle\tRectangle 1\tWidth\t1.072 mm\n"));
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

STATREPORT_TEST_MAIN(KvDeskValueTableTest)
#include "KvDeskValueTableTest.moc"
