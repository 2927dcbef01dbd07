// SPDX-License-Identifier: MIT
#include "KvDeskValueSortModel.h"

#include "KvDeskValueTableModel.h"

#include <QScopedValueRollback>

#include <algorithm>
#include <numeric>
#include <utility>

KvDeskValueSortModel::KvDeskValueSortModel(KvDeskValueTableModel *source, QObject *parent)
    : QAbstractProxyModel(parent)
    , m_source(source)
{
    setSourceModel(source);
    connectSignals();
    rebuild();
}

void KvDeskValueSortModel::connectSignals()
{
    connect(m_source, SIGNAL(modelAboutToBeReset()), this, SLOT(slotSourceAboutToBeReset()));
    connect(m_source, SIGNAL(modelReset()), this, SLOT(slotSourceReset()));
    connect(m_source, SIGNAL(rowsInserted(QModelIndex,int,int)), this,
                             SLOT(slotSourceRowsInserted(QModelIndex,int,int)));
    connect(m_source, SIGNAL(rowsAboutToBeRemoved(QModelIndex,int,int)), this,
                             SLOT(slotSourceRowsAboutToBeRemoved(QModelIndex,int,int)));
    connect(m_source, SIGNAL(rowsRemoved(QModelIndex,int,int)), this,
                             SLOT(slotSourceRowsRemoved(QModelIndex,int,int)));
    connect(m_source, SIGNAL(signalRowsChanged(QVector<int>,bool)), this,
                             SLOT(slotSourceRowsChanged(QVector<int>,bool)));
}

int KvDeskValueSortModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(m_rows.size());
}

int KvDeskValueSortModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(KvDeskValueTableModel::ColumnCount);
}

QModelIndex KvDeskValueSortModel::index(int row, int column, const QModelIndex &parent) const
{
    return hasIndex(row, column, parent) ? createIndex(row, column) : QModelIndex();
}

QModelIndex KvDeskValueSortModel::parent(const QModelIndex &child) const
{
    Q_UNUSED(child)
    return QModelIndex();
}

QModelIndex KvDeskValueSortModel::mapToSource(const QModelIndex &proxyIndex) const
{
    const bool isRow = proxyIndex.isValid() && proxyIndex.row() < rowCount();
    return isRow ? m_source->index(sourceRow(proxyIndex.row()), proxyIndex.column()) : QModelIndex();
}

QModelIndex KvDeskValueSortModel::mapFromSource(const QModelIndex &sourceIndex) const
{
    const bool isRow = sourceIndex.isValid() && static_cast<std::size_t>(sourceIndex.row()) < m_places.size();
    return isRow ? index(rowOf(sourceIndex.row()), sourceIndex.column()) : QModelIndex();
}

// Also without rows, unlike the inherited one, which asks a cell.
QVariant KvDeskValueSortModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    return m_source->headerData(section, orientation, role);
}

// The words that neither the type nor the name of the value have: the object's name has to.
QStringList KvDeskValueSortModel::wordsForObject(int sourceRow) const
{
    const QString type = m_source->text(sourceRow, KvDeskValueTableModel::TypeColumn);
    const QString name = m_source->text(sourceRow, KvDeskValueTableModel::NameColumn);
    QStringList words;
    for (const QString &word : m_words) {
        if (!type.contains(word, Qt::CaseInsensitive) && !name.contains(word, Qt::CaseInsensitive))
            words.append(word);
    }
    return words;
}

bool KvDeskValueSortModel::isInObject(const QStringList &words, int sourceRow) const
{
    if (words.isEmpty())
        return true;
    const QString object = m_source->text(sourceRow, KvDeskValueTableModel::ObjectColumn);
    return std::all_of(words.begin(), words.end(),
                       [&object](const QString &word) { return object.contains(word, Qt::CaseInsensitive); });
}

bool KvDeskValueSortModel::accepts(int sourceRow) const
{
    return m_words.isEmpty() || isInObject(wordsForObject(sourceRow), sourceRow);
}

// All rows with a value of one name need the same words in the name of their object.
KvDeskValueSortModel::Rows KvDeskValueSortModel::acceptedRows() const
{
    Rows rows;
    rows.reserve(static_cast<std::size_t>(m_source->rowCount()));
    QHash<QPair<int, int>, QStringList> words; // by type and position
    for (int row = 0; row < m_source->rowCount(); ++row) {
        bool isAccepted = m_words.isEmpty();
        if (!isAccepted) {
            const KvDeskValueRow shown = m_source->row(row);
            const QPair<int, int> name(shown.object.type, shown.position);
            auto found = words.constFind(name);
            if (found == words.constEnd())
                found = words.insert(name, wordsForObject(row));
            isAccepted = isInObject(*found, row);
        }
        if (isAccepted)
            rows.push_back(row);
    }
    return rows;
}

int KvDeskValueSortModel::compareValues(int left, int right) const
{
    const KvDeskValueRow a = m_source->row(left);
    const KvDeskValueRow b = m_source->row(right);
    if (a.kind != b.kind)
        return a.kind < b.kind ? -1 : 1;
    return a.value < b.value ? -1 : b.value < a.value ? 1 : 0;
}

int KvDeskValueSortModel::compare(int left, int right) const
{
    if (m_column < 0)
        return 0;
    const int result = m_column == KvDeskValueTableModel::ValueColumn
                           ? compareValues(left, right)
                           : m_source->compareTexts(left, right, m_column);
    return m_order == Qt::AscendingOrder ? result : -result;
}

bool KvDeskValueSortModel::isBefore(int left, int right) const
{
    const int result = compare(left, right);
    return result != 0 ? result < 0 : left < right;
}

KvDeskValueSortModel::Rows KvDeskValueSortModel::sortedRows() const
{
    Rows rows = acceptedRows();
    if (m_column == KvDeskValueTableModel::ValueColumn)
        sortByValues(&rows);
    else if (m_column >= 0)
        sortByTexts(&rows);
    return rows;
}

// Numbers that lie next to each other in memory are compared much quicker than rows of the source.
void KvDeskValueSortModel::sortByValues(Rows *rows) const
{
    struct Value
    {
        double value;
        int kind;
        int row;
    };
    std::vector<Value> values;
    values.reserve(rows->size());
    for (const int row : *rows) {
        const KvDeskValueRow shown = m_source->row(row);
        values.push_back({shown.value, shown.kind, row});
    }
    const bool isAscending = m_order == Qt::AscendingOrder;
    const auto isBefore = [isAscending](const Value &a, const Value &b) {
        if (a.kind != b.kind)
            return (a.kind < b.kind) == isAscending;
        if (a.value < b.value || b.value < a.value)
            return (a.value < b.value) == isAscending;
        return a.row < b.row;
    };
    std::sort(values.begin(), values.end(), isBefore);
    std::transform(values.begin(), values.end(), rows->begin(), [](const Value &value) { return value.row; });
}

// Rows with the same text stay as they are, so each goes to the next free place of its text.
void KvDeskValueSortModel::sortByTexts(Rows *rows) const
{
    std::vector<int> ranks = m_source->ranks(m_column);
    if (ranks.empty())
        return;
    const int last = *std::max_element(ranks.begin(), ranks.end());
    if (m_order == Qt::DescendingOrder)
        std::transform(ranks.begin(), ranks.end(), ranks.begin(), [last](int rank) { return last - rank; });
    std::vector<std::size_t> starts(static_cast<std::size_t>(last) + 2);
    const auto rankOf = [&ranks](int row) {
        return static_cast<std::size_t>(ranks[static_cast<std::size_t>(row)]);
    };
    for (const int row : *rows)
        ++starts[rankOf(row) + 1];
    std::partial_sum(starts.begin(), starts.end(), starts.begin());
    Rows sorted(rows->size());
    for (const int row : *rows)
        sorted[starts[rankOf(row)]++] = row;
    rows->swap(sorted);
}

void KvDeskValueSortModel::rebuild()
{
    m_rows = sortedRows();
    setPlaces();
}

void KvDeskValueSortModel::setPlaces()
{
    m_places.assign(static_cast<std::size_t>(m_source->rowCount()), -1);
    for (std::size_t i = 0; i < m_rows.size(); ++i)
        m_places[static_cast<std::size_t>(m_rows[i])] = static_cast<int>(i);
}

void KvDeskValueSortModel::setFilter(const QString &text)
{
    const QStringList words = text.simplified().split(QLatin1Char(' '), Qt::SkipEmptyParts);
    if (words == m_words)
        return;
    m_words = words;
    refilter();
}

void KvDeskValueSortModel::refilter()
{
    beginResetModel();
    rebuild();
    endResetModel();
}

void KvDeskValueSortModel::sort(int column, Qt::SortOrder order)
{
    m_column = column;
    m_order = order;
    rearrange(sortedRows());
}

// The same rows in another order.
void KvDeskValueSortModel::rearrange(const Rows &rows)
{
    if (rows == m_rows)
        return;
    emit layoutAboutToBeChanged({}, VerticalSortHint);
    const Rows before = std::exchange(m_rows, rows);
    setPlaces();
    const QModelIndexList from = persistentIndexList();
    QModelIndexList to;
    to.reserve(from.size());
    for (const QModelIndex &old : from)
        to.append(index(rowOf(before[static_cast<std::size_t>(old.row())]), old.column()));
    changePersistentIndexList(from, to);
    emit layoutChanged({}, VerticalSortHint);
}

void KvDeskValueSortModel::slotSourceAboutToBeReset()
{
    beginResetModel();
}

void KvDeskValueSortModel::slotSourceReset()
{
    rebuild();
    endResetModel();
}

void KvDeskValueSortModel::slotSourceRowsInserted(const QModelIndex &aParent, int aFirst, int aLast)
{
    Q_UNUSED(aParent)
    const int count = aLast - aFirst + 1;
    for (int &row : m_rows)
        row += row >= aFirst ? count : 0;
    setPlaces();
    Rows added;
    for (int row = aFirst; row <= aLast; ++row) {
        if (accepts(row))
            added.push_back(row);
    }
    std::sort(added.begin(), added.end(), [this](int a, int b) { return isBefore(a, b); });
    insertRows(added);
}

// Rows of the source, in order; those that come to lie next to each other come together.
void KvDeskValueSortModel::insertRows(const Rows &sourceRows)
{
    const auto less = [this](int a, int b) { return isBefore(a, b); };
    for (auto first = sourceRows.begin(); first != sourceRows.end();) {
        const auto place = std::lower_bound(m_rows.begin(), m_rows.end(), *first, less);
        auto last = first + 1;
        while (last != sourceRows.end() && (place == m_rows.end() || isBefore(*last, *place)))
            ++last;
        const int row = static_cast<int>(place - m_rows.begin());
        beginInsertRows(QModelIndex(), row, row + static_cast<int>(last - first) - 1);
        m_rows.insert(place, first, last);
        setPlaces();
        endInsertRows();
        first = last;
    }
}

void KvDeskValueSortModel::slotSourceRowsAboutToBeRemoved(const QModelIndex &aParent, int aFirst, int aLast)
{
    Q_UNUSED(aParent)
    Rows places;
    for (int row = aFirst; row <= aLast; ++row) {
        if (rowOf(row) >= 0)
            places.push_back(rowOf(row));
    }
    std::sort(places.begin(), places.end());
    const QScopedValueRollback<bool> takingOut(m_isTakingRowsOut, true);
    while (!places.empty()) {
        const int last = places.back();
        int first = last;
        for (places.pop_back(); !places.empty() && places.back() == first - 1; places.pop_back())
            --first;
        beginRemoveRows(QModelIndex(), first, last);
        m_rows.erase(m_rows.begin() + first, m_rows.begin() + last + 1);
        setPlaces();
        endRemoveRows();
    }
}

void KvDeskValueSortModel::slotSourceRowsRemoved(const QModelIndex &aParent, int aFirst, int aLast)
{
    Q_UNUSED(aParent)
    const int count = aLast - aFirst + 1;
    for (int &row : m_rows)
        row -= row > aLast ? count : 0;
    setPlaces();
}

void KvDeskValueSortModel::slotSourceRowsChanged(const QVector<int> &aRows, bool aNamesChanged)
{
    if (isFiltered() && aNamesChanged) {
        const auto isOther = [this](int row) { return accepts(row) != (rowOf(row) >= 0); };
        if (std::any_of(aRows.begin(), aRows.end(), isOther)) {
            refilter();
            return;
        }
    }
    if (m_column == KvDeskValueTableModel::ValueColumn || (m_column >= 0 && aNamesChanged))
        sortAgain(aRows);
    announce(aRows, aNamesChanged);
}

void KvDeskValueSortModel::sortAgain(const QVector<int> &changed)
{
    std::vector<bool> isChanged(m_places.size());
    Rows others;
    Rows moved;
    for (const int row : changed)
        isChanged[static_cast<std::size_t>(row)] = true;
    others.reserve(m_rows.size());
    for (const int row : m_rows)
        (isChanged[static_cast<std::size_t>(row)] ? moved : others).push_back(row);
    const auto less = [this](int a, int b) { return isBefore(a, b); };
    std::sort(moved.begin(), moved.end(), less);
    Rows rows(m_rows.size());
    std::merge(others.begin(), others.end(), moved.begin(), moved.end(), rows.begin(), less);
    rearrange(rows);
}

void KvDeskValueSortModel::announce(const QVector<int> &changed, bool namesChanged)
{
    int first = rowCount();
    int last = -1;
    for (const int row : changed) {
        const int place = rowOf(row);
        if (place < 0)
            continue;
        first = qMin(first, place);
        last = qMax(last, place);
    }
    if (last >= 0)
        emit dataChanged(index(first, namesChanged ? 0 : KvDeskValueTableModel::ValueColumn),
                         index(last, KvDeskValueTableModel::ValueColumn));
}
