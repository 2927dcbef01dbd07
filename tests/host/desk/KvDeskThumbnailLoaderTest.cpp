// SPDX-License-Identifier: MIT
#include "KvDeskThumbnailLoader.h"

#include "DeskFiles.h"
#include "KvDeskGalleryEntry.h"

#include <QSemaphore>
#include <QThreadPool>

namespace {

/// Keeps all threads of the pool busy while it lives.
class BusyPool
{
public:
    BusyPool()
    {
        for (int i = 0; i < m_count; ++i)
            QThreadPool::globalInstance()->start([gate = m_gate]() { gate->acquire(); });
    }
    ~BusyPool() { m_gate->release(m_count); }

private:
    const int m_count = QThreadPool::globalInstance()->maxThreadCount();
    const std::shared_ptr<QSemaphore> m_gate = std::make_shared<QSemaphore>();
};

} // namespace

class KvDeskThumbnailLoaderTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void loadsAndKeeps();
    void knownLoadsNothing();
    void otherContentsAreLoadedAnew();
    void newestFirst();
    void asksOnce();
    void tooManyWishesForgetTheOldest();
    void cancelled();
    void deletedWhileLoading();

private:
    KvDeskGalleryEntry entry(const QString &name, const QSize &size = QSize(40, 30))
    {
        const QFileInfo file(DeskFiles::image(name, size));
        m_folder = file.path();
        return {file.fileName(), file.lastModified(), file.size()};
    }

    QString m_folder;
    std::unique_ptr<KvDeskThumbnailLoader> m_loader;
};

void KvDeskThumbnailLoaderTest::init()
{
    StatReportTest::init();
    m_loader = std::make_unique<KvDeskThumbnailLoader>();
}

void KvDeskThumbnailLoaderTest::cleanup()
{
    m_loader.reset();
    QThreadPool::globalInstance()->waitForDone();
    StatReportTest::cleanup();
}

void KvDeskThumbnailLoaderTest::loadsAndKeeps()
{
    const KvDeskGalleryEntry a = entry(QStringLiteral("a.png"));
    QSignalSpy spy(m_loader.get(), SIGNAL(signalLoaded(QString)));
    QVERIFY(!m_loader->thumbnail(m_folder, a));
    QVERIFY(spy.wait());
    QCOMPARE(spy.first().first().toString(), m_folder + QStringLiteral("/a.png"));
    const KvDeskThumbnail *const found = m_loader->thumbnail(m_folder, a);
    QVERIFY(found);
    QCOMPARE(found->size, QSize(40, 30));
    QVERIFY(!spy.wait(50));
}

void KvDeskThumbnailLoaderTest::knownLoadsNothing()
{
    const KvDeskGalleryEntry a = entry(QStringLiteral("known.png"));
    QSignalSpy spy(m_loader.get(), SIGNAL(signalLoaded(QString)));
    QVERIFY(!m_loader->known(m_folder, a));
    QVERIFY(!spy.wait(50));
    m_loader->thumbnail(m_folder, a);
    QVERIFY(spy.wait());
    QVERIFY(m_loader->known(m_folder, a));
}

void KvDeskThumbnailLoaderTest::otherContentsAreLoadedAnew()
{
    QSignalSpy spy(m_loader.get(), SIGNAL(signalLoaded(QString)));
    const KvDeskGalleryEntry before = entry(QStringLiteral("changing.png"));
    m_loader->thumbnail(m_folder, before);
    QVERIFY(spy.wait());
    const KvDeskGalleryEntry after = entry(QStringLiteral("changing.png"), QSize(80, 60));
    QVERIFY(!m_loader->thumbnail(m_folder, after));
    QVERIFY(spy.wait());
    QCOMPARE(m_loader->thumbnail(m_folder, after)->size, QSize(80, 60));
}

void KvDeskThumbnailLoaderTest::newestFirst()
{
    QVector<KvDeskGalleryEntry> entries;
    for (int i = 0; i < 6; ++i)
        entries.append(entry(QStringLiteral("order %1.png").arg(i)));
    QSignalSpy spy(m_loader.get(), SIGNAL(signalLoaded(QString)));
    {
        const BusyPool busy;
        for (const KvDeskGalleryEntry &wished : qAsConst(entries))
            m_loader->thumbnail(m_folder, wished);
        QCOMPARE(m_loader->wishCount(), 6 - KvDeskThumbnailLoader::maximumJobs);
    }
    QTRY_COMPARE(spy.count(), 6);
    // The first ones were started when there was nothing else to do.
    const QString third = spy.at(KvDeskThumbnailLoader::maximumJobs).first().toString();
    QVERIFY2(third.endsWith(QStringLiteral("order 5.png")) || third.endsWith(QStringLiteral("order 4.png")),
             qPrintable(third));
    QVERIFY(!spy.last().first().toString().endsWith(QStringLiteral("order 5.png")));
}

void KvDeskThumbnailLoaderTest::asksOnce()
{
    const KvDeskGalleryEntry a = entry(QStringLiteral("once.png"));
    QSignalSpy spy(m_loader.get(), SIGNAL(signalLoaded(QString)));
    for (int i = 0; i < 5; ++i)
        m_loader->thumbnail(m_folder, a);
    QVERIFY(spy.wait());
    QVERIFY(!spy.wait(50));
    QCOMPARE(spy.count(), 1);
}

void KvDeskThumbnailLoaderTest::tooManyWishesForgetTheOldest()
{
    const BusyPool busy;
    const KvDeskGalleryEntry real = entry(QStringLiteral("many.png"));
    const int count = KvDeskThumbnailLoader::maximumWishes + KvDeskThumbnailLoader::maximumJobs + 10;
    for (int i = 0; i < count; ++i)
        m_loader->thumbnail(m_folder, {QStringLiteral("none %1.png").arg(i), real.changed, i});
    QCOMPARE(m_loader->wishCount(), static_cast<int>(KvDeskThumbnailLoader::maximumWishes));
    // One that was forgotten can be wished again.
    m_loader->thumbnail(m_folder, {QStringLiteral("none %1.png").arg(KvDeskThumbnailLoader::maximumJobs),
                                   real.changed, KvDeskThumbnailLoader::maximumJobs});
    QCOMPARE(m_loader->wishCount(), static_cast<int>(KvDeskThumbnailLoader::maximumWishes));
    m_loader->cancel();
}

void KvDeskThumbnailLoaderTest::cancelled()
{
    QVector<KvDeskGalleryEntry> entries;
    for (int i = 0; i < 10; ++i)
        entries.append(entry(QStringLiteral("cancel %1.png").arg(i)));
    QSignalSpy spy(m_loader.get(), SIGNAL(signalLoaded(QString)));
    {
        const BusyPool busy;
        for (const KvDeskGalleryEntry &wished : qAsConst(entries))
            m_loader->thumbnail(m_folder, wished);
        m_loader->cancel();
        QCOMPARE(m_loader->wishCount(), 0);
    }
    // Those that were running already end.
    QTRY_COMPARE(spy.count(), static_cast<int>(KvDeskThumbnailLoader::maximumJobs));
    QVERIFY(!spy.wait(50));
    m_loader->thumbnail(m_folder, entries.last());
    QVERIFY(spy.wait());
}

void KvDeskThumbnailLoaderTest::deletedWhileLoading()
{
    const KvDeskGalleryEntry a = entry(QStringLiteral("late.png"), QSize(2000, 2000));
    m_loader->thumbnail(m_folder, a);
    m_loader.reset();
    QThreadPool::globalInstance()->waitForDone();
    QCoreApplication::processEvents();
}

STATREPORT_TEST_MAIN(KvDeskThumbnailLoaderTest)
#include "KvDeskThumbnailLoaderTest.moc"
