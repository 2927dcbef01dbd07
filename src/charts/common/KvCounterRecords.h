// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvMeasuredValue.h"

/** Tells the records of the host's counting objects from measured ones. */
namespace KvCounterRecords {

/** Whether a record belongs to a counting object. */
inline bool isCounter(const KvMeasuredValue &record)
{
    constexpr qint32 counterType = 66741; // object type id of the host
    return record.objectType == counterType;
}

/** Whether a record holds how much was counted; the others of a counter are derived from it. */
inline bool isCount(const KvMeasuredValue &record)
{
    constexpr qint32 countClass = 1;
    return isCounter(record) && record.valueClass == countClass;
}

} // namespace KvCounterRecords
