// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QStringList>

/** The example sessions that come with the program. */
class KvDeskExamples
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskExamples)
public:
    /** Where they are, seen from the folder of the program: installed, or in the sources beside a build;
     * empty where there are none. */
    static QString folder(const QString &programFolder = QCoreApplication::applicationDirPath());
    /** Paths of the sessions: the simplest first, unknown ones at the end by name. */
    static QStringList sessions(const QString &examplesFolder);
    /** What to call a session. */
    static QString title(const QString &sessionPath);
};
