// SPDX-License-Identifier: MIT
#include "KvDeskRecentFiles.h"

#include "kernel/ZtAppSettings.h"
#include "support/StatReportTest.h"

class KvDeskRecentFilesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void newestComesFirst();
    void keepsTheNewest();
    void pathsAreAbsolute();
    void removesAndClears();
};

void KvDeskRecentFilesTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvDeskRecentFilesTest::newestComesFirst()
{
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList());
    KvDeskRecentFiles::add(QStringLiteral("/a.json"));
    KvDeskRecentFiles::add(QStringLiteral("/b.json"));
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList({QStringLiteral("/b.json"), QStringLiteral("/a.json")}));
    KvDeskRecentFiles::add(QStringLiteral("/a.json"));
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList({QStringLiteral("/a.json"), QStringLiteral("/b.json")}));
}

void KvDeskRecentFilesTest::keepsTheNewest()
{
    for (int i = 0; i < 12; ++i)
        KvDeskRecentFiles::add(QStringLiteral("/%1.json").arg(i));
    QCOMPARE(KvDeskRecentFiles::paths().size(), KvDeskRecentFiles::maximumCount);
    QCOMPARE(KvDeskRecentFiles::paths().first(), QStringLiteral("/11.json"));
    QCOMPARE(KvDeskRecentFiles::paths().last(), QStringLiteral("/4.json"));
}

void KvDeskRecentFilesTest::pathsAreAbsolute()
{
    KvDeskRecentFiles::add(QStringLiteral("a.json"));
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList(QFileInfo(QStringLiteral("a.json")).absoluteFilePath()));
}

void KvDeskRecentFilesTest::removesAndClears()
{
    for (const char *path : {"/a.json", "/b.json", "/c.json"})
        KvDeskRecentFiles::add(QLatin1String(path));
    KvDeskRecentFiles::remove(QStringLiteral("/b.json"));
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList({QStringLiteral("/c.json"), QStringLiteral("/a.json")}));
    KvDeskRecentFiles::clear();
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList());
}

STATREPORT_TEST_MAIN(KvDeskRecentFilesTest)
#include "KvDeskRecentFilesTest.moc"
