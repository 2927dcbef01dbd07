// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtJsonRows.h"

#include <QByteArray>
#include <QHash>

/** A list of flat objects, as programs for tables of data write it: their keys name the columns, in the order
 * in which they first come. */
class ZtJsonRecords : public ZtJsonRows
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    /** \a json was checked and stands at the list. */
    ZtJsonRecords(const ZtJsonReader &json, ZtProgress *progress);

protected:
    bool prepare() override;
    bool nextRecord(ZtCsvRow *row) override;
    QString placeOf(int column) const override;

private:
    bool collectColumns();
    /** The column of the next member, which mostly follows that of the member before; -1 for a new one. */
    int columnOf(std::string_view key, int before) const;
    int addColumn(std::string_view key);

    QHash<QByteArray, int> m_indexes;
    std::vector<int> m_lastItems; ///< by column: the record where it came last
};
