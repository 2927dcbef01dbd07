// SPDX-License-Identifier: MIT
#include "report/KvHeaderWidget.h"

QString KvHeaderWidget::displayName() const
{
    return tr("Header");
}
