// SPDX-License-Identifier: MIT
#include "KvDeskThumbnailReader.h"

#include "DeskFiles.h"

#include <QImageReader>

class KvDeskThumbnailReaderTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void sizes_data();
    void sizes();
    void largerThumbnails();
    void keepsTheColours();
    void turnedPhotos();
    void brokenFiles_data();
    void brokenFiles();
};

void KvDeskThumbnailReaderTest::sizes_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<QSize>("thumbnail");
    QTest::newRow("small stays") << "small.png" << QSize(40, 30) << QSize(40, 30);
    QTest::newRow("exact stays") << "exact.png" << QSize(256, 192) << QSize(256, 192);
    QTest::newRow("landscape") << "wide.png" << QSize(1024, 512) << QSize(256, 128);
    QTest::newRow("portrait") << "high.png" << QSize(512, 1024) << QSize(96, 192);
    QTest::newRow("line") << "line.png" << QSize(3000, 1) << QSize(256, 1);
    QTest::newRow("jpeg") << "photo.jpg" << QSize(1024, 768) << QSize(256, 192);
    QTest::newRow("small jpeg") << "small.jpg" << QSize(16, 8) << QSize(16, 8);
    QTest::newRow("bmp") << "map.bmp" << QSize(512, 384) << QSize(256, 192);
}

void KvDeskThumbnailReaderTest::sizes()
{
    QFETCH(QString, name);
    QFETCH(QSize, size);
    QFETCH(QSize, thumbnail);
    const KvDeskThumbnail read = KvDeskThumbnailReader::read(DeskFiles::image(name, size));
    QCOMPARE(read.fault, QString());
    QCOMPARE(read.size, size);
    QCOMPARE(read.image.size(), thumbnail);
}

/// For screens with more pixels.
void KvDeskThumbnailReaderTest::largerThumbnails()
{
    for (const char *const name : {"large.png", "large.jpg"}) {
        const QString path = DeskFiles::image(QLatin1String(name), QSize(1024, 768));
        QCOMPARE(KvDeskThumbnailReader::read(path, QSize(444, 333)).image.size(), QSize(444, 333));
    }
}

void KvDeskThumbnailReaderTest::keepsTheColours()
{
    const KvDeskThumbnail read =
        KvDeskThumbnailReader::read(DeskFiles::image(QStringLiteral("red.png"), QSize(1000, 1000), Qt::red));
    QCOMPARE(read.image.pixelColor(50, 50), QColor(Qt::red));
}

void KvDeskThumbnailReaderTest::turnedPhotos()
{
    // A JPEG that says in its Exif part that it has to be turned by a quarter.
    const QByteArray exif = QByteArray::fromHex("ffe100224578696600004d4d002a00000008000101120003000000010006"
                                                "000000000000");
    const QString plain = DeskFiles::image(QStringLiteral("plain.jpg"), QSize(1024, 512));
    QByteArray bytes = DeskFiles::bytes(plain);
    bytes.insert(2, exif);
    const QString turned = DeskFiles::text(QStringLiteral("turned.jpg"), bytes);
    QVERIFY(QImageReader(turned).transformation() == QImageIOHandler::TransformationRotate90);
    const KvDeskThumbnail read = KvDeskThumbnailReader::read(turned);
    QCOMPARE(read.size, QSize(512, 1024));
    QCOMPARE(read.image.size(), QSize(96, 192));
}

void KvDeskThumbnailReaderTest::brokenFiles_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("rubbish") << QByteArray("this is no picture");
    QTest::newRow("header only") << QByteArray::fromHex("89504e470d0a1a0a");
    QTest::newRow("tiff cut") << QByteArray::fromHex("49492a0008000000");
}

void KvDeskThumbnailReaderTest::brokenFiles()
{
    QFETCH(QByteArray, bytes);
    const KvDeskThumbnail read =
        KvDeskThumbnailReader::read(DeskFiles::text(QStringLiteral("broken.png"), bytes));
    QVERIFY(read.image.isNull());
    QVERIFY(!read.fault.isEmpty());
}

STATREPORT_TEST_MAIN(KvDeskThumbnailReaderTest)
#include "KvDeskThumbnailReaderTest.moc"
