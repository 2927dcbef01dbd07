// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

#include <memory>

class QTemporaryFile;
struct ZtFault;

/** A file named on the command line; "-" is read from standard input into a temporary file first. */
class KvCliSource
{
public:
    KvCliSource();
    ~KvCliSource();

    /** False with a fault when standard input cannot be taken over. */
    bool open(const QString &name, ZtFault *fault);

    /** The file to read. */
    QString path() const { return m_path; }
    /** What to call it in messages. */
    QString displayName() const { return m_displayName; }

private:
    std::unique_ptr<QTemporaryFile> m_copy;
    QString m_path;
    QString m_displayName;
};
