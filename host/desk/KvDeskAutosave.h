// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtSession.h"

#include <QElapsedTimer>
#include <QLockFile>
#include <QObject>
#include <QPointer>
#include <QString>
#include <QTimer>

#include <memory>

class KvDeskSession;
class ZtWorkerThread;

/**
 * Keeps a copy of what would be lost if the program ended now. The copy is written some seconds after a
 * change, by another thread, and goes when the session is saved or replaced, or the program ends in order.
 *
 * Every running program has a copy of its own. As long as it lives it holds a lock beside it; a copy without
 * anybody who holds its lock is what KvDeskRecovery finds.
 */
class KvDeskAutosave : public QObject
{
    Q_OBJECT
public:
    static constexpr int standardDelayMs = 3000;

    /** \a session may die first. The folder is made when it is needed. */
    KvDeskAutosave(KvDeskSession *session, const QString &folder, QObject *parent = nullptr);
    /** Unless end() was called, unsaved changes stay in the copy, to the very last. */
    ~KvDeskAutosave() override;

    /**
     * Time from a change to the copy that has it, which is also the time between two copies of a session that
     * changes all the time. It is longer for large sessions, so that making copies takes a small part of it.
     */
    void setDelay(int milliseconds) { m_delayMs = milliseconds; }
    QString file() const { return m_file; }
    bool isWriting() const { return m_thread != nullptr; }

    /** The user has decided about all changes: there is nothing to copy from now on. */
    void end();

signals:
    void signalWritten();

private slots:
    void slotChanged();
    void slotStateChanged();
    void slotWrite();
    void slotFinished();

private:
    struct Job;

    bool claim();
    std::shared_ptr<Job> makeJob();
    int interval() const;
    void removeCopy();
    void report(const QString &reason);

    QPointer<KvDeskSession> m_session;
    QString m_folder;
    QString m_file;
    QLockFile m_lock;
    QTimer m_timer;
    int m_delayMs = standardDelayMs;
    qint64 m_snapshotMs = 0; ///< how long the last copy held the interface up
    qint64 m_writeMs = 0;
    quint64 m_copiedChange = 0; ///< KvDeskSession::changeCount() of the last copy
    bool m_isEnded = false;
    bool m_isFaultReported = false;
    std::shared_ptr<Job> m_job;
    std::unique_ptr<ZtWorkerThread> m_thread;
};
