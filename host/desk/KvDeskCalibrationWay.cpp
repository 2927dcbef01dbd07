// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationWay.h"

#include <QLabel>
#include <QVBoxLayout>

namespace {

constexpr int spacing = 8;

} // namespace

void KvDeskCalibrationWay::setContent(const QString &hint, QLayout *row)
{
    auto *const label = new QLabel(hint, this);
    label->setProperty("caption", true);
    label->setWordWrap(true);
    row->setSpacing(spacing);
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    layout->addWidget(label);
    layout->addLayout(row);
    layout->addStretch();
}
