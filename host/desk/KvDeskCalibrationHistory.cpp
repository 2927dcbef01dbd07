// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationHistory.h"

#include "KvDeskCalibrationText.h"

void KvDeskCalibrationHistory::setHistory(const QVector<ZtCalibration> &history)
{
    if (history == m_history)
        return;
    beginResetModel();
    m_history = history;
    endResetModel();
}

int KvDeskCalibrationHistory::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_history.size();
}

int KvDeskCalibrationHistory::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

QString KvDeskCalibrationHistory::text(const QModelIndex &index) const
{
    const ZtCalibration &calibration = m_history.at(index.row());
    switch (index.column()) {
    case DateColumn:
        return KvDeskCalibrationText::date(calibration.date());
    case AuthorColumn:
        return calibration.author();
    case PixelSizeColumn:
        return KvDeskCalibrationText::pixelSize(calibration);
    case OriginColumn:
        return KvDeskCalibrationText::origin(calibration.origin());
    default:
        return calibration.name();
    }
}

QVariant KvDeskCalibrationHistory::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return QVariant();
    if (role == Qt::DisplayRole)
        return text(index);
    const QString note = m_history.at(index.row()).note();
    if (role == Qt::ToolTipRole)
        return note.isEmpty() ? text(index) : text(index) + QLatin1Char('\n') + note;
    return QVariant();
}

QVariant KvDeskCalibrationHistory::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (role != Qt::DisplayRole || orientation != Qt::Horizontal)
        return QVariant();
    switch (section) {
    case DateColumn:
        return tr("Date");
    case AuthorColumn:
        return tr("Who");
    case PixelSizeColumn:
        return tr("Pixel size");
    case OriginColumn:
        return tr("Origin");
    default:
        return tr("Name");
    }
}
