// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationWay.h"

#include <QLabel>
#include <QVBoxLayout>

namespace {

constexpr int hintLines = 2;
constexpr int spacing = 8;

} // namespace

void KvDeskCalibrationWay::setContent(const QString &hint, QLayout *row)
{
    auto *const label = new QLabel(hint, this);
    label->setProperty("caption", true);
    label->setWordWrap(true);
    // A window does not grow for a text that takes another line.
    label->setMinimumHeight(hintLines * label->fontMetrics().lineSpacing());
    label->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    row->setSpacing(spacing);
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    layout->addWidget(label);
    layout->addLayout(row);
    layout->addStretch();
}
