// SPDX-License-Identifier: MIT
#include "KvDeskGalleryFolder.h"

#include "GalleryFolder.h"

class KvDeskGalleryFolderTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void readsInNaturalOrder();
    void namesThatDifferInTheirCasesHaveAnOrder();
    void noticesChanges();
    void waitsForTheFolder();
    void noticesThatTheFolderGoes();
    void anotherFolderForgetsTheFirst();
    void looksAgainAtNewFiles();
    void noFolder();
    void canBeDeletedWhileReading();

private:
    static QStringList names(const KvDeskGalleryFolder &folder)
    {
        QStringList names;
        for (const KvDeskGalleryEntry &entry : folder.entries())
            names.append(entry.name);
        return names;
    }

    std::unique_ptr<GalleryFolder> m_pictures;
    QString m_path;
};

void KvDeskGalleryFolderTest::init()
{
    StatReportTest::init();
    m_pictures = std::make_unique<GalleryFolder>();
    m_path = m_pictures->path;
}

void KvDeskGalleryFolderTest::readsInNaturalOrder()
{
    for (const char *name : {"image 10.png", "image 2.png", "image 1.jpg", "other.bmp"})
        m_pictures->add(QLatin1String(name));
    m_pictures->addBroken(QStringLiteral("notes.txt"));
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(m_path + QStringLiteral("/./"));
    QCOMPARE(folder.path(), m_path);
    QVERIFY(!folder.isRead());
    QVERIFY(spy.wait());
    QVERIFY(folder.isRead());
    QVERIFY(folder.exists());
    QCOMPARE(names(folder), QStringList({QStringLiteral("image 1.jpg"), QStringLiteral("image 2.png"),
                                         QStringLiteral("image 10.png"), QStringLiteral("other.bmp")}));
    QVERIFY(folder.entries().first().bytes > 0);
    QVERIFY(qAbs(folder.entries().first().changed.secsTo(QDateTime::currentDateTime())) < 60);
}

void KvDeskGalleryFolderTest::namesThatDifferInTheirCasesHaveAnOrder()
{
    for (const char *name : {"b.png", "B.png", "a.png", "A.png"})
        m_pictures->add(QLatin1String(name));
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(m_path);
    QVERIFY(spy.wait());
    const QStringList before = names(folder);
    QCOMPARE(before.mid(0, 2).join(QString()).toLower(), QStringLiteral("a.pnga.png"));
    for (int i = 0; i < 3; ++i) {
        folder.slotRefresh();
        QVERIFY(spy.wait());
        QCOMPARE(names(folder), before);
    }
}

void KvDeskGalleryFolderTest::noticesChanges()
{
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(m_path);
    QVERIFY(spy.wait());
    QCOMPARE(names(folder), QStringList());
    const QString file = m_pictures->add(QStringLiteral("new.png"));
    QTRY_COMPARE(names(folder), QStringList(QStringLiteral("new.png")));
    QVERIFY(QFile::rename(file, m_path + QStringLiteral("/renamed.png")));
    QTRY_COMPARE(names(folder), QStringList(QStringLiteral("renamed.png")));
    QVERIFY(QFile::remove(m_path + QStringLiteral("/renamed.png")));
    QTRY_COMPARE(names(folder), QStringList());
}

void KvDeskGalleryFolderTest::waitsForTheFolder()
{
    const QString deep = m_path + QStringLiteral("/one/two");
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(deep);
    QVERIFY(spy.wait());
    QVERIFY(!folder.exists());
    QVERIFY(QDir().mkpath(deep));
    m_pictures->add(QStringLiteral("one/two/a.png"));
    QTRY_COMPARE(names(folder), QStringList(QStringLiteral("a.png")));
    QVERIFY(folder.exists());
}

void KvDeskGalleryFolderTest::noticesThatTheFolderGoes()
{
    m_pictures->add(QStringLiteral("a.png"));
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(m_path);
    QVERIFY(spy.wait());
    QVERIFY(QDir(m_path).removeRecursively());
    QTRY_VERIFY(!folder.exists());
    QCOMPARE(names(folder), QStringList());
    // And that it comes back.
    QVERIFY(QDir().mkpath(m_path));
    m_pictures->add(QStringLiteral("b.png"));
    QTRY_COMPARE(names(folder), QStringList(QStringLiteral("b.png")));
}

void KvDeskGalleryFolderTest::anotherFolderForgetsTheFirst()
{
    const QString other = m_path + QStringLiteral("/other");
    QVERIFY(QDir().mkpath(other));
    m_pictures->add(QStringLiteral("a.png"));
    m_pictures->add(QStringLiteral("other/b.png"));
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(m_path);
    folder.setPath(other);
    QVERIFY(spy.wait());
    QCOMPARE(names(folder), QStringList(QStringLiteral("b.png")));
    // What the first one is read to is of no interest any more; the other may be read again.
    spy.wait(KvDeskGalleryFolder::burstInterval);
    QCOMPARE(names(folder), QStringList(QStringLiteral("b.png")));
    folder.setPath(m_path);
    QVERIFY(!folder.isRead());
    QCOMPARE(names(folder), QStringList());
}

void KvDeskGalleryFolderTest::looksAgainAtNewFiles()
{
    const QString path = m_pictures->add(QStringLiteral("growing.png"));
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(m_path);
    QVERIFY(spy.wait());
    const qint64 before = folder.entries().first().bytes;
    // Writing into a file that is there changes nothing in the folder.
    QFile file(path);
    QVERIFY(file.open(QIODevice::Append));
    file.write("more");
    file.close();
    QTRY_COMPARE(folder.entries().first().bytes, before + 4);
}

void KvDeskGalleryFolderTest::noFolder()
{
    KvDeskGalleryFolder folder;
    QSignalSpy spy(&folder, SIGNAL(signalRead()));
    folder.setPath(QString());
    folder.slotRefresh();
    QVERIFY(!spy.wait(50));
    QCOMPARE(folder.path(), QString());
}

void KvDeskGalleryFolderTest::canBeDeletedWhileReading()
{
    for (int i = 0; i < 20; ++i) {
        KvDeskGalleryFolder folder;
        folder.setPath(m_path);
    }
}

STATREPORT_TEST_MAIN(KvDeskGalleryFolderTest)
#include "KvDeskGalleryFolderTest.moc"
