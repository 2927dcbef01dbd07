// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvMeasuredValue.h"

#include <QString>
#include <QVector>

/** Order of the rows of a measurements table, as indexes into the records. */
namespace KvMeasurementsOrder {

/**
 * Sorts by one of the four columns: the texts by UTF-16 units, the value by its number. Values that are no
 * numbers come after all numbers, NaN before texts. Any other column name keeps the order of the records. Not
 * stable: rows that compare equal come in no guaranteed order.
 */
QVector<int> sorted(const QVector<KvMeasuredValue> &records, const QString &column, bool ascending);

} // namespace KvMeasurementsOrder
