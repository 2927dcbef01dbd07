// SPDX-License-Identifier: MIT
#include "report/KvFooterWidget.h"

QString KvFooterWidget::displayName() const
{
    return tr("Footer");
}
