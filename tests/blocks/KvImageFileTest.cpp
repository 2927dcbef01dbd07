// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvImageSamples.h"
#include "blocks/image/KvImageFile.h"
#include "common/ZtAppStatus.h"

#include <sys/stat.h>

using KvImageSamples::pixels;

class KvImageFileTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void readsFiles_data();
    void readsFiles();
    void reportsWhatCannotBeRead_data();
    void reportsWhatCannotBeRead();
    void noPathIsNoFault();
    void neverWaitsForAPipe();
    void decodes_data();
    void decodes();
    void reportsWhatCannotBeDecoded_data();
    void reportsWhatCannotBeDecoded();
    void noBytesAreNoFault();
};

void KvImageFileTest::init()
{
    StatReportTest::init();
    ZtStatusLog::getInstance()->clear();
}

void KvImageFileTest::readsFiles_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name :
         {"a.png", "b.bmp", "c.jpg", "no suffix", "with wrong suffix.gif", "gr\u00fcn.png"})
        QTest::newRow(name) << QString::fromUtf8(name);
}

void KvImageFileTest::readsFiles()
{
    QFETCH(QString, name);
    const QString path = temporaryPath(name);
    const char *format = name.endsWith(QLatin1String("jpg"))   ? "JPG"
                         : name.endsWith(QLatin1String("bmp")) ? "BMP"
                                                               : "PNG";
    QVERIFY(KvImageSamples::plain(QSize(12, 7)).save(path, format));
    const QPixmap image = KvImageFile::load(path);
    QCOMPARE(image.size(), QSize(12, 7));
    QVERIFY(KvImageSamples::isLike(pixels(image).pixel(3, 3), Qt::red));
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void KvImageFileTest::reportsWhatCannotBeRead_data()
{
    QTest::addColumn<QString>("path");
    QFile text(temporaryPath(QStringLiteral("text.png")));
    QVERIFY(text.open(QIODevice::WriteOnly));
    text.write("no picture");
    QFile empty(temporaryPath(QStringLiteral("empty.png")));
    QVERIFY(empty.open(QIODevice::WriteOnly));
    QTest::newRow("missing") << temporaryPath(QStringLiteral("missing.png"));
    QTest::newRow("no picture") << text.fileName();
    QTest::newRow("empty") << empty.fileName();
    QTest::newRow("a folder") << QFileInfo(text).absolutePath();
    QTest::newRow("a device") << QStringLiteral("/dev/zero");
}

void KvImageFileTest::reportsWhatCannotBeRead()
{
    QFETCH(QString, path);
    QVERIFY(KvImageFile::load(path).isNull());
    const auto entries = ZtStatusLog::getInstance()->entries();
    QCOMPARE(entries.size(), 1);
    QCOMPARE(entries.first().message, QStringLiteral("Cannot read the image file ") + path);
    QCOMPARE(entries.first().source, QStringLiteral("KvImageFile::load"));
    QCOMPARE(entries.first().category, int(ZtAppStatus::Warning));
}

void KvImageFileTest::noPathIsNoFault()
{
    QVERIFY(KvImageFile::load(QString()).isNull());
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void KvImageFileTest::neverWaitsForAPipe()
{
    const QString path = temporaryPath(QStringLiteral("pipe.png"));
    QCOMPARE(mkfifo(QFile::encodeName(path).constData(), 0600), 0);
    QVERIFY(KvImageFile::load(path).isNull()); // opening it would wait for somebody to write
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
}

void KvImageFileTest::decodes_data()
{
    QTest::addColumn<QByteArray>("format");
    QTest::newRow("png") << QByteArray("PNG");
    QTest::newRow("bmp") << QByteArray("BMP");
    QTest::newRow("jpg") << QByteArray("JPG");
}

void KvImageFileTest::decodes()
{
    QFETCH(QByteArray, format);
    const QString text = KvImageSamples::base64(KvImageSamples::plain(QSize(12, 7)), format.constData());
    const QPixmap image =
        KvImageFile::decode(QByteArray::fromBase64(text.toLatin1()), QStringLiteral("/gone.png"));
    QCOMPARE(image.size(), QSize(12, 7));
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

void KvImageFileTest::reportsWhatCannotBeDecoded_data()
{
    QTest::addColumn<QByteArray>("bytes");
    const QString text = KvImageSamples::base64(KvImageSamples::noise(QSize(40, 30)));
    QTest::newRow("letters") << QByteArray("no picture");
    QTest::newRow("the head of a picture") << QByteArray::fromBase64(text.toLatin1()).left(30);
    QTest::newRow("zeros") << QByteArray(100000, '\0');
}

void KvImageFileTest::reportsWhatCannotBeDecoded()
{
    QFETCH(QByteArray, bytes);
    QVERIFY(KvImageFile::decode(bytes, QStringLiteral("/a/gone.png")).isNull());
    const auto entries = ZtStatusLog::getInstance()->entries();
    QCOMPARE(entries.size(), 1);
    QCOMPARE(entries.first().message,
             QStringLiteral("The image that the template holds of /a/gone.png is damaged"));
    QCOMPARE(entries.first().source, QStringLiteral("KvImageFile::decode"));
}

void KvImageFileTest::noBytesAreNoFault()
{
    QVERIFY(KvImageFile::decode(QByteArray(), QStringLiteral("/a/gone.png")).isNull());
    QVERIFY(ZtStatusLog::getInstance()->entries().isEmpty());
}

STATREPORT_TEST_MAIN(KvImageFileTest)
#include "KvImageFileTest.moc"
