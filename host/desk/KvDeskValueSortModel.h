// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractProxyModel>
#include <QStringList>

#include <vector>

class KvDeskValueTableModel;

/**
 * Sorts and filters measured values: texts as people count ("Circle 2" before "Circle 10"), values by what
 * they measure, then by size whatever their units. Rows that are alike stay in the order of the source.
 *
 * Made for many rows of which a few change: one change takes time in proportion to the rows, but sorts and
 * filters only what changed.
 */
class KvDeskValueSortModel : public QAbstractProxyModel
{
    Q_OBJECT
public:
    /** \a source has to outlive this. */
    explicit KvDeskValueSortModel(KvDeskValueTableModel *source, QObject *parent = nullptr);

    /** Shows only rows where every word of \a text is in the type, the object's name or the value's name, in
     * any letter case. Resets the model when that changes anything. */
    void setFilter(const QString &text);
    bool isFiltered() const { return !m_words.isEmpty(); }
    /** Rows are going, so that what is selected changes without the user. */
    bool isTakingRowsOut() const { return m_isTakingRowsOut; }

    /** Row of the source behind a row, and the row that shows one of the source, -1 for none. */
    int sourceRow(int row) const { return m_rows[static_cast<std::size_t>(row)]; }
    int rowOf(int sourceRow) const { return m_places[static_cast<std::size_t>(sourceRow)]; }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    QModelIndex parent(const QModelIndex &child) const override;
    QModelIndex mapToSource(const QModelIndex &proxyIndex) const override;
    QModelIndex mapFromSource(const QModelIndex &sourceIndex) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    /** A \a column of -1 brings back the order of the source. */
    void sort(int column, Qt::SortOrder order = Qt::AscendingOrder) override;

private slots:
    void slotSourceAboutToBeReset();
    void slotSourceReset();
    void slotSourceRowsInserted(const QModelIndex &aParent, int aFirst, int aLast);
    void slotSourceRowsAboutToBeRemoved(const QModelIndex &aParent, int aFirst, int aLast);
    void slotSourceRowsRemoved(const QModelIndex &aParent, int aFirst, int aLast);
    void slotSourceRowsChanged(const QVector<int> &aRows, bool aNamesChanged);

private:
    using Rows = std::vector<int>;

    void connectSignals();
    void rebuild();
    Rows acceptedRows() const;
    QStringList wordsForObject(int sourceRow) const;
    bool isInObject(const QStringList &words, int sourceRow) const;
    Rows sortedRows() const;
    void sortByValues(Rows *rows) const;
    void sortByTexts(Rows *rows) const;
    void setPlaces();
    bool accepts(int sourceRow) const;
    bool isBefore(int left, int right) const;
    int compare(int left, int right) const;
    int compareValues(int left, int right) const;
    void refilter();
    void insertRows(const Rows &sourceRows);
    void sortAgain(const QVector<int> &changed);
    void rearrange(const Rows &rows);
    void announce(const QVector<int> &changed, bool namesChanged);

    KvDeskValueTableModel *m_source;
    QStringList m_words;
    int m_column = -1;
    Qt::SortOrder m_order = Qt::AscendingOrder;
    bool m_isTakingRowsOut = false;
    Rows m_rows;   ///< of the source, as they are shown
    Rows m_places; ///< where each row of the source is shown; -1 for nowhere
};
