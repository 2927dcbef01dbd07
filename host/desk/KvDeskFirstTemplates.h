// SPDX-License-Identifier: MIT
#pragma once

#include <QStringList>

/** The report templates that a user is offered who never chose any. */
class KvDeskFirstTemplates
{
public:
    /** Those of a folder, the simplest first. */
    static QStringList in(const QString &folder);
    /** Writes them where the report plug-in keeps its list, unless it has one, be it empty. Has to come
     * before the plug-in. */
    static void offer(const QString &folder);
};
