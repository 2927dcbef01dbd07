// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskThumbnail.h"

#include <QCache>
#include <QObject>
#include <QSet>
#include <QVector>

#include <memory>

struct KvDeskGalleryEntry;
class QMutex;

/**
 * Loads thumbnails in threads and keeps those that were wanted last.
 *
 * What was wanted last is loaded first: the user who scrolls waits for what is in view, not for all that was.
 */
class KvDeskThumbnailLoader : public QObject
{
    Q_OBJECT
public:
    /** So many wishes are kept; older ones are forgotten. More than fit on a screen. */
    static constexpr int maximumWishes = 512;
    /** So many are loaded at a time: decoding takes memory. */
    static constexpr int maximumJobs = 2;

    explicit KvDeskThumbnailLoader(QObject *parent = nullptr);
    ~KvDeskThumbnailLoader() override;

    /** The thumbnail of a file; null while it is unknown, and then it is loaded. */
    const KvDeskThumbnail *thumbnail(const QString &folder, const KvDeskGalleryEntry &entry);
    /** The same, but nothing is loaded. */
    const KvDeskThumbnail *known(const QString &folder, const KvDeskGalleryEntry &entry) const;

    /** Forgets what is not being loaded yet. */
    void cancel();
    int wishCount() const { return m_wishes.size(); }

signals:
    void signalLoaded(QString aPath); ///< the thumbnail of a file is known

private slots:
    void slotLoaded(const QString &aKey, const QString &aPath, const KvDeskThumbnail &aThumbnail);

private:
    struct Wish
    {
        QString key;
        QString path;
    };
    struct Receiver;
    class Job;

    void startJobs();

    QCache<QString, KvDeskThumbnail> m_cache; ///< by file and state of the file; cost in kilobytes
    QVector<Wish> m_wishes;                   ///< the newest last
    QSet<QString> m_wished;                   ///< keys of wishes and running jobs
    std::shared_ptr<Receiver> m_receiver;
    int m_runningJobs = 0;
};
