// SPDX-License-Identifier: MIT
#pragma once

class QString;
class QWidget;

/** Widgets that cannot be used at times, and say why. */
class KvDeskReason
{
public:
    /** Enables or disables a widget; the tool tip of one that is not possible adds the reason. */
    static void setPossible(QWidget *widget, bool isPossible, const QString &reason);
};
