// SPDX-License-Identifier: MIT
#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"

#include "blocks/table/KvColumnShares.h"
#include "blocks/table/KvTableContents.h"

KvStatisticsBaseTableWidgetModel::KvStatisticsBaseTableWidgetModel(QObject *parent)
    : QAbstractTableModel(parent)
    , m_contents(std::make_shared<KvTableContents>())
{}

KvStatisticsBaseTableWidgetModel::~KvStatisticsBaseTableWidgetModel() = default;

void KvStatisticsBaseTableWidgetModel::setPart(std::shared_ptr<const KvTableContents> contents,
                                               int firstBodyRow, int bodyRows)
{
    beginResetModel();
    m_contents = std::move(contents);
    m_headerRows = m_contents->header.rowCount();
    m_firstBodyRow = firstBodyRow;
    m_bodyRows = bodyRows;
    m_columns = m_contents->columnCount();
    endResetModel();
}

void KvStatisticsBaseTableWidgetModel::clear()
{
    if (m_headerRows == 0 && m_bodyRows == 0 && m_columns == 0)
        return;
    beginResetModel();
    m_headerRows = 0;
    m_firstBodyRow = 0;
    m_bodyRows = 0;
    m_columns = 0;
    endResetModel();
}

int KvStatisticsBaseTableWidgetModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_headerRows + m_bodyRows;
}

int KvStatisticsBaseTableWidgetModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_columns;
}

QVariant KvStatisticsBaseTableWidgetModel::data(const QModelIndex &index, int role) const
{
    const KvTableCell *shown = index.isValid() ? cell(index.row(), index.column()) : nullptr;
    if (!shown)
        return QVariant();
    switch (role) {
    case Qt::DisplayRole:
        return shown->text;
    case Qt::FontRole:
        return rowFont(index.row());
    case Qt::TextAlignmentRole:
        // A plain int: that is what Qt's own views store for this role.
        return static_cast<int>(CellAlignment);
    case Qt::BackgroundRole:
        return QColor();
    case Qt::ForegroundRole:
        return shown->color;
    default:
        return QVariant();
    }
}

bool KvStatisticsBaseTableWidgetModel::hasHeaderSpans() const
{
    return m_headerRows > 0 && m_contents->header.hasSpans();
}

const KvTableCell *KvStatisticsBaseTableWidgetModel::cell(int row, int column) const
{
    if (row < 0 || row >= m_headerRows + m_bodyRows)
        return nullptr;
    if (row < m_headerRows)
        return m_contents->header.cell(row, column);
    return m_contents->body.cell(m_firstBodyRow + row - m_headerRows, column);
}

const QFont &KvStatisticsBaseTableWidgetModel::rowFont(int row) const
{
    return row < m_headerRows ? m_contents->headerFont : m_contents->bodyFont;
}

QVector<int> KvStatisticsBaseTableWidgetModel::columnEdges(int left, int width) const
{
    KvColumnShares::Needs needs;
    if (m_contents)
        needs = {m_contents->wantedWidths, m_contents->yieldingColumns};
    return KvColumnShares::edges(left, width, m_columns, needs);
}
