// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskGalleryEntry.h"

#include <QFileSystemWatcher>
#include <QObject>
#include <QTimer>
#include <QVector>

#include <memory>

class ZtWorkerThread;

/**
 * The pictures of a folder in the natural order of their names, kept up to date while others add and remove
 * files.
 *
 * The folder is read in a thread, as it may be large or far away. It need not exist yet: then the nearest
 * folder above it is watched until it does.
 */
class KvDeskGalleryFolder : public QObject
{
    Q_OBJECT
public:
    /** Changes come in bursts: the folder is read so many milliseconds after the first of them. */
    static constexpr int burstInterval = 200;
    /** A file that was written less than so many milliseconds ago may still grow, of which nobody tells; the
     * folder is read again then. */
    static constexpr int settleInterval = 2000;

    explicit KvDeskGalleryFolder(QObject *parent = nullptr);
    ~KvDeskGalleryFolder() override;

    /** Shows another folder; its entries come later. An empty path stands for none. */
    void setPath(const QString &path);
    QString path() const { return m_path; } ///< absolute

    const QVector<KvDeskGalleryEntry> &entries() const { return m_entries; }
    /** Whether the folder was read since it was set. */
    bool isRead() const { return m_isRead; }
    /** Whether there was such a folder when it was read. */
    bool exists() const { return m_exists; }

public slots:
    void slotRefresh(); ///< reads the folder again

signals:
    void signalRead(); ///< entries() and exists() are up to date

private slots:
    void slotChanged();
    void slotFinished();

private:
    struct Contents
    {
        QVector<KvDeskGalleryEntry> entries;
        bool exists = false;
    };

    static Contents read(const QString &path);
    void letGo();
    void watch();
    bool isSettling() const;

    QString m_path;
    QVector<KvDeskGalleryEntry> m_entries;
    QFileSystemWatcher m_watcher;
    QTimer m_timer;
    std::shared_ptr<Contents> m_found; ///< belongs to the thread until it ends
    std::unique_ptr<ZtWorkerThread> m_thread;
    bool m_isRead = false;
    bool m_exists = false;
    bool m_isStale = false; ///< something changed while the folder was read
};
