// SPDX-License-Identifier: MIT
#pragma once

#include "widgets/KvBaseButtonIcon.h"

/** Checkable button that picks one of the statistics blocks; with a text it shows that beside its icon. */
class KvStatisticsToolIconButton : public KvBaseButtonIcon
{
    Q_OBJECT
    /** Path of the icon, as for acss::getPathSVG(); for forms and style sheets. */
    Q_PROPERTY(QString toolIcon READ iconPath WRITE setIconPath)
public:
    explicit KvStatisticsToolIconButton(const QString &iconPath, QWidget *parent = nullptr);
};
