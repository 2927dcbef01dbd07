// SPDX-License-Identifier: MIT
#include "KvDeskReason.h"

#include <QVariant>
#include <QWidget>

namespace {

const char ownToolTip[] = "ownToolTip";

} // namespace

void KvDeskReason::setPossible(QWidget *widget, bool isPossible, const QString &reason)
{
    if (widget->isEnabled())
        widget->setProperty(ownToolTip, widget->toolTip());
    const QString own = widget->property(ownToolTip).toString();
    widget->setEnabled(isPossible);
    if (isPossible)
        widget->setToolTip(own);
    else
        widget->setToolTip(own.isEmpty() ? reason : own + QLatin1Char('\n') + reason);
}
