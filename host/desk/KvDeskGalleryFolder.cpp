// SPDX-License-Identifier: MIT
#include "KvDeskGalleryFolder.h"

#include "measuring/ZtImageFolderSource.h"
#include "measuring/ZtWorkerThread.h"

#include <QDir>

#include <algorithm>

namespace {

QString nearestFolder(const QString &path)
{
    QString folder = path;
    while (!QFileInfo(folder).isDir()) {
        const QString above = QFileInfo(folder).path();
        if (above == folder)
            return QString();
        folder = above;
    }
    return folder;
}

} // namespace

KvDeskGalleryFolder::KvDeskGalleryFolder(QObject *parent)
    : QObject(parent)
{
    m_timer.setSingleShot(true);
    connect(&m_timer, SIGNAL(timeout()), this, SLOT(slotRefresh()));
    connect(&m_watcher, SIGNAL(directoryChanged(QString)), this, SLOT(slotChanged()));
}

KvDeskGalleryFolder::~KvDeskGalleryFolder()
{
    letGo();
}

void KvDeskGalleryFolder::letGo()
{
    if (m_thread)
        m_thread->disconnect(this);
    ZtWorkerThread::retire(std::move(m_thread));
}

void KvDeskGalleryFolder::setPath(const QString &path)
{
    const QString absolute = path.isEmpty() ? QString() : QDir::cleanPath(QFileInfo(path).absoluteFilePath());
    if (absolute == m_path)
        return;
    letGo();
    m_timer.stop();
    m_path = absolute;
    m_entries.clear();
    m_isRead = false;
    m_exists = false;
    slotRefresh();
}

void KvDeskGalleryFolder::slotRefresh()
{
    m_isStale = m_thread != nullptr;
    if (m_thread || m_path.isEmpty())
        return;
    watch();
    m_found = std::make_shared<Contents>();
    m_thread = ZtWorkerThread::create([found = m_found, path = m_path]() { *found = read(path); });
    connect(m_thread.get(), SIGNAL(finished()), this, SLOT(slotFinished()));
    m_thread->start();
}

KvDeskGalleryFolder::Contents KvDeskGalleryFolder::read(const QString &path)
{
    Contents contents;
    const QDir folder(path);
    contents.exists = folder.exists();
    const QStringList names = ZtImageFolderSource::pictureNames(path);
    contents.entries.reserve(names.size());
    for (const QString &name : names) {
        const QFileInfo file(folder, name);
        contents.entries.append({name, file.lastModified(), file.size()});
    }
    return contents;
}

void KvDeskGalleryFolder::watch()
{
    const QString folder = nearestFolder(m_path);
    if (m_watcher.directories() == QStringList(folder))
        return;
    if (!m_watcher.directories().isEmpty())
        m_watcher.removePaths(m_watcher.directories());
    if (!folder.isEmpty())
        m_watcher.addPath(folder);
}

void KvDeskGalleryFolder::slotChanged()
{
    if (!m_timer.isActive() || m_timer.remainingTime() > burstInterval)
        m_timer.start(burstInterval);
}

void KvDeskGalleryFolder::slotFinished()
{
    m_thread.reset();
    m_entries = m_found->entries;
    m_exists = m_found->exists;
    m_isRead = true;
    // It may have come, gone or been replaced meanwhile.
    watch();
    if (m_isStale)
        slotChanged();
    else if (isSettling() && !m_timer.isActive())
        m_timer.start(settleInterval);
    emit signalRead();
}

bool KvDeskGalleryFolder::isSettling() const
{
    const QDateTime recently = QDateTime::currentDateTime().addMSecs(-settleInterval);
    const auto isRecent = [&recently](const KvDeskGalleryEntry &entry) { return entry.changed > recently; };
    return std::any_of(m_entries.begin(), m_entries.end(), isRecent);
}
