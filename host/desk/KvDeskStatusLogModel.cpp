// SPDX-License-Identifier: MIT
#include "KvDeskStatusLogModel.h"

#include "KvDeskStatus.h"
#include "gui/acss.h"

namespace {

constexpr int toolIconStyle = 6;
constexpr QSize iconSize(16, 16);

} // namespace

KvDeskStatusLogModel::KvDeskStatusLogModel(QObject *parent)
    : QAbstractTableModel(parent)
    , m_entries(ZtStatusLog::getInstance()->entries())
{
    const ZtStatusLog *const log = ZtStatusLog::getInstance();
    connect(log, SIGNAL(signalEntryLogged(ZtStatusEntry)), this, SLOT(slotEntryLogged(ZtStatusEntry)));
    connect(log, SIGNAL(signalCleared()), this, SLOT(slotCleared()));
}

int KvDeskStatusLogModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_entries.size();
}

int KvDeskStatusLogModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

QVariant KvDeskStatusLogModel::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid | CheckIndexOption::ParentIsInvalid))
        return QVariant();
    const ZtStatusEntry &entry = m_entries.at(index.row());
    const bool isCategory = index.column() == CategoryColumn;
    if (role == Qt::DisplayRole)
        return text(entry, index.column());
    if (role == Qt::DecorationRole && isCategory)
        return acss::createIcon(toolIconStyle, KvDeskStatus::iconPath(entry.category), iconSize);
    if (role == Qt::ForegroundRole && isCategory)
        return KvDeskStatus::color(entry.category);
    if (role == Qt::ToolTipRole && index.column() == MessageColumn)
        return tr("%1\nReported by %2", "message, source").arg(entry.message, entry.source);
    return QVariant();
}

QVariant KvDeskStatusLogModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section >= ColumnCount)
        return QVariant();
    const QString titles[ColumnCount] = {tr("Category"), tr("Time"), tr("Message")};
    return titles[section];
}

QString KvDeskStatusLogModel::text(const ZtStatusEntry &entry, int column) const
{
    switch (column) {
    case CategoryColumn:
        return KvDeskStatus::categoryName(entry.category);
    case TimeColumn:
        return entry.time.toString(QStringLiteral("HH:mm:ss"));
    default:
        return entry.message.simplified();
    }
}

void KvDeskStatusLogModel::slotEntryLogged(const ZtStatusEntry &aEntry)
{
    beginInsertRows(QModelIndex(), m_entries.size(), m_entries.size());
    m_entries.append(aEntry);
    endInsertRows();
    dropSurplus();
}

void KvDeskStatusLogModel::dropSurplus()
{
    const int surplus = m_entries.size() - ZtStatusLog::getInstance()->entries().size();
    if (surplus <= 0)
        return;
    beginRemoveRows(QModelIndex(), 0, surplus - 1);
    m_entries.remove(0, surplus);
    endRemoveRows();
}

void KvDeskStatusLogModel::slotCleared()
{
    beginResetModel();
    m_entries.clear();
    endResetModel();
}
