// SPDX-License-Identifier: MIT
#include "KvDeskValueTable.h"

#include "KvDeskEmptyState.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskTableView.h"
#include "KvDeskValueDelegate.h"
#include "KvDeskValueSortModel.h"
#include "KvDeskValueTableModel.h"

#include <QHeaderView>
#include <QLayout>
#include <QScopedValueRollback>

#include <numeric>

namespace {

constexpr int minimumColumnWidth = 48;
constexpr int largestUnitWidth = 80;
constexpr int rounding = 2; ///< pixels by which a text may be wider than its whole pixels

} // namespace

KvDeskValueTable::KvDeskValueTable(QWidget *parent)
    : KvDeskPanel(tr("Measured values"), tr("Hide the measured values"), parent)
    , m_model(new KvDeskValueTableModel(this))
    , m_sorted(new KvDeskValueSortModel(m_model, this))
{
    createView();
    setUpColumns();
    setContent(m_view);
    connectSignals();
    slotRowsChanged();
}

void KvDeskValueTable::createView()
{
    m_view = new KvDeskTableView(this);
    m_view->setAccessibleName(tr("Measured values"));
    m_view->setModel(m_sorted);
    m_delegate = new KvDeskValueDelegate(m_view);
    m_view->setItemDelegateForColumn(KvDeskValueTableModel::ValueColumn, m_delegate);
    m_emptyState = new KvDeskEmptyState(
        tr("Measured values appear here once a session is opened or a table is imported"),
        m_view->viewport());
}

void KvDeskValueTable::setUpColumns()
{
    QHeaderView *const header = m_view->horizontalHeader();
    header->setMinimumSectionSize(minimumColumnWidth);
    header->setSectionResizeMode(QHeaderView::Interactive);
    header->setSectionResizeMode(KvDeskValueTableModel::ValueColumn, QHeaderView::Stretch);
    m_textWidths = {96, 104, 88};
    // At first the rows come in the order of types and objects, which no column has.
    header->setSortIndicator(-1, Qt::AscendingOrder);
    m_view->setSortingEnabled(true);
}

void KvDeskValueTable::connectSignals()
{
    connect(m_view->selectionModel(), SIGNAL(selectionChanged(QItemSelection,QItemSelection)), this,
                                             SLOT(slotSelectionChanged(QItemSelection,QItemSelection)));
    connect(m_view->horizontalHeader(), SIGNAL(sectionResized(int,int,int)), this,
                                               SLOT(slotColumnResized(int,int,int)));
    connect(m_sorted, SIGNAL(modelReset()), this, SLOT(slotRowsChanged()));
    connect(m_sorted, SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)), this,
                             SLOT(slotRowsChanged()));
}

KvDeskObjectId KvDeskValueTable::objectAt(const QModelIndex &index) const
{
    return index.isValid() ? m_model->row(m_sorted->mapToSource(index).row()).object : KvDeskObjectId();
}

void KvDeskValueTable::slotSelectionChanged(const QItemSelection &aSelected,
                                            const QItemSelection &aDeselected)
{
    Q_UNUSED(aSelected)
    Q_UNUSED(aDeselected)
    if (m_isSelecting)
        return;
    const bool hasSelection = m_view->selectionModel()->hasSelection();
    const KvDeskObjectId object = hasSelection ? objectAt(m_view->currentIndex()) : KvDeskObjectId();
    if (object == m_selected)
        return;
    m_selected = object;
    emit signalObjectSelected(object.type, object.id);
}

void KvDeskValueTable::slotSelectObject(int aType, int aId)
{
    m_selected = {aType, aId};
    selectRows();
    const QModelIndexList rows = m_view->selectionModel()->selectedRows();
    if (rows.isEmpty())
        return;
    // All of them if they fit, the first in any case.
    m_view->scrollTo(rows.last());
    m_view->scrollTo(rows.first());
}

void KvDeskValueTable::selectRows()
{
    const QScopedValueRollback<bool> selecting(m_isSelecting, true);
    QItemSelection selection;
    const QVector<int> rows = m_selected.isNull() ? QVector<int>() : m_model->rowsOf(m_selected);
    for (const int row : rows) {
        const QModelIndex index = m_sorted->mapFromSource(m_model->index(row, 0));
        selection.select(index, index);
    }
    QItemSelectionModel *const model = m_view->selectionModel();
    model->select(selection, QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    // The table stays where the user looks.
    m_view->setAutoScroll(false);
    if (!rows.isEmpty())
        model->setCurrentIndex(selection.first().topLeft(), QItemSelectionModel::NoUpdate);
    m_view->setAutoScroll(true);
}

void KvDeskValueTable::slotRowsChanged()
{
    const int count = m_model->rowCount();
    m_emptyState->setVisible(count == 0);
    m_view->horizontalHeader()->setVisible(count > 0);
    header()->setNote(count > 0 ? QString::number(count) : QString());
    updateUnitWidth();
    if (m_selected.isNull())
        return;
    const bool isThere = !m_model->rowsOf(m_selected).isEmpty();
    if (isThere && !m_view->selectionModel()->hasSelection()) {
        selectRows();
    } else if (!isThere) {
        m_selected = KvDeskObjectId();
        emit signalObjectSelected(0, 0);
    }
}

void KvDeskValueTable::updateUnitWidth()
{
    const QFontMetrics metrics(m_view->font());
    int width = 0;
    for (const QString &unit : m_model->units())
        width = qMax(width, metrics.horizontalAdvance(unit) + rounding);
    m_delegate->setUnitWidth(qMin(width, largestUnitWidth));
    m_valueWidth = m_delegate->widthFor(metrics.horizontalAdvance(m_model->longestNumber()) + rounding);
    makeRoomForValues();
}

// A number that is cut short would be read as another one: rather the texts before it are shortened.
void KvDeskValueTable::makeRoomForValues()
{
    const int room = m_view->viewport()->width() - m_valueWidth;
    const int wanted = std::accumulate(m_textWidths.begin(), m_textWidths.end(), 0);
    const QScopedValueRollback<bool> fitting(m_isFitting, true);
    for (int column = 0; column < m_textWidths.size(); ++column) {
        const int width = m_textWidths.at(column);
        m_view->setColumnWidth(column,
                               wanted <= room ? width : qMax(minimumColumnWidth, width * room / wanted));
    }
}

void KvDeskValueTable::slotColumnResized(int aColumn, int aOldWidth, int aNewWidth)
{
    Q_UNUSED(aOldWidth)
    if (!m_isFitting && aColumn < m_textWidths.size())
        m_textWidths[aColumn] = aNewWidth;
}

void KvDeskValueTable::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    // Of the layout's, not the one before it.
    layout()->activate();
    makeRoomForValues();
}
