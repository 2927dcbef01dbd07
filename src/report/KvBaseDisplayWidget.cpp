// SPDX-License-Identifier: MIT
#include "report/KvBaseDisplayWidget.h"

#include "report/KvBaseDisplayWidgetSignals.h"

KvBaseDisplayWidget::KvBaseDisplayWidget()
    : m_signals(std::make_unique<KvBaseDisplayWidgetSignals>())
{}

KvBaseDisplayWidget::~KvBaseDisplayWidget() = default;

int KvBaseDisplayWidget::subWidgetCount()
{
    return 1;
}
