// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>

class KvCliHost;
class KvCliOutput;
class KvTemplateModel;
struct KvCliArguments;
class QString;

/** "statreport render": template and measurements in, PDF out. */
class KvRenderCommand
{
    Q_DECLARE_TR_FUNCTIONS(KvRenderCommand)

public:
    KvRenderCommand(const KvCliArguments &arguments, const KvCliOutput &output);

    /** Returns the exit code. */
    int run();

private:
    bool checkTemplate(KvCliHost &host, const QString &path, const QString &displayName) const;
    bool print(KvTemplateModel &model) const;
    bool printToFile(KvTemplateModel &model, const QString &path) const;
    /** For targets that cannot be replaced: standard output and devices. */
    bool printThroughCopy(KvTemplateModel &model) const;
    /** Notes what was logged as a warning or an error since the log had this many entries. */
    void noteWarnings(int firstEntry) const;
    bool failToWrite(const QString &path, const QString &reason) const;

    const KvCliArguments &m_arguments;
    const KvCliOutput &m_output;
};
