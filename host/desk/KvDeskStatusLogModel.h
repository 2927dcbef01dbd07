// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtAppStatus.h"

#include <QAbstractTableModel>
#include <QVector>

/** The entries of the status log, oldest first. */
class KvDeskStatusLogModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum Column { CategoryColumn, TimeColumn, MessageColumn, ColumnCount };

    explicit KvDeskStatusLogModel(QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

private slots:
    void slotEntryLogged(const ZtStatusEntry &aEntry);
    void slotCleared();

private:
    void dropSurplus();
    QString text(const ZtStatusEntry &entry, int column) const;

    // Not the log's own list: that one has lost entries at its front when it announces one at its end.
    QVector<ZtStatusEntry> m_entries;
};
