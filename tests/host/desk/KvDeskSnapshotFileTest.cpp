// SPDX-License-Identifier: MIT
#include "KvDeskSnapshotFile.h"

#include "GalleryFolder.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtStillImageSource.h"
#include "support/UnprivilegedUser.h"

class KvDeskSnapshotFileTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void unusedNames();
    void pixelSize_data();
    void pixelSize();
    void unknownPixelSize_data();
    void unknownPixelSize();
    void makesTheFolder();
    void failures_data();
    void failures();
    void replacesNothingWhenItFails();
};

void KvDeskSnapshotFileTest::unusedNames()
{
    const GalleryFolder folder;
    const QDateTime time(QDate(2026, 11, 21), QTime(7, 5, 9));
    const QString base = folder.path + QStringLiteral("/2026-11-21 07-05-09");
    QCOMPARE(KvDeskSnapshotFile::unusedPath(folder.path, time, {}), base + QStringLiteral(".png"));
    folder.add(QStringLiteral("2026-11-21 07-05-09.png"));
    QCOMPARE(KvDeskSnapshotFile::unusedPath(folder.path, time, {}), base + QStringLiteral(" (2).png"));
    QCOMPARE(KvDeskSnapshotFile::unusedPath(folder.path, time, {base + QStringLiteral(" (2).png")}),
             base + QStringLiteral(" (3).png"));
}

void KvDeskSnapshotFileTest::pixelSize_data()
{
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("y");
    QTest::newRow("coarse") << 12.5 << 12.5;
    QTest::newRow("fine") << 0.065 << 0.065;
    QTest::newRow("not square") << 2.0 << 2.5;
    QTest::newRow("millimetres") << 1000.0 << 1000.0;
}

void KvDeskSnapshotFileTest::pixelSize()
{
    QFETCH(double, x);
    QFETCH(double, y);
    QImage image(40, 30, QImage::Format_RGB32);
    image.fill(Qt::red);
    KvDeskSnapshotFile::setPixelSize(&image, ZtCalibration(x, y));
    const QString path = temporaryPath(QStringLiteral("sized.png"));
    ZtFault fault;
    QVERIFY(KvDeskSnapshotFile::save(image, path, &fault));
    const auto read = ZtStillImageSource::load(path, &fault);
    QVERIFY(read);
    QVERIFY(read->offeredCalibration().hasNearlySamePixelSize(ZtCalibration(x, y)));
    QCOMPARE(read->frame().pixelColor(3, 3), QColor(Qt::red));
}

void KvDeskSnapshotFileTest::unknownPixelSize_data()
{
    QTest::addColumn<double>("micrometres");
    QTest::newRow("uncalibrated") << 0.0;
    QTest::newRow("too small to be stated") << 1e-4;
    QTest::newRow("too large to be stated") << 3e6;
}

void KvDeskSnapshotFileTest::unknownPixelSize()
{
    QFETCH(double, micrometres);
    QImage image(40, 30, QImage::Format_RGB32);
    image.fill(Qt::red);
    // What the picture's own file said does not hold any more.
    image.setDotsPerMeterX(80000);
    image.setDotsPerMeterY(80000);
    KvDeskSnapshotFile::setPixelSize(&image, ZtCalibration(micrometres));
    const QString path = temporaryPath(QStringLiteral("unsized.png"));
    ZtFault fault;
    QVERIFY(KvDeskSnapshotFile::save(image, path, &fault));
    const auto read = ZtStillImageSource::load(path, &fault);
    QVERIFY(read);
    QVERIFY(!read->offeredCalibration().isCalibrated());
}

void KvDeskSnapshotFileTest::makesTheFolder()
{
    const GalleryFolder folder;
    const QString path = folder.path + QStringLiteral("/a/b/c.png");
    ZtFault fault;
    QVERIFY(KvDeskSnapshotFile::save(QImage(4, 4, QImage::Format_RGB32), path, &fault));
    QVERIFY(fault.isNull());
    QVERIFY(QFile::exists(path));
}

void KvDeskSnapshotFileTest::failures_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("hasImage");
    QTest::newRow("no image") << "x.png" << false;
    QTest::newRow("folder is a file") << "file.png/x.png" << true;
    QTest::newRow("name is a folder") << "folder" << true;
}

void KvDeskSnapshotFileTest::failures()
{
    QFETCH(QString, name);
    QFETCH(bool, hasImage);
    const GalleryFolder folder;
    folder.add(QStringLiteral("file.png"));
    QVERIFY(QDir(folder.path).mkdir(QStringLiteral("folder")));
    ZtFault fault;
    const QImage image = hasImage ? QImage(4, 4, QImage::Format_RGB32) : QImage();
    QVERIFY(!KvDeskSnapshotFile::save(image, folder.path + QLatin1Char('/') + name, &fault));
    QVERIFY(!fault.isNull());
    QCOMPARE(fault.file, folder.path + QLatin1Char('/') + name);
    QCOMPARE(folder.names(), QStringList(QStringLiteral("file.png")));
}

void KvDeskSnapshotFileTest::replacesNothingWhenItFails()
{
    const GalleryFolder folder;
    const QString path = folder.add(QStringLiteral("a.png"));
    const QByteArray before = DeskFiles::bytes(path);
    ZtFault fault;
    QVERIFY(!KvDeskSnapshotFile::save(QImage(), path, &fault));
    QCOMPARE(DeskFiles::bytes(path), before);
}

STATREPORT_TEST_MAIN(KvDeskSnapshotFileTest)
#include "KvDeskSnapshotFileTest.moc"
