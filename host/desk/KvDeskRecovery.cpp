// SPDX-License-Identifier: MIT
#include "KvDeskRecovery.h"

#include "KvDeskFileCommands.h"
#include "KvDeskSession.h"
#include "kernel/ZtLeftToRight.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QLocale>
#include <QLockFile>

#include <algorithm>

namespace {

const QString lockSuffix = QStringLiteral(".lock");

} // namespace

/// A copy with its lock.
struct KvDeskRecovery::Copy
{
    KvDeskRecoveryFile header;
    QString file;
    std::unique_ptr<QLockFile> lock;
};

KvDeskRecovery::KvDeskRecovery(KvDeskSession *session, KvDeskFileCommands *files, QObject *parent)
    : QObject(parent)
    , m_session(session)
    , m_files(files)
{
    connect(session, SIGNAL(signalReplaced()), this, SLOT(slotSessionReplaced()));
    connect(session, SIGNAL(signalStateChanged()), this, SLOT(slotSessionStateChanged()));
}

KvDeskRecovery::~KvDeskRecovery() = default;

// Null when the program that wrote the copy is running, or another one offers it.
std::unique_ptr<QLockFile> KvDeskRecovery::lock(const QString &file)
{
    auto lock = std::make_unique<QLockFile>(file + lockSuffix);
    lock->setStaleLockTime(0);
    if (!lock->tryLock(0))
        lock.reset();
    return lock;
}

void KvDeskRecovery::find(const QString &folder)
{
    clearAway(folder);
    const QString pattern = QLatin1Char('*') + KvDeskRecoveryFile::suffix();
    for (const QFileInfo &info : QDir(folder).entryInfoList({pattern}, QDir::Files)) {
        auto copy = std::make_unique<Copy>();
        copy->file = info.absoluteFilePath();
        copy->lock = lock(copy->file);
        if (copy->lock && copy->header.readHeader(copy->file))
            m_found.push_back(std::move(copy));
    }
    std::stable_sort(m_found.begin(), m_found.end(),
                     [](const auto &a, const auto &b) { return a->header.time > b->header.time; });
    emit signalChanged();
}

// A program that is killed leaves its lock, and maybe the beginning of a copy under a temporary name.
void KvDeskRecovery::clearAway(const QString &folder)
{
    const QDir dir(folder);
    const QString suffix = KvDeskRecoveryFile::suffix();
    for (const QString &name : dir.entryList({QStringLiteral("*%1.*").arg(suffix)}, QDir::Files)) {
        const int end = name.lastIndexOf(suffix) + suffix.size();
        const std::unique_ptr<QLockFile> owner = lock(dir.filePath(name.left(end)));
        if (owner && !name.endsWith(lockSuffix))
            QFile::remove(dir.filePath(name));
    }
}

const KvDeskRecoveryFile &KvDeskRecovery::at(int index) const
{
    return m_found.at(static_cast<std::size_t>(index))->header;
}

QString KvDeskRecovery::describe(int index) const
{
    const KvDeskRecoveryFile &header = at(index);
    const QString name = header.sessionPath.isEmpty()
                             ? tr("Untitled session")
                             : ZtLeftToRight::isolated(QFileInfo(header.sessionPath).fileName());
    //: %1 is the name of a session
    return tr("%1 (%n object(s))", "", header.objectCount).arg(name);
}

bool KvDeskRecovery::restore(int index)
{
    const auto position = m_found.begin() + index;
    if (!m_files->restoreSession((*position)->file, (*position)->header))
        return false;
    m_restored.push_back(std::move(*position));
    m_found.erase(position);
    emit signalChanged();
    return true;
}

void KvDeskRecovery::discard(int index)
{
    const auto position = m_found.begin() + index;
    remove(position->get());
    m_found.erase(position);
    emit signalChanged();
}

void KvDeskRecovery::end()
{
    disconnect(m_session, nullptr, this, nullptr);
    removeRestored();
}

void KvDeskRecovery::remove(Copy *copy)
{
    QFile::remove(copy->file);
    copy->lock->unlock();
}

void KvDeskRecovery::removeRestored()
{
    for (const std::unique_ptr<Copy> &copy : m_restored)
        remove(copy.get());
    m_restored.clear();
}

void KvDeskRecovery::slotSessionReplaced()
{
    removeRestored();
}

void KvDeskRecovery::slotSessionStateChanged()
{
    if (!m_session->isModified())
        removeRestored();
}
