// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvChoiceOptionsRow.h"

/** Options row for the colour theme of a table or chart. A choice is an index of kvCharts::KvChartThemes. */
class KvThemeOptionsRow : public KvChoiceOptionsRow
{
    Q_OBJECT
public:
    explicit KvThemeOptionsRow(QWidget *parent = nullptr);
};
