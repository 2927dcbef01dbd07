// SPDX-License-Identifier: MIT
#include "KvDeskValueSelection.h"

#include "KvDeskSelection.h"
#include "KvDeskSelectionStatistics.h"
#include "KvDeskTableView.h"
#include "KvDeskValueSortModel.h"
#include "KvDeskValueTableModel.h"
#include "kernel/ZtGsManipulator.h"

#include <QScopedValueRollback>

#include <algorithm>

KvDeskValueSelection::KvDeskValueSelection(KvDeskTableView *view, KvDeskValueSortModel *sorted,
                                           KvDeskValueTableModel *model, QObject *parent)
    : QObject(parent)
    , m_view(view)
    , m_sorted(sorted)
    , m_model(model)
{
    connect(m_view->selectionModel(), SIGNAL(selectionChanged(QItemSelection,QItemSelection)), this,
                                             SLOT(slotRowsSelected(QItemSelection,QItemSelection)));
    connect(m_sorted, SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)), this,
                             SIGNAL(signalValuesSelected()));
}

void KvDeskValueSelection::setObjects(KvDeskSelection *objects)
{
    m_objects = objects;
    connect(m_objects, SIGNAL(signalSelectionChanged()), this, SLOT(slotObjectsSelected()));
    slotObjectsSelected();
}

KvDeskObjectId KvDeskValueSelection::currentObject() const
{
    const QModelIndex index = m_view->currentIndex();
    const bool isSelected = index.isValid() && m_view->selectionModel()->isSelected(index);
    return isSelected ? m_model->row(m_sorted->sourceRow(index.row())).object : KvDeskObjectId();
}

void KvDeskValueSelection::slotRowsSelected(const QItemSelection &aSelected,
                                            const QItemSelection &aDeselected)
{
    Q_UNUSED(aSelected)
    Q_UNUSED(aDeselected)
    if (m_isSelecting || m_sorted->isTakingRowsOut())
        return;
    m_isOfTable = true;
    m_isScrollPending = false;
    m_values.clear();
    QSet<KvDeskObjectId> objects;
    for (const QItemSelectionRange &range : m_view->selectionModel()->selection()) {
        for (int row = range.top(); row <= range.bottom(); ++row) {
            const KvDeskValueRow value = m_model->row(m_sorted->sourceRow(row));
            m_values.append({value.object, value.position});
            objects.insert(value.object);
        }
    }
    if (m_objects) {
        const QScopedValueRollback<bool> selecting(m_isSelecting, true);
        m_objects->set(objects, currentObject());
    }
    emit signalValuesSelected();
}

void KvDeskValueSelection::slotObjectsSelected()
{
    if (m_isSelecting)
        return;
    m_isOfTable = false;
    m_isScrollPending = true;
    takeValuesOfObjects();
    selectRows();
    scrollToCurrent();
    emit signalValuesSelected();
}

void KvDeskValueSelection::slotRowsChanged()
{
    if (!m_isOfTable)
        takeValuesOfObjects();
    selectRows();
    scrollToCurrent();
    emit signalValuesSelected();
}

void KvDeskValueSelection::takeValuesOfObjects()
{
    m_values.clear();
    if (!m_objects)
        return;
    QVector<KvDeskObjectId> objects(m_objects->objects().begin(), m_objects->objects().end());
    std::sort(objects.begin(), objects.end());
    for (const KvDeskObjectId &object : qAsConst(objects)) {
        const KvDeskValueTableModel::Range rows = m_model->rowsOf(object);
        for (int row = rows.first; row < rows.first + rows.count; ++row)
            m_values.append({object, m_model->row(row).position});
    }
}

// Rows of the table that show the selected values, ascending.
QVector<int> KvDeskValueSelection::shownRows() const
{
    QVector<int> rows;
    for (const Value &value : m_values) {
        const int row = m_model->rowOf(value.object, value.position);
        if (row >= 0 && m_sorted->rowOf(row) >= 0)
            rows.append(m_sorted->rowOf(row));
    }
    std::sort(rows.begin(), rows.end());
    return rows;
}

void KvDeskValueSelection::selectRows()
{
    const QScopedValueRollback<bool> selecting(m_isSelecting, true);
    QItemSelection selection;
    const QVector<int> rows = shownRows();
    for (int i = 0; i < rows.size() && selection.size() < maximumPieces;) {
        const int first = i;
        while (++i < rows.size() && rows.at(i) == rows.at(i - 1) + 1) {
        }
        selection.append(
            QItemSelectionRange(m_sorted->index(rows.at(first), 0),
                                m_sorted->index(rows.at(i - 1), KvDeskValueTableModel::ColumnCount - 1)));
    }
    QItemSelectionModel *const model = m_view->selectionModel();
    if (selection == model->selection())
        return;
    // In two steps: in one, every old piece is compared with every new one.
    model->select(QItemSelection(), QItemSelectionModel::Clear);
    model->select(selection, QItemSelectionModel::Select);
}

void KvDeskValueSelection::scrollToCurrent()
{
    if (!m_isScrollPending || !m_objects)
        return;
    const KvDeskValueTableModel::Range rows = m_model->rowsOf(m_objects->current());
    QVector<int> places;
    for (int row = rows.first; row < rows.first + rows.count; ++row) {
        if (m_sorted->rowOf(row) >= 0)
            places.append(m_sorted->rowOf(row));
    }
    if (places.isEmpty())
        return;
    m_isScrollPending = false;
    std::sort(places.begin(), places.end());
    const QScopedValueRollback<bool> selecting(m_isSelecting, true);
    const QModelIndex first = m_sorted->index(places.first(), 0);
    m_view->selectionModel()->setCurrentIndex(first, QItemSelectionModel::NoUpdate);
    // All of them if they fit, the first in any case.
    m_view->scrollTo(m_sorted->index(places.last(), 0));
    m_view->scrollTo(first);
}

KvDeskSelectionStatistics KvDeskValueSelection::statistics() const
{
    using Group = KvDeskSelectionStatistics::Group;
    QVector<Group> groups;
    QHash<QPair<QPair<int, int>, int>, int> places; ///< by type, position and kind
    for (const Value &value : m_values) {
        const int row = m_model->rowOf(value.object, value.position);
        if (row < 0 || m_sorted->rowOf(row) < 0)
            continue;
        const KvDeskValueRow shown = m_model->row(row);
        const QPair<QPair<int, int>, int> key({value.object.type, value.position}, shown.kind);
        auto place = places.constFind(key);
        if (place == places.constEnd()) {
            place = places.insert(key, groups.size());
            Group group;
            group.valueName = m_model->text(row, KvDeskValueTableModel::NameColumn);
            group.kind = shown.kind;
            if (group.kind == ZtGsManipulator::NoKind)
                group.unit =
                    KvDeskValueTableModel::unitOf(m_model->text(row, KvDeskValueTableModel::ValueColumn));
            groups.append(group);
        }
        groups[*place].numbers.add(shown.value);
    }
    KvDeskSelectionStatistics statistics;
    for (const Group &group : qAsConst(groups))
        statistics.add(group);
    return statistics;
}
