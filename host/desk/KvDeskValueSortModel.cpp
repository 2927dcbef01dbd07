// SPDX-License-Identifier: MIT
#include "KvDeskValueSortModel.h"

#include "KvDeskValueTableModel.h"

KvDeskValueSortModel::KvDeskValueSortModel(KvDeskValueTableModel *source, QObject *parent)
    : QSortFilterProxyModel(parent)
    , m_source(source)
{
    // The C locale compares bytes and cannot count.
    if (QLocale().language() == QLocale::C)
        m_collator.setLocale(QLocale(QLocale::English));
    m_collator.setNumericMode(true);
    m_collator.setCaseSensitivity(Qt::CaseInsensitive);
    setSourceModel(source);
}

bool KvDeskValueSortModel::lessThan(const QModelIndex &left, const QModelIndex &right) const
{
    if (left.column() == KvDeskValueTableModel::ValueColumn)
        return isValueLess(left.row(), right.row());
    return m_collator.compare(left.data().toString(), right.data().toString()) < 0;
}

bool KvDeskValueSortModel::isValueLess(int left, int right) const
{
    const KvDeskValueRow &a = m_source->row(left);
    const KvDeskValueRow &b = m_source->row(right);
    return a.kind != b.kind ? a.kind < b.kind : a.value < b.value;
}
