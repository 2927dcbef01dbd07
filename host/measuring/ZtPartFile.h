// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QFile>
#include <QString>

/**
 * The new contents of a file while they are written: a file beside it that takes its place when all is there.
 *
 * It is called as the file, with the id of the process, six letters and ".part" behind that: who is killed
 * leaves it, and whoever writes the file next can tell what it is.
 */
class ZT_MEASURING_EXPORT ZtPartFile
{
public:
    /** A part that nobody wrote to for so long, whose process is gone, is of no use to anybody. */
    static constexpr int staleSeconds = 60;
    /** The same where the process seems to live: another one may have got its id, or it is that of another
     * machine. */
    static constexpr int forgottenSeconds = 24 * 60 * 60;

    /** For the file \a path, or what it is a link to. */
    explicit ZtPartFile(const QString &path);
    /** Removes it unless it took the file's place. */
    ~ZtPartFile();

    /** Makes the part, with the permissions of the file. */
    bool open();
    QFile *file() { return &m_file; }
    /** Takes the file's place. */
    bool commit();
    /** Why open(), writing or commit() did not work. */
    QString errorString() const;

    /** Removes the parts of the file \a path that were left behind. */
    static void removeStale(const QString &path);

private:
    Q_DISABLE_COPY(ZtPartFile)

    QString m_target;
    QFile m_file;
    QString m_error;
};
