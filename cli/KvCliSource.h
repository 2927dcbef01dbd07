// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QString>

#include <memory>

class QTemporaryFile;
struct ZtFault;

/** A file named on the command line; standard input ("-"), pipes and devices are copied to a temporary file
 * first. */
class KvCliSource
{
    Q_DECLARE_TR_FUNCTIONS(KvCliSource)

public:
    KvCliSource();
    ~KvCliSource();

    /** False with a fault when the copy cannot be made. */
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
