// SPDX-License-Identifier: MIT
#pragma once

#include <QCollator>
#include <QSortFilterProxyModel>

class KvDeskValueTableModel;

/** Sorts measured values: texts as people count ("Circle 2" before "Circle 10"), values by what they measure,
 * then by size whatever their units. */
class KvDeskValueSortModel : public QSortFilterProxyModel
{
    Q_OBJECT
public:
    /** \a source has to outlive this. */
    explicit KvDeskValueSortModel(KvDeskValueTableModel *source, QObject *parent = nullptr);

protected:
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override;

private:
    bool isValueLess(int left, int right) const;

    const KvDeskValueTableModel *m_source;
    QCollator m_collator;
};
