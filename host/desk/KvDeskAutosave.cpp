// SPDX-License-Identifier: MIT
#include "KvDeskAutosave.h"

#include "KvDeskRecoveryFile.h"
#include "KvDeskSession.h"
#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtWorkerThread.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QUuid>

#include <atomic>

namespace {

// Shares of the time: taking the snapshot stops the interface, writing it only keeps a processor busy.
constexpr int snapshotShare = 20;
constexpr int writeShare = 3;

QString newFile(const QString &folder)
{
    return QDir(folder).absoluteFilePath(QStringLiteral("%1-%2%3")
                                             .arg(QCoreApplication::applicationPid())
                                             .arg(QUuid::createUuid().toString(QUuid::Id128))
                                             .arg(KvDeskRecoveryFile::suffix()));
}

} // namespace

/// What the other thread works with; it may outlive the autosave.
struct KvDeskAutosave::Job
{
    ZtSession session;
    KvDeskRecoveryFile header;
    QString file;
    ZtProgress progress;
    ZtFault fault;
    bool isWritten = false;
    qint64 writeMs = 0;
    std::atomic<bool> isDone{false};

    void write()
    {
        QElapsedTimer clock;
        clock.start();
        isWritten = header.write(file, session, &fault, &progress);
        writeMs = clock.elapsed();
        isDone = true;
    }
};

KvDeskAutosave::KvDeskAutosave(KvDeskSession *session, const QString &folder, QObject *parent)
    : QObject(parent)
    , m_session(session)
    , m_folder(folder)
    , m_file(newFile(folder))
    , m_lock(m_file + QStringLiteral(".lock"))
{
    // Age says nothing: a program may run for weeks.
    m_lock.setStaleLockTime(0);
    m_timer.setSingleShot(true);
    connect(&m_timer, SIGNAL(timeout()), this, SLOT(slotWrite()));
    connect(session, SIGNAL(signalChanged()), this, SLOT(slotChanged()));
    connect(session, SIGNAL(signalStateChanged()), this, SLOT(slotStateChanged()));
    if (session->isModified())
        slotChanged();
}

KvDeskAutosave::~KvDeskAutosave()
{
    const bool isModified = !m_isEnded && m_session && m_session->isModified();
    if (m_thread)
        m_thread->wait();
    if (isModified && m_session->changeCount() != m_copiedChange && claim())
        makeJob()->write();
    if (!isModified)
        removeCopy();
}

void KvDeskAutosave::end()
{
    m_isEnded = true;
    m_timer.stop();
    removeCopy();
}

int KvDeskAutosave::interval() const
{
    const qint64 longest = qMax(m_snapshotMs * snapshotShare, m_writeMs * writeShare);
    return static_cast<int>(qBound<qint64>(m_delayMs, longest, 60 * 1000));
}

void KvDeskAutosave::slotChanged()
{
    // Not put off by later changes; while one copy is written, the next waits.
    if (!m_isEnded && !m_thread && !m_timer.isActive())
        m_timer.start(interval());
}

void KvDeskAutosave::slotStateChanged()
{
    if (m_session->isModified()) {
        slotChanged();
        return;
    }
    m_timer.stop();
    removeCopy();
}

bool KvDeskAutosave::claim()
{
    if (m_lock.isLocked())
        return true;
    // Measured values and names are nobody else's business.
    if (QDir().mkpath(m_folder))
        QFile::setPermissions(m_folder, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    if (m_lock.tryLock(0))
        return true;
    report(tr("the folder \"%1\" cannot be written")
               .arg(ZtLeftToRight::isolated(QDir::toNativeSeparators(m_folder))));
    return false;
}

std::shared_ptr<KvDeskAutosave::Job> KvDeskAutosave::makeJob()
{
    const auto job = std::make_shared<Job>();
    job->session = m_session->document()->toSession();
    job->file = m_file;
    job->header.sessionPath = m_session->path();
    job->header.sessionStamp = m_session->fileStamp();
    job->header.time = QDateTime::currentDateTimeUtc();
    job->header.objectCount = m_session->objectCount();
    return job;
}

void KvDeskAutosave::slotWrite()
{
    if (!m_session || !m_session->isModified() || m_thread || !claim())
        return;
    QElapsedTimer clock;
    clock.start();
    m_job = makeJob();
    m_copiedChange = m_session->changeCount();
    m_snapshotMs = clock.elapsed();
    m_thread = ZtWorkerThread::create([job = m_job]() { job->write(); });
    connect(m_thread.get(), SIGNAL(finished()), this, SLOT(slotFinished()));
    m_thread->start();
}

void KvDeskAutosave::slotFinished()
{
    // The end of one that was given up may arrive late.
    if (!m_thread || !m_job->isDone)
        return;
    // Later: it is still the sender.
    m_thread.release()->deleteLater();
    const std::shared_ptr<Job> job = std::move(m_job);
    m_writeMs = job->writeMs;
    if (job->isWritten) {
        m_isFaultReported = false;
        emit signalWritten();
    } else {
        m_copiedChange = 0;
        report(job->fault.text());
    }
    if (m_session && m_session->isModified() && m_session->changeCount() != m_copiedChange)
        slotChanged();
}

// One that is being written must not come after it was removed.
void KvDeskAutosave::removeCopy()
{
    if (m_thread) {
        m_thread->disconnect(this);
        if (!m_job->progress.cancel())
            m_thread->wait();
        ZtWorkerThread::retire(std::move(m_thread));
        m_job.reset();
    }
    m_copiedChange = 0;
    if (!m_lock.isLocked())
        return;
    QFile::remove(m_file);
    m_lock.unlock();
}

void KvDeskAutosave::report(const QString &reason)
{
    if (m_isFaultReported)
        return;
    m_isFaultReported = true;
    KvDeskStatus::log(ZtAppStatus::Warning, tr("Unsaved changes are not being copied: %1").arg(reason),
                      QStringLiteral("KvDeskAutosave::slotWrite"));
}
