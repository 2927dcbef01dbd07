// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"

#include <QAbstractTableModel>
#include <QVector>

/** Rows of the table of an objective's calibrations, the newest first. */
class KvDeskCalibrationHistory : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum Column { DateColumn, AuthorColumn, PixelSizeColumn, OriginColumn, NameColumn, ColumnCount };

    using QAbstractTableModel::QAbstractTableModel;

    void setHistory(const QVector<ZtCalibration> &history);
    const ZtCalibration &calibration(int row) const { return m_history.at(row); }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

private:
    QString text(const QModelIndex &index) const;

    QVector<ZtCalibration> m_history;
};
