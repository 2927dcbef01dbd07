// SPDX-License-Identifier: MIT
#include "KvDeskGallerySettings.h"

#include "kernel/ZtAppSettings.h"
#include "support/StatReportTest.h"

#include <QStandardPaths>

class KvDeskGallerySettingsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void defaults();
    void snapshotsFolder();
    void lastFolderIsFirst();
    void foldersAreFew();
    void measurements();
};

void KvDeskGallerySettingsTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void KvDeskGallerySettingsTest::defaults()
{
    QCOMPARE(KvDeskGallerySettings::snapshotsFolder(),
             QStandardPaths::writableLocation(QStandardPaths::PicturesLocation) +
                 QStringLiteral("/Measuring Desk"));
    QCOMPARE(KvDeskGallerySettings::folder(), KvDeskGallerySettings::snapshotsFolder());
    QCOMPARE(KvDeskGallerySettings::folders(), QStringList());
    QVERIFY(!KvDeskGallerySettings::areMeasurementsBurntIn());
}

void KvDeskGallerySettingsTest::snapshotsFolder()
{
    KvDeskGallerySettings::setSnapshotsFolder(QStringLiteral("/x/../y/"));
    QCOMPARE(KvDeskGallerySettings::snapshotsFolder(), QStringLiteral("/y"));
    QCOMPARE(KvDeskGallerySettings::folder(), QStringLiteral("/y"));
}

void KvDeskGallerySettingsTest::lastFolderIsFirst()
{
    KvDeskGallerySettings::setFolder(QStringLiteral("/a"));
    KvDeskGallerySettings::setFolder(QStringLiteral("/b/"));
    KvDeskGallerySettings::setFolder(KvDeskGallerySettings::snapshotsFolder());
    QCOMPARE(KvDeskGallerySettings::folder(), KvDeskGallerySettings::snapshotsFolder());
    QCOMPARE(KvDeskGallerySettings::folders(), QStringList({QStringLiteral("/b"), QStringLiteral("/a")}));
    KvDeskGallerySettings::setFolder(QStringLiteral("/a"));
    QCOMPARE(KvDeskGallerySettings::folder(), QStringLiteral("/a"));
    QCOMPARE(KvDeskGallerySettings::folders(), QStringList({QStringLiteral("/a"), QStringLiteral("/b")}));
}

void KvDeskGallerySettingsTest::foldersAreFew()
{
    for (int i = 0; i < 20; ++i)
        KvDeskGallerySettings::setFolder(QStringLiteral("/%1").arg(i));
    KvDeskGallerySettings::setFolder(KvDeskGallerySettings::snapshotsFolder());
    QCOMPARE(KvDeskGallerySettings::folders().size(),
             static_cast<int>(KvDeskGallerySettings::maximumFolders));
    QCOMPARE(KvDeskGallerySettings::folders().first(), QStringLiteral("/19"));
}

void KvDeskGallerySettingsTest::measurements()
{
    KvDeskGallerySettings::setMeasurementsBurntIn(true);
    QVERIFY(KvDeskGallerySettings::areMeasurementsBurntIn());
}

STATREPORT_TEST_MAIN(KvDeskGallerySettingsTest)
#include "KvDeskGallerySettingsTest.moc"
