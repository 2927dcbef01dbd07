// SPDX-License-Identifier: MIT
#include "measuring/ZtSafeFile.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtPartFile.h"
#include "measuring/ZtProgress.h"

#include <QFile>
#include <QFileInfo>

#ifdef Q_OS_WIN
#include <io.h>
#else
#include <fcntl.h>
#include <unistd.h>
#endif

namespace {

constexpr int portion = 1024 * 1024;

bool fail(const QString &message, ZtFault *fault)
{
    fault->message = message;
    return false;
}

// Opened, not asked: permissions on paper say little about network folders and changed users.
bool isWriteProtected(const QString &path)
{
    QFile file(path);
    return QFileInfo(path).isFile() && !file.open(QIODevice::Append);
}

// The contents have to be on the disk before the name is: a name alone would be an empty file after the end
// of the power. File systems that cannot do this say so, and need no answer.
void syncFile(int handle)
{
#ifdef Q_OS_WIN
    _commit(handle);
#else
    fsync(handle);
#endif
}

void syncFolder(const QString &folder)
{
#ifdef Q_OS_WIN
    Q_UNUSED(folder)
#else
    const int handle = open(QFile::encodeName(folder).constData(), O_RDONLY);
    if (handle < 0)
        return;
    fsync(handle);
    close(handle);
#endif
}

} // namespace

bool ZtSafeFile::writeBytes(QFile *file, const QByteArray &bytes, ZtProgress *progress)
{
    for (int at = 0; at < bytes.size(); at += portion) {
        const int count = qMin(portion, bytes.size() - at);
        if (ZtProgress::isCancelled(progress) || file->write(bytes.constData() + at, count) != count)
            return false;
        if (progress)
            progress->setDone(static_cast<double>(at + count) / bytes.size());
    }
    return file->flush();
}

bool ZtSafeFile::write(const QString &path, const QByteArray &bytes, ZtFault *fault, ZtProgress *progress)
{
    *fault = ZtFault();
    fault->file = path;
    if (isWriteProtected(path))
        return fail(tr("The file is write-protected"), fault);
    ZtPartFile part(path);
    bool isWritten = part.open() && writeBytes(part.file(), bytes, progress);
    if (isWritten) {
        syncFile(part.file()->handle());
        isWritten = (!progress || progress->commit()) && part.commit();
    }
    if (ZtProgress::isCancelled(progress))
        return fail(tr("Writing was cancelled"), fault);
    if (!isWritten)
        return fail(tr("The file cannot be written (%1)").arg(part.errorString()), fault);
    syncFolder(QFileInfo(path).absolutePath());
    ZtPartFile::removeStale(path);
    return true;
}
