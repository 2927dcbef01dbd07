// SPDX-License-Identifier: MIT
#include "KvDeskValueTable.h"

#include "KvDeskActions.h"
#include "KvDeskCellDelegate.h"
#include "KvDeskEmptyState.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskReason.h"
#include "KvDeskSelectionStatistics.h"
#include "KvDeskTableView.h"
#include "KvDeskValueCommands.h"
#include "KvDeskValueDelegate.h"
#include "KvDeskValueSelection.h"
#include "KvDeskValueSortModel.h"
#include "KvDeskValueTableModel.h"

#include <QAction>
#include <QFrame>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLayout>
#include <QLineEdit>
#include <QScopedValueRollback>
#include <QScrollBar>
#include <QVBoxLayout>

#include <numeric>

namespace {

constexpr int minimumColumnWidth = 48;
constexpr int minimumObjectWidth = 72; ///< with its number, which tells it from others
constexpr int largestTextWidth = 200;
constexpr int cellPadding = 8; ///< pixels at both ends of a text
constexpr int largestUnitWidth = 80;
constexpr int rounding = 2;       ///< pixels by which a text may be wider than its whole pixels
constexpr int sampledRows = 1000; ///< whose texts are measured at first, spread over the table
constexpr int smallSpacing = 8;

} // namespace

KvDeskValueTable::KvDeskValueTable(QWidget *parent)
    : KvDeskPanel(tr("Measured values"), tr("Hide the measured values"), parent)
    , m_model(new KvDeskValueTableModel(this))
    , m_sorted(new KvDeskValueSortModel(m_model, this))
{
    createView();
    createFilter();
    createEmptyStates();
    setUpColumns();
    auto *const content = new QFrame(this);
    content->setProperty("panel", true);
    auto *const layout = new QVBoxLayout(content);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    auto *const filterRow = new QHBoxLayout;
    filterRow->setContentsMargins(smallSpacing, 0, smallSpacing, smallSpacing);
    filterRow->addWidget(m_filter);
    layout->addLayout(filterRow);
    layout->addWidget(m_view, 1);
    setContent(content);
    m_filterTimer.setSingleShot(true);
    m_filterTimer.setInterval(filterDelayMs);
    m_measureTimer.setSingleShot(true);
    connectSignals();
    slotRowsReset();
}

KvDeskValueTable::~KvDeskValueTable() = default;

void KvDeskValueTable::createView()
{
    m_view = new KvDeskTableView(this);
    m_view->setAccessibleName(tr("Measured values"));
    m_view->setModel(m_sorted);
    m_view->setCopiesHeadings(true);
    m_view->setItemDelegate(new KvDeskCellDelegate(m_view));
    // Both ends of a name that somebody gave may tell it from others.
    auto *const names = new KvDeskCellDelegate(m_view);
    names->setElideMode(Qt::ElideMiddle);
    m_view->setItemDelegateForColumn(KvDeskValueTableModel::ObjectColumn, names);
    m_delegate = new KvDeskValueDelegate(m_view);
    m_view->setItemDelegateForColumn(KvDeskValueTableModel::ValueColumn, m_delegate);
    m_selection = new KvDeskValueSelection(m_view, m_sorted, m_model, this);
}

void KvDeskValueTable::createFilter()
{
    m_filter = new QLineEdit(this);
    m_filter->setPlaceholderText(tr("Filter by type, object or value name"));
    m_filter->setAccessibleName(tr("Filter of the measured values"));
    // A narrow field cannot show all it says.
    m_filter->setToolTip(
        m_filter->placeholderText() + QLatin1Char('\n') +
        KvDeskActions::withShortcut(tr("Shows only rows that have all of these words"), QKeySequence::Find));
    m_filter->setClearButtonEnabled(true);
    // Files that are dropped on it are for the window.
    m_filter->setAcceptDrops(false);
    m_filter->installEventFilter(this);
    setTabOrder(m_filter, m_view);
}

void KvDeskValueTable::createEmptyStates()
{
    m_emptyState = new KvDeskEmptyState(
        tr("Measured values appear here once something is measured or imported"), m_view->viewport());
    m_noMatchState = new KvDeskEmptyState(tr("No measured value matches the filter"), m_view->viewport());
    auto *const clear = new QAction(tr("Clear the filter"), this);
    connect(clear, SIGNAL(triggered()), this, SLOT(slotClearFilter()));
    m_noMatchState->addAction(clear, false);
}

void KvDeskValueTable::setUpColumns()
{
    QHeaderView *const header = m_view->horizontalHeader();
    header->setMinimumSectionSize(minimumColumnWidth);
    header->setSectionResizeMode(QHeaderView::Interactive);
    header->setSectionResizeMode(KvDeskValueTableModel::ValueColumn, QHeaderView::Stretch);
    m_textWidths.fill(0, KvDeskValueTableModel::ValueColumn);
    m_userWidths = m_textWidths;
    // At first the rows come in the order of types and objects, which no column has.
    header->setSortIndicator(-1, Qt::AscendingOrder);
    m_view->setSortingEnabled(true);
}

void KvDeskValueTable::connectSignals()
{
    connect(m_view->horizontalHeader(), SIGNAL(sectionResized(int,int,int)), this,
                                               SLOT(slotColumnResized(int,int,int)));
    connect(m_view->verticalScrollBar(), SIGNAL(valueChanged(int)), &m_measureTimer, SLOT(start()));
    connect(m_sorted, SIGNAL(modelReset()), this, SLOT(slotRowsReset()));
    connect(m_sorted, SIGNAL(rowsInserted(QModelIndex,int,int)), this, SLOT(slotRowsChanged()));
    connect(m_sorted, SIGNAL(rowsRemoved(QModelIndex,int,int)), this, SLOT(slotRowsChanged()));
    connect(m_sorted, SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)), &m_measureTimer,
                             SLOT(start()));
    connect(m_selection, SIGNAL(signalValuesSelected()), this, SLOT(slotUpdateStatistics()));
    connect(&m_measureTimer, SIGNAL(timeout()), this, SLOT(slotMeasureTexts()));
    connect(&m_filterTimer, SIGNAL(timeout()), this, SLOT(slotApplyFilter()));
    connect(m_filter, SIGNAL(textChanged(QString)), this, SLOT(slotFilterChanged()));
}

void KvDeskValueTable::setEditor(KvDeskObjectEditor *editor)
{
    m_selection->setObjects(editor->selection());
    m_commands = new KvDeskValueCommands(m_view, m_selection, editor, this);
    connect(m_model, SIGNAL(signalRenamed(int,int,QString)), m_commands, SLOT(slotRenamed(int,int,QString)));
}

void KvDeskValueTable::slotFocusFilter()
{
    m_filter->setFocus(Qt::ShortcutFocusReason);
    m_filter->selectAll();
}

void KvDeskValueTable::slotClearFilter()
{
    m_filter->clear();
    slotApplyFilter();
}

void KvDeskValueTable::slotFilterChanged()
{
    m_filterTimer.start();
}

void KvDeskValueTable::slotApplyFilter()
{
    m_filterTimer.stop();
    m_sorted->setFilter(m_filter->text());
}

bool KvDeskValueTable::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_filter && event->type() == QEvent::KeyPress &&
        filterKeyPressed(static_cast<QKeyEvent *>(event)->key()))
        return true;
    return KvDeskPanel::eventFilter(watched, event);
}

// Escape shows everything again, and goes back to the table when it does already.
bool KvDeskValueTable::filterKeyPressed(int key)
{
    switch (key) {
    case Qt::Key_Escape:
        if (m_filter->text().isEmpty())
            m_view->setFocus();
        else
            slotClearFilter();
        return true;
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Down:
        slotApplyFilter();
        m_view->setFocus();
        return true;
    default:
        return false;
    }
}

QString KvDeskValueTable::note() const
{
    const int all = m_model->rowCount();
    if (all == 0)
        return QString();
    if (!m_sorted->isFiltered())
        return QString::number(all);
    //: rows that match the filter, all rows
    return tr("%1 of %2").arg(m_sorted->rowCount()).arg(all);
}

void KvDeskValueTable::updateEmptyStates()
{
    const bool isEmpty = m_model->rowCount() == 0;
    m_emptyState->setVisible(isEmpty);
    m_noMatchState->setVisible(!isEmpty && m_sorted->rowCount() == 0);
    m_view->horizontalHeader()->setVisible(!isEmpty);
    KvDeskReason::setPossible(m_filter, !isEmpty || m_sorted->isFiltered(),
                              tr("There are no measured values yet"));
    header()->setNote(note());
}

void KvDeskValueTable::slotRowsReset()
{
    m_numberWidth = 0;
    m_unitWidth = 0;
    // Columns do not jump while a filter is typed.
    if (!m_sorted->isFiltered())
        m_textWidths.fill(0);
    const int step = qMax(1, m_sorted->rowCount() / sampledRows);
    for (int row = 0; row < m_sorted->rowCount(); row += step)
        measureRow(row);
    slotRowsChanged();
}

void KvDeskValueTable::slotRowsChanged()
{
    updateEmptyStates();
    slotMeasureTexts();
    m_selection->slotRowsChanged();
}

void KvDeskValueTable::measureRow(int row)
{
    const QFontMetrics metrics(m_view->font());
    const QString text = m_model->text(m_sorted->sourceRow(row), KvDeskValueTableModel::ValueColumn);
    m_numberWidth =
        qMax(m_numberWidth, metrics.horizontalAdvance(KvDeskValueTableModel::numberOf(text)) + rounding);
    const QString unit = KvDeskValueTableModel::unitOf(text);
    if (!unit.isEmpty())
        m_unitWidth = qMax(m_unitWidth, metrics.horizontalAdvance(unit) + rounding);
    for (int column = 0; column < m_textWidths.size(); ++column) {
        const QString cell = m_model->text(m_sorted->sourceRow(row), column);
        m_textWidths[column] = qMax(m_textWidths.at(column), metrics.horizontalAdvance(cell) + rounding);
    }
}

// The texts of all rows would take long to make: those that are seen decide.
void KvDeskValueTable::slotMeasureTexts()
{
    if (m_sorted->rowCount() > 0) {
        const int bottom = m_view->rowAt(m_view->viewport()->height() - 1);
        const int last = bottom < 0 ? m_sorted->rowCount() - 1 : bottom;
        for (int row = qMax(0, m_view->rowAt(0)); row <= qMin(last, m_view->rowAt(0) + sampledRows); ++row)
            measureRow(row);
    }
    m_delegate->setUnitWidth(qMin(m_unitWidth, largestUnitWidth));
    m_valueWidth = m_delegate->widthFor(m_numberWidth);
    makeRoomForValues();
}

// A number that is cut short would be read as another one: rather the texts before it are shortened, and
// their headings last.
void KvDeskValueTable::makeRoomForValues()
{
    const int room = m_view->viewport()->width() - m_valueWidth;
    QVector<int> widths;
    QVector<int> least;
    for (int column = 0; column < m_textWidths.size(); ++column) {
        widths.append(wantedWidth(column));
        const int number = column == KvDeskValueTableModel::ObjectColumn ? minimumObjectWidth : 0;
        least.append(qMin(qMax(headingWidth(column), number), widths.last()));
    }
    const int wanted = std::accumulate(widths.begin(), widths.end(), 0);
    if (std::accumulate(least.begin(), least.end(), 0) > room) {
        least.fill(minimumColumnWidth);
        least[KvDeskValueTableModel::ObjectColumn] = minimumObjectWidth;
    }
    if (std::accumulate(least.begin(), least.end(), 0) > room)
        least.fill(minimumColumnWidth);
    const int spare = room - std::accumulate(least.begin(), least.end(), 0);
    const int wish = wanted - std::accumulate(least.begin(), least.end(), 0);
    const QScopedValueRollback<bool> fitting(m_isFitting, true);
    for (int column = 0; column < m_textWidths.size(); ++column) {
        const int width = widths.at(column);
        const int shortened =
            least.at(column) + (wish > 0 ? qMax(0, width - least.at(column)) * qMax(0, spare) / wish : 0);
        m_view->setColumnWidth(column, wanted <= room ? width : shortened);
    }
}

int KvDeskValueTable::wantedWidth(int column) const
{
    if (m_userWidths.at(column) > 0)
        return m_userWidths.at(column);
    return qMax(headingWidth(column), qMin(m_textWidths.at(column), largestTextWidth) + 2 * cellPadding);
}

int KvDeskValueTable::headingWidth(int column) const
{
    return qMax(minimumColumnWidth, m_view->horizontalHeader()->sectionSizeHint(column));
}

void KvDeskValueTable::slotColumnResized(int aColumn, int aOldWidth, int aNewWidth)
{
    Q_UNUSED(aOldWidth)
    if (!m_isFitting && aColumn < m_textWidths.size())
        m_userWidths[aColumn] = aNewWidth;
}

void KvDeskValueTable::slotUpdateStatistics()
{
    const KvDeskSelectionStatistics statistics = m_selection->statistics();
    emit signalStatisticsChanged(statistics.text(), statistics.details());
}

void KvDeskValueTable::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    // Of the layout's, not the one before it.
    layout()->activate();
    makeRoomForValues();
    m_measureTimer.start();
}
