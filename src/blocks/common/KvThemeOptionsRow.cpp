// SPDX-License-Identifier: MIT
#include "blocks/common/KvThemeOptionsRow.h"

KvThemeOptionsRow::KvThemeOptionsRow(QWidget *parent)
    : KvChoiceOptionsRow(tr("Color theme:"), {tr("Dark"), tr("Light")}, parent)
{}
