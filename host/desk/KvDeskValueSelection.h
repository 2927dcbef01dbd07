// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QHash>
#include <QObject>
#include <QVector>

class KvDeskSelection;
class KvDeskSelectionStatistics;
class KvDeskTableView;
class KvDeskValueSortModel;
class KvDeskValueTableModel;
class QItemSelection;

/**
 * Keeps the selected rows of the table and the selected objects in step.
 *
 * Objects that are selected elsewhere are selected with all of their rows, and the table scrolls to the
 * current one. Rows that the user selects select their objects, but no further rows: so values of one name
 * can be looked at alone.
 */
class KvDeskValueSelection : public QObject
{
    Q_OBJECT
public:
    /** More pieces of the table than these are not marked: they would make every drawing slow. */
    static constexpr int maximumPieces = 20000;

    /** All have to outlive this. */
    KvDeskValueSelection(KvDeskTableView *view, KvDeskValueSortModel *sorted, KvDeskValueTableModel *model,
                         QObject *parent = nullptr);

    /** The objects that are selected; has to outlive this. */
    void setObjects(KvDeskSelection *objects);

    /** One value of one object. */
    struct Value
    {
        KvDeskObjectId object;
        int position = 0;
    };
    /** The selected values, of which some may be filtered out or gone. */
    const QVector<Value> &values() const { return m_values; }
    /** Of those selected values that the filter lets through. */
    KvDeskSelectionStatistics statistics() const;

signals:
    void signalValuesSelected(); ///< other values than before, or the same with other numbers

public slots:
    /** Selects rows again after they came, went or moved. */
    void slotRowsChanged();

private slots:
    void slotObjectsSelected();
    void slotRowsSelected(const QItemSelection &aSelected, const QItemSelection &aDeselected);

private:
    void selectRows();
    QVector<int> shownRows() const;
    void takeValuesOfObjects();
    void scrollToCurrent();
    KvDeskObjectId currentObject() const;

    KvDeskTableView *m_view;
    KvDeskValueSortModel *m_sorted;
    KvDeskValueTableModel *m_model;
    KvDeskSelection *m_objects = nullptr;
    QVector<Value> m_values;
    bool m_isOfTable = false;       ///< the user selected rows, not objects
    bool m_isSelecting = false;     ///< the selection changes because of the program
    bool m_isScrollPending = false; ///< the current object has no rows yet
};
