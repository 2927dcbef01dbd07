// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvPageSectionWidget.h"

/** The header of one page. Every page has its own, all showing the same section. */
class KvHeaderWidget : public KvPageSectionWidget
{
    Q_OBJECT
public:
    using KvPageSectionWidget::KvPageSectionWidget;

    QString displayName() const override;
};
