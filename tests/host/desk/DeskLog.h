// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtAppStatus.h"

#include <QStringList>

/** What the status log holds. */
class DeskLog
{
public:
    /** The messages of a category, oldest first. */
    static QStringList messages(int category)
    {
        QStringList messages;
        for (const ZtStatusEntry &entry : ZtStatusLog::getInstance()->entries()) {
            if (entry.category == category)
                messages.append(entry.message);
        }
        return messages;
    }
};
