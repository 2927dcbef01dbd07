// SPDX-License-Identifier: MIT
#include "KvRenderCommand.h"

#include "KvCliArguments.h"
#include "KvCliHost.h"
#include "KvCliOutput.h"
#include "KvCliSource.h"
#include "KvTemplateCheck.h"
#include "KvTerminalProgress.h"

#include "common/ZtAppStatus.h"
#include "measuring/ZtFileFault.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"
#include "templates/KvUserMessages.h"

#include <QFileInfo>
#include <QScopeGuard>
#include <QTemporaryFile>

#include <cerrno>
#include <cstdio>

#include <sys/stat.h>

namespace {

/** Passes the model's messages on to standard error. */
class CliMessages : public KvUserMessages
{
public:
    explicit CliMessages(const KvCliOutput &output)
        : m_output(output)
    {}
    void warn(const QString &title, const QString &text) override
    {
        Q_UNUSED(title)
        m_output.error(text);
    }

private:
    const KvCliOutput &m_output;
};

// Qt's PDF writer does not tell when a disk is full; a file that lacks its end was not written.
bool isCompletePdf(const QString &path)
{
    constexpr qint64 kTail = 32;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || file.size() < kTail)
        return false;
    file.seek(file.size() - kTail);
    return file.readAll().contains("%%EOF");
}

// As for any file that a program creates; a temporary file is its owner's only.
QFileDevice::Permissions permissionsOfNewFiles()
{
    const mode_t mask = umask(0);
    umask(mask);
    QFileDevice::Permissions permissions = QFileDevice::ReadOwner | QFileDevice::WriteOwner;
    if (!(mask & S_IRGRP))
        permissions |= QFileDevice::ReadGroup;
    if (!(mask & S_IROTH))
        permissions |= QFileDevice::ReadOther;
    return permissions;
}

} // namespace

KvRenderCommand::KvRenderCommand(const KvCliArguments &arguments, const KvCliOutput &output)
    : m_arguments(arguments)
    , m_output(output)
{}

int KvRenderCommand::run()
{
    KvCliHost host;
    ZtFault fault;
    KvCliSource templateFile;
    if (!templateFile.open(m_arguments.templatePath, &fault)) {
        m_output.error(fault);
        return 1;
    }
    if (!checkTemplate(host, templateFile.path(), templateFile.displayName()) ||
        !host.loadData(m_arguments, m_output))
        return 1;

    CliMessages messages(m_output);
    KvTemplateModel model(nullptr, &host.kernelData());
    model.setFactories(&host.blocks());
    model.setUserMessages(&messages);
    const int entriesBefore = ZtStatusLog::getInstance()->entries().size();
    if (!model.load(templateFile.path()))
        return 1;
    model.beginLiveUpdates();
    const auto endLive = qScopeGuard([&model]() { model.endLiveUpdates(); });
    const bool isPrinted = print(model);
    noteWarnings(entriesBefore);
    return isPrinted ? 0 : 1;
}

bool KvRenderCommand::checkTemplate(KvCliHost &host, const QString &path, const QString &displayName) const
{
    KvTemplateCheck check(host.blocks());
    if (!check.run(path, displayName)) {
        m_output.error(check.fault());
        return false;
    }
    for (const QString &warning : check.warnings())
        m_output.note(displayName + QStringLiteral(": ") + warning);
    return true;
}

void KvRenderCommand::noteWarnings(int firstEntry) const
{
    const QVector<ZtStatusEntry> &entries = ZtStatusLog::getInstance()->entries();
    for (int i = firstEntry; i < entries.size(); ++i) {
        if (entries.at(i).category >= ZtAppStatus::Warning)
            m_output.note(entries.at(i).message);
    }
}

bool KvRenderCommand::print(KvTemplateModel &model) const
{
    if (m_arguments.outputPath == QLatin1String("-"))
        return printThroughCopy(model);
    const QFileInfo target(m_arguments.outputPath);
    // Into devices and the like directly; a file only gets its new content when all of it is there.
    if (target.exists() && !target.isFile())
        return target.isDir() ? failToWrite(m_arguments.outputPath, tr("is a directory"))
                              : printThroughCopy(model);
    // A link stays one: what it points to is replaced.
    const QString path =
        target.isSymLink() && target.exists() ? target.canonicalFilePath() : target.absoluteFilePath();
    QTemporaryFile part(QFileInfo(path).absolutePath() + QStringLiteral("/.statreport-XXXXXX.pdf"));
    if (!part.open())
        return failToWrite(m_arguments.outputPath, ZtFileFault::text(part));
    part.close();
    if (!printToFile(model, part.fileName()))
        return false;
    QFile::setPermissions(part.fileName(), target.exists() ? target.permissions() : permissionsOfNewFiles());
    const QByteArray partName = QFile::encodeName(part.fileName());
    if (std::rename(partName.constData(), QFile::encodeName(path).constData()) != 0)
        return failToWrite(m_arguments.outputPath, ZtFileFault::text(errno));
    part.setAutoRemove(false);
    return true;
}

bool KvRenderCommand::printToFile(KvTemplateModel &model, const QString &path) const
{
    KvTerminalProgress progress(m_output);
    const bool isPrinted = model.print(path, &progress) != 0;
    progress.finish();
    if (!isPrinted || !isCompletePdf(path))
        return failToWrite(m_arguments.outputPath, tr("the file could not be written completely"));
    return true;
}

bool KvRenderCommand::printThroughCopy(KvTemplateModel &model) const
{
    const bool isStandardOutput = m_arguments.outputPath == QLatin1String("-");
    const QString name = isStandardOutput ? KvCliOutput::standardOutputName() : m_arguments.outputPath;
    QTemporaryFile part;
    if (!part.open())
        return failToWrite(name, ZtFileFault::text(part));
    if (!printToFile(model, part.fileName()))
        return false;
    QFile written(part.fileName());
    if (!written.open(QIODevice::ReadOnly))
        return failToWrite(name, ZtFileFault::text(written));
    const QByteArray bytes = written.readAll();
    if (isStandardOutput)
        return m_output.result(bytes);
    QFile target(m_arguments.outputPath);
    if (!target.open(QIODevice::WriteOnly | QIODevice::Unbuffered) || target.write(bytes) != bytes.size())
        return failToWrite(name, ZtFileFault::text(target));
    return true;
}

bool KvRenderCommand::failToWrite(const QString &path, const QString &reason) const
{
    ZtFault fault;
    fault.file = path;
    fault.message = tr("cannot be written: %1").arg(reason);
    m_output.error(fault);
    return false;
}
