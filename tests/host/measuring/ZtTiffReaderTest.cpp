// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/TiffFile.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtPicture.h"
#include "measuring/ZtTiffReader.h"

#include <QBuffer>

#include <unistd.h>

namespace {

constexpr qint64 anySize = 1000 * 1000;

bool readBytes(QByteArray bytes, ZtPicture *picture, ZtFault *fault, qint64 pixelLimit = anySize)
{
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    return ZtTiffReader::read(&buffer, pixelLimit, picture, fault);
}

QVector<int> greys(const QImage &image)
{
    QVector<int> values;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            values.append(qGray(image.pixel(x, y)));
    }
    return values;
}

TiffFile smallGrey()
{
    TiffFile file(QSize(3, 2), 8);
    file.setPixels(QByteArray("\x00\x33\x66\x99\xCC\xFF", 6));
    return file;
}

TiffFile deepGrey(const QVector<quint16> &values, bool isBigEndian = false)
{
    TiffFile file(QSize(values.size(), 1), 16, isBigEndian);
    file.setDeepPixels(values);
    return file;
}

TiffFile colours()
{
    TiffFile file(QSize(2, 1), 8);
    file.setShorts(TiffFile::BitsPerSample, {8, 8, 8});
    file.setShorts(TiffFile::SamplesPerPixel, {3});
    file.setShorts(TiffFile::Photometric, {2});
    file.setPixels(QByteArray("\xFF\x80\x00\x01\x02\x03", 6));
    return file;
}

/// What comes out at standard error while it lives.
class StandardError
{
public:
    StandardError()
        : m_saved(dup(STDERR_FILENO))
        , m_path(StatReportTest::temporaryPath(QStringLiteral("stderr.txt")).toLocal8Bit())
    {
        if (!freopen(m_path.constData(), "w", stderr))
            qFatal("cannot redirect");
    }
    ~StandardError() { restore(); }
    QByteArray text()
    {
        restore();
        QFile file(QString::fromLocal8Bit(m_path));
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("unreadable");
    }

private:
    void restore()
    {
        if (m_saved < 0)
            return;
        fflush(stderr);
        dup2(m_saved, STDERR_FILENO);
        close(m_saved);
        m_saved = -1;
    }

    int m_saved;
    QByteArray m_path;
};

} // namespace

class ZtTiffReaderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void knowsTiffs_data();
    void knowsTiffs();
    void readsGrey();
    void readsDeepGrey_data();
    void readsDeepGrey();
    void believesStatedBits_data();
    void believesStatedBits();
    void readsDeepStrips();
    void readsDeepTiles();
    void readsColours();
    void readsPalettes();
    void readsTheFirstOfSeveral();
    void turnsUpright_data();
    void turnsUpright();
    void offersPixelSizes_data();
    void offersPixelSizes();
    void turnsThePixelSizeToo();
    void refuses_data();
    void refuses();
    void refusesHugePictures();
    void anyCutIsAFault();
    void anyByteMayBeWrong();
    void saysNothingItself();
};

void ZtTiffReaderTest::knowsTiffs_data()
{
    QTest::addColumn<QByteArray>("header");
    QTest::addColumn<bool>("isTiff");
    QTest::newRow("little end first") << QByteArray("II*\0", 4) << true;
    QTest::newRow("big end first") << QByteArray("MM\0*", 4) << true;
    QTest::newRow("large files") << QByteArray("II+\0", 4) << true;
    QTest::newRow("large files, big end first") << QByteArray("MM\0+", 4) << true;
    QTest::newRow("mixed") << QByteArray("II\0*", 4) << false;
    QTest::newRow("cut off") << QByteArray("II*") << false;
    QTest::newRow("nothing") << QByteArray() << false;
    QTest::newRow("PNG") << QByteArray("\x89PNG") << false;
}

void ZtTiffReaderTest::knowsTiffs()
{
    QFETCH(QByteArray, header);
    QFETCH(bool, isTiff);
    QCOMPARE(ZtTiffReader::isTiff(header), isTiff);
}

void ZtTiffReaderTest::readsGrey()
{
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(smallGrey().bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(picture.image.size(), QSize(3, 2));
    QCOMPARE(greys(picture.image), QVector<int>({0x00, 0x33, 0x66, 0x99, 0xCC, 0xFF}));
    QCOMPARE(picture.greyBits, 8);
    QVERIFY(!picture.pixelSize.isKnown());
}

void ZtTiffReaderTest::readsDeepGrey_data()
{
    QTest::addColumn<QVector<quint16>>("values");
    QTest::addColumn<bool>("isBigEndian");
    QTest::addColumn<int>("bits");
    QTest::addColumn<QVector<int>>("shown");
    QTest::newRow("sixteen bits") << QVector<quint16>{0, 32768, 65535} << false << 16
                                  << QVector<int>{0, 128, 255};
    QTest::newRow("big end first") << QVector<quint16>{0, 32768, 65535} << true << 16
                                   << QVector<int>{0, 128, 255};
    QTest::newRow("twelve bits") << QVector<quint16>{0, 2048, 4095} << false << 12
                                 << QVector<int>{0, 128, 255};
    QTest::newRow("ten bits") << QVector<quint16>{0, 512, 1023} << false << 10 << QVector<int>{0, 128, 255};
    // Fewer than eight bits are not stretched: such a picture is dark, not shallow.
    QTest::newRow("dark") << QVector<quint16>{0, 1, 100} << false << 8 << QVector<int>{0, 1, 100};
    QTest::newRow("black") << QVector<quint16>{0, 0, 0} << false << 8 << QVector<int>{0, 0, 0};
}

void ZtTiffReaderTest::readsDeepGrey()
{
    QFETCH(QVector<quint16>, values);
    QFETCH(bool, isBigEndian);
    QFETCH(int, bits);
    QFETCH(QVector<int>, shown);
    ZtPicture picture;
    ZtFault fault;
    TiffFile file = deepGrey(values, isBigEndian);
    QVERIFY2(readBytes(file.bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(picture.greyBits, bits);
    QCOMPARE(greys(picture.image), shown);
    // White is zero.
    file.setShorts(TiffFile::Photometric, {0});
    QVERIFY(readBytes(file.bytes(), &picture, &fault));
    for (int &value : shown)
        value = 255 - value;
    QCOMPARE(greys(picture.image), shown);
}

void ZtTiffReaderTest::believesStatedBits_data()
{
    QTest::addColumn<QByteArray>("description");
    QTest::addColumn<int>("maximum");
    QTest::addColumn<int>("bits");
    const QByteArray ome =
        "<?xml version=\"1.0\"?><OME><Image><Pixels SignificantBits=\"%1\"/></Image></OME>";
    QTest::newRow("nothing stated") << QByteArray() << 0 << 10;
    QTest::newRow("OME") << QByteArray(ome).replace("%1", "12") << 0 << 12;
    QTest::newRow("OME, too few for the values") << QByteArray(ome).replace("%1", "9") << 0 << 10;
    QTest::newRow("OME, nonsense") << QByteArray(ome).replace("%1", "400") << 0 << 10;
    QTest::newRow("OME, negative") << QByteArray(ome).replace("%1", "-3") << 0 << 10;
    QTest::newRow("largest value") << QByteArray() << 4095 << 12;
    QTest::newRow("largest value, too small") << QByteArray() << 255 << 10;
}

void ZtTiffReaderTest::believesStatedBits()
{
    QFETCH(QByteArray, description);
    QFETCH(int, maximum);
    QFETCH(int, bits);
    TiffFile file = deepGrey({0, 600, 1000});
    if (!description.isEmpty())
        file.setText(TiffFile::Description, description);
    if (maximum > 0)
        file.setShorts(TiffFile::MaxSampleValue, {static_cast<quint16>(maximum)});
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(file.bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(picture.greyBits, bits);
}

void ZtTiffReaderTest::readsDeepStrips()
{
    TiffFile file(QSize(1, 5), 16);
    file.setDeepPixels({0, 1000, 2000, 3000, 4095});
    file.setLong(TiffFile::RowsPerStrip, 2);
    file.setShorts(TiffFile::StripOffsets, {8, 12, 16});
    file.setShorts(TiffFile::StripByteCounts, {4, 4, 2});
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(file.bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(greys(picture.image), QVector<int>({0, 62, 125, 187, 255}));
}

void ZtTiffReaderTest::readsDeepTiles()
{
    // Two tiles of 16 x 16 beside one another for a picture of 20 x 3.
    TiffFile file(QSize(20, 3), 16);
    file.remove(TiffFile::RowsPerStrip);
    file.setShorts(TiffFile::TileWidth, {16});
    file.setShorts(TiffFile::TileHeight, {16});
    file.setShorts(TiffFile::TileOffsets, {8, 8 + 512});
    file.setShorts(TiffFile::TileByteCounts, {512, 512});
    file.setDeepPixels(QVector<quint16>(256, 0) + QVector<quint16>(256, 65535));
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(file.bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(greys(picture.image), (QVector<int>(16, 0) + QVector<int>(4, 255)) +
                                       (QVector<int>(16, 0) + QVector<int>(4, 255)) +
                                       (QVector<int>(16, 0) + QVector<int>(4, 255)));
}

void ZtTiffReaderTest::readsColours()
{
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(colours().bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(picture.image.pixelColor(0, 0), QColor(255, 128, 0));
    QCOMPARE(picture.image.pixelColor(1, 0), QColor(1, 2, 3));
}

void ZtTiffReaderTest::readsPalettes()
{
    TiffFile file(QSize(2, 1), 8);
    file.setShorts(TiffFile::Photometric, {3});
    QVector<quint16> map(3 * 256, 0);
    map[7] = 0xFFFF;           // red of 7
    map[256 + 9] = 0xFFFF;     // green of 9
    map[2 * 256 + 9] = 0x8080; // blue of 9
    file.setShorts(TiffFile::ColorMap, map);
    file.setPixels(QByteArray("\x07\x09", 2));
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(file.bytes(), &picture, &fault), qPrintable(fault.text()));
    QCOMPARE(picture.image.pixelColor(0, 0), QColor(255, 0, 0));
    QCOMPARE(picture.image.pixelColor(1, 0), QColor(0, 255, 128));
}

void ZtTiffReaderTest::readsTheFirstOfSeveral()
{
    TiffFile file = smallGrey();
    const QByteArray alone = file.bytes();
    // The first directory again, and so on for ever: nobody follows.
    file.setNextDirectory(static_cast<quint32>(alone.size() - 2 - 4));
    ZtPicture picture;
    ZtFault fault;
    QVERIFY(readBytes(file.bytes(), &picture, &fault));
    QCOMPARE(picture.image.size(), QSize(3, 2));
}

void ZtTiffReaderTest::turnsUpright_data()
{
    QTest::addColumn<int>("orientation");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<QVector<int>>("shown");
    // Stored as 1 2 3 / 4 5 6.
    QTest::newRow("upright") << 1 << QSize(3, 2) << QVector<int>{1, 2, 3, 4, 5, 6};
    QTest::newRow("mirrored") << 2 << QSize(3, 2) << QVector<int>{3, 2, 1, 6, 5, 4};
    QTest::newRow("upside down") << 3 << QSize(3, 2) << QVector<int>{6, 5, 4, 3, 2, 1};
    QTest::newRow("flipped") << 4 << QSize(3, 2) << QVector<int>{4, 5, 6, 1, 2, 3};
    QTest::newRow("transposed") << 5 << QSize(2, 3) << QVector<int>{1, 4, 2, 5, 3, 6};
    QTest::newRow("turned right") << 6 << QSize(2, 3) << QVector<int>{4, 1, 5, 2, 6, 3};
    QTest::newRow("transposed the other way") << 7 << QSize(2, 3) << QVector<int>{6, 3, 5, 2, 4, 1};
    QTest::newRow("turned left") << 8 << QSize(2, 3) << QVector<int>{3, 6, 2, 5, 1, 4};
    QTest::newRow("nonsense") << 77 << QSize(3, 2) << QVector<int>{1, 2, 3, 4, 5, 6};
}

void ZtTiffReaderTest::turnsUpright()
{
    QFETCH(int, orientation);
    QFETCH(QSize, size);
    QFETCH(QVector<int>, shown);
    ZtPicture picture;
    ZtFault fault;
    TiffFile eight(QSize(3, 2), 8);
    eight.setPixels(QByteArray("\1\2\3\4\5\6"));
    eight.setShorts(TiffFile::Orientation, {static_cast<quint16>(orientation)});
    QVERIFY(readBytes(eight.bytes(), &picture, &fault));
    QCOMPARE(picture.image.size(), size);
    QCOMPARE(greys(picture.image), shown);
    TiffFile deep(QSize(3, 2), 16);
    deep.setDeepPixels({1, 2, 3, 4, 5, 6});
    deep.setShorts(TiffFile::Orientation, {static_cast<quint16>(orientation)});
    QVERIFY(readBytes(deep.bytes(), &picture, &fault));
    QCOMPARE(picture.image.size(), size);
    QCOMPARE(greys(picture.image), shown);
}

void ZtTiffReaderTest::offersPixelSizes_data()
{
    QTest::addColumn<QByteArray>("description");
    QTest::addColumn<int>("unit"); // 1 none, 2 inch, 3 centimetre, 0 not stated
    QTest::addColumn<int>("xResolution");
    QTest::addColumn<int>("yResolution");
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("y");
    QTest::addColumn<QString>("origin");
    const auto row = [](const char *name, const QByteArray &description, int unit, int xResolution,
                        int yResolution, double x, double y, const char *origin) {
        QTest::newRow(name) << description << unit << xResolution << yResolution << x << y
                            << QString::fromLatin1(origin);
    };
    row("nothing", "", 0, 0, 0, 0, 0, "");
    row("centimetres", "", 3, 20000, 10000, 0.5, 1.0, "TIFF");
    row("inches", "", 2, 25400, 25400, 1.0, 1.0, "TIFF");
    row("inches without a unit", "", 0, 25400, 25400, 1.0, 1.0, "TIFF");
    row("one direction", "", 3, 20000, 0, 0.5, 0.5, "TIFF");
    row("no unit", "", 1, 2, 2, 0, 0, "");
    row("of a screen", "", 2, 72, 72, 0, 0, "");
    row("of a screen, in centimetres", "", 3, 38, 38, 1e4 / 38, 1e4 / 38, "TIFF"); // 96.5 dpi is meant
    row("ImageJ", "ImageJ=1.53t\nunit=\\u00B5m\n", 1, 4, 2, 0.25, 0.5, "ImageJ");
    row("ImageJ in Latin-1", "ImageJ=1.53t\nunit=\xB5m\n", 1, 4, 4, 0.25, 0.25, "ImageJ");
    row("ImageJ in UTF-8", "ImageJ=1.53t\nunit=\xC2\xB5m\n", 1, 4, 4, 0.25, 0.25, "ImageJ");
    row("ImageJ, microns", "ImageJ=1.53t\nimages=3\nunit=micron\nspacing=2", 1, 4, 4, 0.25, 0.25, "ImageJ");
    row("ImageJ, pixels", "ImageJ=1.53t\nunit=pixel\n", 1, 4, 4, 0, 0, "");
    row("ImageJ without a unit", "ImageJ=1.53t\n", 1, 4, 4, 0, 0, "");
    row("ImageJ, centimetres", "ImageJ=1.53t\nunit=cm\n", 3, 10000, 10000, 1.0, 1.0, "ImageJ");
    row("ImageJ, inches", "ImageJ=1.53t\nunit=inch\n", 2, 25400, 25400, 1.0, 1.0, "ImageJ");
    row("ImageJ, of a screen", "ImageJ=1.53t\nunit=inch\n", 2, 72, 72, 0, 0, "");
    row("OME", "<OME><Image><Pixels PhysicalSizeX=\"0.3\" PhysicalSizeY=\"0.4\"/></Image></OME>", 2, 72, 72,
        0.3, 0.4, "OME");
    row("OME in nanometres",
        "<OME><Image><Pixels PhysicalSizeX=\"65\" PhysicalSizeXUnit=\"nm\" PhysicalSizeY=\"0.065\"/></Image>"
        "</OME>",
        2, 72, 72, 0.065, 0.065, "OME");
    row("OME without a size", "<OME><Image><Pixels SizeX=\"3\"/></Image></OME>", 3, 10000, 10000, 1.0, 1.0,
        "TIFF");
    row("other words", "A nice picture, unit=mm", 3, 10000, 10000, 1.0, 1.0, "TIFF");
}

void ZtTiffReaderTest::offersPixelSizes()
{
    QFETCH(QByteArray, description);
    QFETCH(int, unit);
    QFETCH(int, xResolution);
    QFETCH(int, yResolution);
    QFETCH(double, x);
    QFETCH(double, y);
    QFETCH(QString, origin);
    TiffFile file = smallGrey();
    if (!description.isEmpty())
        file.setText(TiffFile::Description, description);
    if (unit > 0)
        file.setShorts(TiffFile::ResolutionUnit, {static_cast<quint16>(unit)});
    if (xResolution > 0)
        file.setRational(TiffFile::XResolution, static_cast<quint32>(xResolution), 1);
    if (yResolution > 0)
        file.setRational(TiffFile::YResolution, static_cast<quint32>(yResolution), 1);
    ZtPicture picture;
    ZtFault fault;
    QVERIFY2(readBytes(file.bytes(), &picture, &fault), qPrintable(fault.text()));
    QVERIFY2(std::abs(picture.pixelSize.x - x) <= 1e-6 * x, qPrintable(QString::number(picture.pixelSize.x)));
    QVERIFY2(std::abs(picture.pixelSize.y - y) <= 1e-6 * y, qPrintable(QString::number(picture.pixelSize.y)));
    QCOMPARE(picture.pixelSize.origin, origin);
}

void ZtTiffReaderTest::turnsThePixelSizeToo()
{
    TiffFile file = smallGrey();
    file.setShorts(TiffFile::Orientation, {6});
    file.setShorts(TiffFile::ResolutionUnit, {3});
    file.setRational(TiffFile::XResolution, 20000, 1);
    file.setRational(TiffFile::YResolution, 10000, 1);
    ZtPicture picture;
    ZtFault fault;
    QVERIFY(readBytes(file.bytes(), &picture, &fault));
    QCOMPARE(picture.pixelSize.x, 1.0);
    QCOMPARE(picture.pixelSize.y, 0.5);
}

void ZtTiffReaderTest::refuses_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("message");
    const auto row = [](const char *name, const QByteArray &bytes, const char *reason = nullptr) {
        QTest::newRow(name)
            << bytes << QStringLiteral("The picture cannot be decoded (%1").arg(QString::fromLatin1(reason));
    };
    row("header alone", QByteArray("II*\0", 4));
    row("directory outside of the file", QByteArray("II*\0\xFF\xFF\xFF\x7F", 8));
    TiffFile wide(QSize(900, 900), 8);
    wide.setPixels("short");
    row("more pixels than bytes", wide.bytes(), "the file is too short for its picture)");
    wide.setShorts(TiffFile::Compression, {5});
    row("more pixels than bytes can be packed", TiffFile(wide).bytes());
    TiffFile deep(QSize(900, 900), 16);
    deep.setPixels("short");
    row("deep, more pixels than bytes", deep.bytes(), "the file is too short for its picture)");
    TiffFile away = smallGrey();
    away.setLong(TiffFile::StripOffsets, 0x7FFFFFFF);
    row("pixels outside of the file", away.bytes());
    TiffFile deepAway = deepGrey({1, 2, 3});
    deepAway.setLong(TiffFile::StripOffsets, 0x7FFFFFFF);
    row("deep pixels outside of the file", deepAway.bytes());
    TiffFile flat = smallGrey();
    flat.setLong(TiffFile::Height, 0);
    row("no height", flat.bytes());
    TiffFile nameless = smallGrey();
    nameless.remove(TiffFile::Width);
    row("no width", nameless.bytes());
    TiffFile tiles(QSize(3, 2), 16);
    tiles.setLong(TiffFile::TileWidth, 0x7FFFFFF0);
    tiles.setLong(TiffFile::TileHeight, 0x7FFFFFF0);
    tiles.setDeepPixels({1, 2, 3, 4, 5, 6});
    row("tiles of the size of a town", tiles.bytes());
    TiffFile largeTiles(QSize(3, 2), 8);
    largeTiles.setLong(TiffFile::TileWidth, 40000);
    largeTiles.setLong(TiffFile::TileHeight, 40000);
    largeTiles.setPixels("123456");
    row("tiles of a gigabyte", largeTiles.bytes());
    TiffFile real(QSize(1, 1), 32);
    real.setShorts(TiffFile::SampleFormat, {3});
    real.setPixels(QByteArray(4, '\0'));
    row("real numbers", real.bytes());
    TiffFile packed = smallGrey();
    packed.setShorts(TiffFile::Compression, {999});
    row("unknown compression", packed.bytes());
    TiffFile samples = smallGrey();
    samples.setShorts(TiffFile::SamplesPerPixel, {65535});
    row("thousands of colours", samples.bytes());
}

void ZtTiffReaderTest::refuses()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, message);
    ZtPicture picture;
    ZtFault fault;
    StandardError standardError;
    QVERIFY(!readBytes(bytes, &picture, &fault));
    QCOMPARE(standardError.text(), QByteArray());
    QVERIFY2(fault.message.startsWith(message), qPrintable(fault.message));
    QVERIFY2(fault.message.size() > message.size() + 3 || message.endsWith(QLatin1Char(')')),
             qPrintable(fault.message));
}

void ZtTiffReaderTest::refusesHugePictures()
{
    ZtPicture picture;
    ZtFault fault;
    QVERIFY(readBytes(smallGrey().bytes(), &picture, &fault, 6));
    QVERIFY(!readBytes(smallGrey().bytes(), &picture, &fault, 5));
    QCOMPARE(fault.message, QStringLiteral("The picture has 3 x 2 pixels, which is too many"));
    TiffFile huge = smallGrey();
    huge.setLong(TiffFile::Width, 2000000000);
    huge.setLong(TiffFile::Height, 2000000000);
    huge.setLong(TiffFile::RowsPerStrip, 1);
    QVERIFY(!readBytes(huge.bytes(), &picture, &fault));
    QVERIFY2(fault.message.startsWith(QLatin1String("The picture ")), qPrintable(fault.message));
}

// Whether a picture or a fault comes of it does not matter: it comes at once, and nothing falls over.
void ZtTiffReaderTest::anyCutIsAFault()
{
    for (const QByteArray &whole : {deepGrey({0, 600, 1000}, true).bytes(), colours().bytes()}) {
        for (int length = 0; length < whole.size() - 4; ++length) {
            ZtPicture picture;
            ZtFault fault;
            QVERIFY2(!readBytes(whole.left(length), &picture, &fault), qPrintable(QString::number(length)));
            QVERIFY(!fault.isNull());
        }
    }
}

void ZtTiffReaderTest::anyByteMayBeWrong()
{
    TiffFile described = deepGrey({0, 600, 1000});
    described.setText(TiffFile::Description, "<OME><Image><Pixels PhysicalSizeX=\"1\"/></Image></OME>");
    described.setRational(TiffFile::XResolution, 72, 1);
    for (const QByteArray &whole : {described.bytes(), colours().bytes()}) {
        for (int i = 0; i < whole.size() * 4; ++i) {
            QByteArray bytes = whole;
            bytes[i / 4] = QByteArray("\x00\x01\x7F\xFF", 4).at(i % 4);
            ZtPicture picture;
            ZtFault fault;
            const bool isRead = readBytes(bytes, &picture, &fault);
            QCOMPARE(isRead, fault.isNull());
            QCOMPARE(isRead, !picture.image.isNull());
        }
    }
}

void ZtTiffReaderTest::saysNothingItself()
{
    TiffFile file = smallGrey();
    file.setShorts(64000, {1}); // a tag that nobody knows
    ZtPicture picture;
    ZtFault fault;
    StandardError standardError;
    QVERIFY(readBytes(file.bytes(), &picture, &fault));
    QCOMPARE(standardError.text(), QByteArray());
}

STATREPORT_TEST_MAIN(ZtTiffReaderTest)
#include "ZtTiffReaderTest.moc"
