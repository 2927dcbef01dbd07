// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"
#include "support/UnprivilegedUser.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtStillImageSource.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QImageReader>
#include <QImageWriter>
#include <QRandomGenerator>

#include <cmath>

namespace {

QString write(const QString &name, const QByteArray &bytes)
{
    QFile file(StatReportTest::temporaryPath(name));
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qCritical("cannot write %s", qPrintable(file.fileName()));
    return file.fileName();
}

QString writePicture(const QString &name, int dotsPerMetreX, int dotsPerMetreY, const char *format = "png")
{
    QImage image(13, 7, QImage::Format_RGB32);
    image.fill(Qt::red);
    if (dotsPerMetreX > 0) {
        image.setDotsPerMeterX(dotsPerMetreX);
        image.setDotsPerMeterY(dotsPerMetreY);
    }
    const QString path = StatReportTest::temporaryPath(name);
    if (!image.save(path, format, 100))
        qCritical("cannot save %s", qPrintable(path));
    return path;
}

// No format makes it smaller than what is read at once.
QString noise(const QString &suffix)
{
    QImage image(400, 300, QImage::Format_RGB32);
    QRandomGenerator random(1);
    random.fillRange(reinterpret_cast<quint32 *>(image.bits()), image.width() * image.height());
    const QString path = StatReportTest::temporaryPath(QStringLiteral("noise.") + suffix);
    if (!image.save(path))
        qCritical("cannot save %s", qPrintable(path));
    return path;
}

bool isSupported(const QByteArray &format)
{
    return QImageReader::supportedImageFormats().contains(format) &&
           QImageWriter::supportedImageFormats().contains(format);
}

} // namespace

class ZtStillImageSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void loadsPictures_data();
    void loadsPictures();
    void readsTheContentNotTheSuffix();
    void offersThePixelSize_data();
    void offersThePixelSize();
    void refuses_data();
    void refuses();
    void refusesUnreadableFiles();
    void refusesHugePicturesBeforeDecoding();
    void tellsHowFarItIs_data();
    void tellsHowFarItIs();
    void stopsWhenItIsCancelled_data();
    void stopsWhenItIsCancelled();
    void offersDifferentSizesPerDirection();
    void namesWhoStatesThePixelSize();
    void showsDeepGreyByItsBits();
    void refusesHugeFilesAtOnce_data();
    void refusesHugeFilesAtOnce();
    void isNotLive();
};

void ZtStillImageSourceTest::loadsPictures_data()
{
    QTest::addColumn<QByteArray>("format");
    QTest::newRow("PNG") << QByteArray("png");
    QTest::newRow("JPEG") << QByteArray("jpg");
    QTest::newRow("TIFF") << QByteArray("tiff");
    QTest::newRow("BMP") << QByteArray("bmp");
}

void ZtStillImageSourceTest::loadsPictures()
{
    QFETCH(QByteArray, format);
    QVERIFY2(isSupported(format), "install Qt's image format plug-ins (qt5-image-formats-plugins)");
    const QString name = QStringLiteral("picture.") + QString::fromLatin1(format);
    const QString path = writePicture(name, 1000000, 1000000, format.constData());
    ZtFault fault;
    const auto source = ZtStillImageSource::load(path, &fault);
    QVERIFY2(source, qPrintable(fault.text()));
    QVERIFY(fault.isNull());
    QCOMPARE(source->frame().size(), QSize(13, 7));
    QVERIFY(qRed(source->frame().pixel(6, 3)) > 250);
    QCOMPARE(source->displayName(), name);
    QCOMPARE(source->path(), path);
}

void ZtStillImageSourceTest::readsTheContentNotTheSuffix()
{
    const QString path = writePicture(QStringLiteral("a picture.jpg"), 0, 0, "png");
    ZtFault fault;
    QVERIFY(ZtStillImageSource::load(path, &fault));
}

void ZtStillImageSourceTest::offersThePixelSize_data()
{
    QTest::addColumn<int>("x");
    QTest::addColumn<int>("y");
    QTest::addColumn<double>("micrometres");
    QTest::newRow("none stated") << 0 << 0 << 0.0;
    QTest::newRow("one micrometre") << 1000000 << 1000000 << 1.0;
    QTest::newRow("quarter of a micrometre") << 4000000 << 4000000 << 0.25;
    QTest::newRow("300 dots per inch") << 11811 << 11811 << 1e6 / 11811;
    QTest::newRow("72 dots per inch") << 2835 << 2835 << 0.0;
    QTest::newRow("72 dots per inch, cut off") << 2834 << 2834 << 0.0;
    QTest::newRow("96 dots per inch") << 3780 << 3780 << 0.0;
    QTest::newRow("96 dots per inch, cut off") << 3779 << 3779 << 0.0;
    QTest::newRow("144 dots per inch") << 5669 << 5669 << 0.0;
    QTest::newRow("oblong pixels") << 1000000 << 500000 << 1.0;
    QTest::newRow("rounded differently") << 100000 << 100001 << 10.0;
}

void ZtStillImageSourceTest::offersThePixelSize()
{
    QFETCH(int, x);
    QFETCH(int, y);
    QFETCH(double, micrometres);
    ZtFault fault;
    const auto source = ZtStillImageSource::load(writePicture(QStringLiteral("size.png"), x, y), &fault);
    QVERIFY(source);
    QCOMPARE(source->offeredCalibration().isCalibrated(), micrometres > 0.0);
    QVERIFY(std::abs(source->offeredCalibration().micrometresPerPixel() - micrometres) < 1e-9);
}

void ZtStillImageSourceTest::refuses_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("message");
    QTest::newRow("missing") << temporaryPath(QStringLiteral("missing.png")) << "The picture does not exist";
    QTest::newRow("no path") << ""
                             << "The picture does not exist";
    QTest::newRow("folder") << QFileInfo(temporaryPath(QStringLiteral("x"))).path()
                            << "This is a folder, not a picture";
    QTest::newRow("empty") << write(QStringLiteral("empty.png"), QByteArray())
                           << "The picture cannot be decoded";
    QTest::newRow("text") << write(QStringLiteral("text.png"), "This is no picture")
                          << "The picture cannot be decoded";
    const QString cut = writePicture(QStringLiteral("cut.png"), 0, 0);
    QFile file(cut);
    file.resize(20);
    QTest::newRow("cut off in the header") << cut << "The picture cannot be decoded";
}

void ZtStillImageSourceTest::refuses()
{
    QFETCH(QString, path);
    QFETCH(QString, message);
    ZtFault fault;
    QVERIFY(!ZtStillImageSource::load(path, &fault));
    QCOMPARE(fault.file, path);
    QVERIFY2(fault.message.startsWith(message), qPrintable(fault.text()));
}

void ZtStillImageSourceTest::refusesUnreadableFiles()
{
    const QString path = writePicture(QStringLiteral("closed.png"), 0, 0);
    QFile::setPermissions(path, QFileDevice::Permissions());
    const UnprivilegedUser user;
    QVERIFY(user.isUnprivileged());
    ZtFault fault;
    QVERIFY(!ZtStillImageSource::load(path, &fault));
    QCOMPARE(fault.message, QStringLiteral("The picture cannot be read"));
}

void ZtStillImageSourceTest::refusesHugePicturesBeforeDecoding()
{
    ZtFault fault;
    const QString path = writePicture(QStringLiteral("large.png"), 0, 0);
    QVERIFY(ZtStillImageSource::load(path, &fault, 13 * 7));
    QVERIFY(!ZtStillImageSource::load(path, &fault, 13 * 7 - 1));
    QCOMPARE(fault.message, QStringLiteral("The picture has 13 x 7 pixels, which is too many"));
    // The header alone, which announces more pixels than there is memory for.
    const QString huge = write(QStringLiteral("huge.pgm"), "P5 30000 30000 255\n");
    QVERIFY(!ZtStillImageSource::load(huge, &fault));
    QCOMPARE(fault.message, QStringLiteral("The picture has 30000 x 30000 pixels, which is too many"));
}

void ZtStillImageSourceTest::offersDifferentSizesPerDirection()
{
    ZtFault fault;
    const auto source =
        ZtStillImageSource::load(writePicture(QStringLiteral("oblong.png"), 1000000, 500000), &fault);
    QVERIFY(source);
    const ZtOfferedPixelSize size = source->offeredPixelSize();
    QVERIFY(size.isKnown());
    QCOMPARE(size.x, 1.0);
    QCOMPARE(size.y, 2.0);
    const ZtCalibration offered = source->offeredCalibration();
    QCOMPARE(offered.micrometresPerPixelX(), 1.0);
    QCOMPARE(offered.micrometresPerPixelY(), 2.0);
    QVERIFY(offered.origin() == ZtCalibration::Origin::Metadata);
    QCOMPARE(offered.name(), QStringLiteral("oblong.png"));
}

void ZtStillImageSourceTest::namesWhoStatesThePixelSize()
{
    ZtFault fault;
    const auto png = ZtStillImageSource::load(writePicture(QStringLiteral("a.png"), 10000, 10000), &fault);
    QCOMPARE(png->offeredPixelSize().origin, QStringLiteral("PNG"));
    QCOMPARE(png->offeredPixelSize().x, 100.0);
    const auto tiff =
        ZtStillImageSource::load(writePicture(QStringLiteral("a.tif"), 1000000, 1000000, "tiff"), &fault);
    QCOMPARE(tiff->offeredPixelSize().origin, QStringLiteral("TIFF"));
    QVERIFY(std::abs(tiff->offeredPixelSize().x - 1.0) < 1e-3);
    const auto none = ZtStillImageSource::load(writePicture(QStringLiteral("b.png"), 0, 0), &fault);
    QVERIFY(!none->offeredPixelSize().isKnown());
    QCOMPARE(none->offeredPixelSize().origin, QString());
}

void ZtStillImageSourceTest::showsDeepGreyByItsBits()
{
    QImage deep(3, 1, QImage::Format_Grayscale16);
    auto *const line = reinterpret_cast<quint16 *>(deep.bits());
    line[0] = 0;
    line[1] = 2048;
    line[2] = 4095;
    const QString path = temporaryPath(QStringLiteral("deep.png"));
    QVERIFY(deep.save(path));
    ZtFault fault;
    const auto source = ZtStillImageSource::load(path, &fault);
    QVERIFY(source);
    QCOMPARE(source->greyBits(), 12);
    QCOMPARE(source->frame().pixelColor(1, 0).red(), 128);
    QCOMPARE(source->frame().pixelColor(2, 0).red(), 255);
}

void ZtStillImageSourceTest::refusesHugeFilesAtOnce_data()
{
    QTest::addColumn<QByteArray>("start");
    QTest::newRow("zeros") << QByteArray();
    QTest::newRow("TIFF whose directory is zeros") << QByteArray("II*\0\0\0\0\x40", 8);
    QTest::newRow("large TIFF whose directory is zeros")
        << QByteArray("II+\0\x08\0\0\0\0\0\0\x40\0\0\0\0", 16);
    QTest::newRow("PNG") << QByteArray("\x89PNG\r\n\x1A\n");
    QTest::newRow("JPEG") << QByteArray("\xFF\xD8\xFF");
    QTest::newRow("BMP") << QByteArray("BM");
}

void ZtStillImageSourceTest::refusesHugeFilesAtOnce()
{
    QFETCH(QByteArray, start);
    const QString path = write(QStringLiteral("huge.png"), start);
    QFile file(path);
    QVERIFY(file.resize(2300LL * 1000 * 1000)); // mostly a hole
    QElapsedTimer clock;
    clock.start();
    ZtFault fault;
    if (start.startsWith("\xFF\xD8")) {
        // What Qt's decoder has to say.
        expectWarning(QRegularExpression(QStringLiteral("extraneous bytes|no image|end of JPEG")));
        expectWarning(QRegularExpression(QStringLiteral("extraneous bytes|no image|end of JPEG")));
    }
    QVERIFY(!ZtStillImageSource::load(path, &fault));
    const qint64 elapsed = clock.elapsed();
    file.remove();
    QVERIFY2(elapsed < 5000, qPrintable(QString::number(elapsed)));
    QVERIFY2(fault.message.startsWith(QLatin1String("The picture ")), qPrintable(fault.text()));
}

void ZtStillImageSourceTest::isNotLive()
{
    ZtFault fault;
    const auto source = ZtStillImageSource::load(writePicture(QStringLiteral("still.png"), 0, 0), &fault);
    QVERIFY(!source->isLive());
    source->start();
    QCOMPARE(source->state(), ZtFrameSource::Stopped);
    QCOMPARE(source->frameRate(), 0.0);
    QCOMPARE(source->droppedFrames(), 0ULL);
    QVERIFY(!source->exposureRange());
    QCOMPARE(source->exposure(), 0.0);
}

void ZtStillImageSourceTest::tellsHowFarItIs_data()
{
    QTest::addColumn<QByteArray>("format");
    for (const char *format : {"png", "bmp", "jpg", "tif"})
        QTest::newRow(format) << QByteArray(format);
}

void ZtStillImageSourceTest::tellsHowFarItIs()
{
    QFETCH(QByteArray, format);
    QVERIFY2(isSupported(format), "a plug-in of Qt for this format is missing");
    const QString path = noise(QString::fromLatin1(format));
    ZtProgress progress;
    ZtFault fault;
    QVERIFY(ZtStillImageSource::load(path, &fault, ZtStillImageSource::maximumPixels, &progress));
    QVERIFY2(progress.fraction() > 0.9, qPrintable(QString::number(progress.fraction())));
}

void ZtStillImageSourceTest::stopsWhenItIsCancelled_data()
{
    tellsHowFarItIs_data();
}

void ZtStillImageSourceTest::stopsWhenItIsCancelled()
{
    QFETCH(QByteArray, format);
    QVERIFY2(isSupported(format), "a plug-in of Qt for this format is missing");
    const QString path = noise(QString::fromLatin1(format));
    ZtProgress progress;
    QVERIFY(progress.cancel());
    ZtFault fault;
    QVERIFY(!ZtStillImageSource::load(path, &fault, ZtStillImageSource::maximumPixels, &progress));
    QVERIFY(!fault.isNull());
    QCOMPARE(progress.fraction(), 0.0);
}

STATREPORT_TEST_MAIN(ZtStillImageSourceTest)
#include "ZtStillImageSourceTest.moc"
