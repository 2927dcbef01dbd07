// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvChoiceOptionsRow.h"

/** Options row for how a statistics block groups the measured values. */
class KvGroupByOptionsRow : public KvChoiceOptionsRow
{
    Q_OBJECT
public:
    explicit KvGroupByOptionsRow(QWidget *parent = nullptr);

    /** 0 by measurement, 1 by object, as files say it, though "Object" stands first; -1 while none is
     * checked. */
    int grouping() const;
    /** Checks the button of a grouping, or none for any other number; emits nothing. */
    void setGrouping(int grouping);
};
