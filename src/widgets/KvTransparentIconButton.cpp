// SPDX-License-Identifier: MIT
#include "widgets/KvTransparentIconButton.h"

namespace {
constexpr int kExtent = 22;
constexpr int kIconExtent = 20;
} // namespace

KvTransparentIconButton::KvTransparentIconButton(const QString &iconPath, QWidget *parent)
    : KvBaseButtonIcon(iconPath, parent)
{
    setFlat(true);
    setCheckable(false);
    setIconSize(QSize(kIconExtent, kIconExtent));
    setPlainSize(QSize(kExtent, kExtent));
    setAutoFillBackground(false);
    setAttribute(Qt::WA_TranslucentBackground);
}
