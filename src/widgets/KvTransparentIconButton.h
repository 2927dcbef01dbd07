// SPDX-License-Identifier: MIT
#pragma once

#include "widgets/KvBaseButtonIcon.h"

/** Nothing but a tinted icon, 22 by 22 pixels; for buttons that float over something else. */
class KvTransparentIconButton : public KvBaseButtonIcon
{
    Q_OBJECT
public:
    explicit KvTransparentIconButton(const QString &iconPath, QWidget *parent = nullptr);
};
