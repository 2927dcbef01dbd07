// SPDX-License-Identifier: MIT
#include "KvDeskThumbnailLoader.h"

#include "KvDeskGalleryEntry.h"
#include "KvDeskThumbnailReader.h"

#include <QGuiApplication>
#include <QMutex>
#include <QRunnable>
#include <QThreadPool>

namespace {

constexpr int cacheKilobytes = 128 * 1024;

QString pathOf(const QString &folder, const KvDeskGalleryEntry &entry)
{
    return folder + QLatin1Char('/') + entry.name;
}

QString keyOf(const QString &folder, const KvDeskGalleryEntry &entry)
{
    return QStringLiteral("%1|%2|%3")
        .arg(pathOf(folder, entry))
        .arg(entry.changed.toMSecsSinceEpoch())
        .arg(entry.bytes);
}

/// Sharp on every screen, of which there may be several.
QSize largestThumbnail()
{
    constexpr double usualRatio = 2.0;
    return KvDeskThumbnailReader::usual * qMax(1.0, qGuiApp->devicePixelRatio() / usualRatio);
}

} // namespace

/// Whom jobs report to, who may die while they run.
struct KvDeskThumbnailLoader::Receiver
{
    QMutex mutex;
    QObject *loader = nullptr;
};

class KvDeskThumbnailLoader::Job : public QRunnable
{
public:
    Job(const Wish &wish, std::shared_ptr<Receiver> receiver)
        : m_wish(wish)
        , m_largest(largestThumbnail())
        , m_receiver(std::move(receiver))
    {}

    void run() override
    {
        if (!isWanted())
            return;
        const KvDeskThumbnail thumbnail = KvDeskThumbnailReader::read(m_wish.path, m_largest);
        const QMutexLocker locker(&m_receiver->mutex);
        if (m_receiver->loader)
            QMetaObject::invokeMethod(m_receiver->loader, "slotLoaded", Qt::QueuedConnection,
                                      Q_ARG(QString, m_wish.key), Q_ARG(QString, m_wish.path),
                                      Q_ARG(KvDeskThumbnail, thumbnail));
    }

private:
    bool isWanted() const
    {
        const QMutexLocker locker(&m_receiver->mutex);
        return m_receiver->loader != nullptr;
    }

    Wish m_wish;
    QSize m_largest;
    std::shared_ptr<Receiver> m_receiver;
};

KvDeskThumbnailLoader::KvDeskThumbnailLoader(QObject *parent)
    : QObject(parent)
    , m_cache(cacheKilobytes)
    , m_receiver(std::make_shared<Receiver>())
{
    qRegisterMetaType<KvDeskThumbnail>("KvDeskThumbnail");
    m_receiver->loader = this;
}

KvDeskThumbnailLoader::~KvDeskThumbnailLoader()
{
    const QMutexLocker locker(&m_receiver->mutex);
    m_receiver->loader = nullptr;
}

const KvDeskThumbnail *KvDeskThumbnailLoader::known(const QString &folder,
                                                    const KvDeskGalleryEntry &entry) const
{
    return m_cache.object(keyOf(folder, entry));
}

const KvDeskThumbnail *KvDeskThumbnailLoader::thumbnail(const QString &folder,
                                                        const KvDeskGalleryEntry &entry)
{
    const QString key = keyOf(folder, entry);
    if (const KvDeskThumbnail *const found = m_cache.object(key))
        return found;
    if (!m_wished.contains(key)) {
        m_wished.insert(key);
        m_wishes.append({key, pathOf(folder, entry)});
        if (m_wishes.size() > maximumWishes)
            m_wished.remove(m_wishes.takeFirst().key);
        startJobs();
    }
    return nullptr;
}

void KvDeskThumbnailLoader::cancel()
{
    for (const Wish &wish : qAsConst(m_wishes))
        m_wished.remove(wish.key);
    m_wishes.clear();
}

void KvDeskThumbnailLoader::startJobs()
{
    while (m_runningJobs < maximumJobs && !m_wishes.isEmpty()) {
        ++m_runningJobs;
        QThreadPool::globalInstance()->start(new Job(m_wishes.takeLast(), m_receiver));
    }
}

void KvDeskThumbnailLoader::slotLoaded(const QString &aKey, const QString &aPath,
                                       const KvDeskThumbnail &aThumbnail)
{
    --m_runningJobs;
    m_wished.remove(aKey);
    const auto kilobytes = static_cast<int>(1 + aThumbnail.image.sizeInBytes() / 1024);
    m_cache.insert(aKey, new KvDeskThumbnail(aThumbnail), kilobytes);
    startJobs();
    emit signalLoaded(aPath);
}
