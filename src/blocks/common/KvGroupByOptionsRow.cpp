// SPDX-License-Identifier: MIT
#include "blocks/common/KvGroupByOptionsRow.h"

namespace {
constexpr int kLastChoice = 1; // the buttons stand in the opposite order of the stored numbers
}

KvGroupByOptionsRow::KvGroupByOptionsRow(QWidget *parent)
    : KvChoiceOptionsRow(tr("Group by:"), {tr("Object"), tr("Measurement")}, parent)
{}

int KvGroupByOptionsRow::grouping() const
{
    return choice() < 0 ? -1 : kLastChoice - choice();
}

void KvGroupByOptionsRow::setGrouping(int grouping)
{
    const bool isKnown = grouping >= 0 && grouping <= kLastChoice;
    setChoice(isKnown ? kLastChoice - grouping : -1);
}
