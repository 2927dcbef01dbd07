// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskFileStamp.h"

#include <QDateTime>
#include <QString>

class ZtProgress;
struct ZtFault;
struct ZtLoadedSession;
struct ZtSession;

/** A copy of unsaved work: a line about it, which is all that this keeps in memory, and a session file. */
struct KvDeskRecoveryFile
{
    QString sessionPath;          ///< where the session belongs; empty for one without a file
    KvDeskFileStamp sessionStamp; ///< of that file when the session was read from it or written to it
    QDateTime time;               ///< UTC
    int objectCount = 0;

    static QString suffix() { return QStringLiteral(".recovery"); }
    /** Where the copies of all running programs are. */
    static QString standardFolder();

    bool write(const QString &file, const ZtSession &session, ZtFault *fault, ZtProgress *progress) const;
    /** Reads the line; false for a file that is none. */
    bool readHeader(const QString &file);
    /** Reads the session with its image. */
    static bool read(const QString &file, ZtLoadedSession *loaded, ZtFault *fault, ZtProgress *progress);

private:
    QByteArray header() const;
};
