// SPDX-License-Identifier: MIT
#pragma once

#include <QCursor>
#include <QGuiApplication>

/** Shows the wait cursor while it lives. */
class KvDeskWaitCursor
{
public:
    KvDeskWaitCursor() { QGuiApplication::setOverrideCursor(Qt::WaitCursor); }
    ~KvDeskWaitCursor() { QGuiApplication::restoreOverrideCursor(); }

private:
    Q_DISABLE_COPY(KvDeskWaitCursor)
};
