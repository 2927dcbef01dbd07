// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"
#include "KvDeskPanel.h"

#include <QVector>

class KvDeskEmptyState;
class KvDeskTableView;
class KvDeskValueDelegate;
class KvDeskValueSortModel;
class KvDeskValueTableModel;
class QItemSelection;

/** Panel with the table of measured values. */
class KvDeskValueTable : public KvDeskPanel
{
    Q_OBJECT
public:
    explicit KvDeskValueTable(QWidget *parent = nullptr);

    KvDeskValueTableModel *model() const { return m_model; }
    KvDeskTableView *view() const { return m_view; }
    /** The object of the current row; none without a selection. */
    KvDeskObjectId selectedObject() const { return m_selected; }

protected:
    void resizeEvent(QResizeEvent *event) override;

public slots:
    /** Selects the rows of an object and scrolls to them; an \a aId of 0 selects nothing. Emits nothing. */
    void slotSelectObject(int aType, int aId);

signals:
    /** The user selected another object; \a aId is 0 when there is none any more. */
    void signalObjectSelected(int aType, int aId);

private slots:
    void slotSelectionChanged(const QItemSelection &aSelected, const QItemSelection &aDeselected);
    void slotRowsChanged();
    void slotColumnResized(int aColumn, int aOldWidth, int aNewWidth);

private:
    void createView();
    void setUpColumns();
    void connectSignals();
    void selectRows();
    void updateUnitWidth();
    void makeRoomForValues();
    KvDeskObjectId objectAt(const QModelIndex &index) const;

    KvDeskValueTableModel *m_model;
    KvDeskValueSortModel *m_sorted;
    KvDeskTableView *m_view = nullptr;
    KvDeskValueDelegate *m_delegate = nullptr;
    KvDeskEmptyState *m_emptyState = nullptr;
    KvDeskObjectId m_selected;
    int m_valueWidth = 0;       ///< pixels that the longest number and its unit take
    QVector<int> m_textWidths;  ///< of the columns before the values, as the user wants them
    bool m_isFitting = false;   ///< columns change because of the program
    bool m_isSelecting = false; ///< the selection changes because of the program
};
