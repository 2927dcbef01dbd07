// SPDX-License-Identifier: MIT
#include "widgets/KvStatisticsToolIconButton.h"

namespace {
constexpr int kExtent = 32;
}

KvStatisticsToolIconButton::KvStatisticsToolIconButton(const QString &iconPath, QWidget *parent)
    : KvBaseButtonIcon(iconPath, parent)
{
    setCheckable(true);
    setPlainSize(QSize(kExtent, kExtent));
}
