// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFramePool.h"
#include "measuring/ZtRawFrame.h"

namespace {

ZtRawFrame rawFrame(const QByteArray &bytes, const QSize &size, const ZtRawFormat &format, int padding = 0)
{
    ZtRawFrame frame;
    frame.data = reinterpret_cast<const uchar *>(bytes.constData());
    frame.size = bytes.size();
    frame.width = size.width();
    frame.height = size.height();
    frame.format = format;
    frame.bytesPerLine = qint64(size.width()) * format.bytesPerPixel() + padding;
    return frame;
}

QStringList colors(const QImage &image)
{
    QStringList names;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            names.append(image.pixelColor(x, y).name().mid(1));
    }
    return names;
}

/// What a sensor with a filter sees of a surface of one colour.
QByteArray throughFilter(const ZtRawFormat &format, const QSize &size, const QColor &color)
{
    static const QMap<int, QByteArray> patterns{{ZtRawFormat::BayerRg, "RGGB"},
                                                {ZtRawFormat::BayerGr, "GRBG"},
                                                {ZtRawFormat::BayerGb, "GBRG"},
                                                {ZtRawFormat::BayerBg, "BGGR"}};
    const QByteArray pattern = patterns.value(format.kind);
    QByteArray bytes;
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            const char filter = pattern.at(2 * (y % 2) + x % 2);
            const int value = filter == 'R' ? color.red() : filter == 'G' ? color.green() : color.blue();
            const int deep = value << (format.bits - 8);
            bytes.append(static_cast<char>(deep & 0xFF));
            if (format.bits > 8)
                bytes.append(static_cast<char>(deep >> 8));
        }
    }
    return bytes;
}

} // namespace

class ZtRawFrameTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void knowsGenicamFormats_data();
    void knowsGenicamFormats();
    void shows_data();
    void shows();
    void bayerOfOneColour_data();
    void bayerOfOneColour();
    void bayerInterpolates();
    void skipsPadding();
    void incompleteFrames_data();
    void incompleteFrames();
    void takesMemoryFromAPool();
};

void ZtRawFrameTest::knowsGenicamFormats_data()
{
    QTest::addColumn<quint32>("number");
    QTest::addColumn<int>("kind"); // -1: not shown
    QTest::addColumn<int>("bits");
    QTest::addColumn<int>("bytes");
    QTest::newRow("Mono8") << 0x01080001U << int(ZtRawFormat::Mono) << 8 << 1;
    QTest::newRow("Mono10") << 0x01100003U << int(ZtRawFormat::Mono) << 10 << 2;
    QTest::newRow("Mono12") << 0x01100005U << int(ZtRawFormat::Mono) << 12 << 2;
    QTest::newRow("Mono16") << 0x01100007U << int(ZtRawFormat::Mono) << 16 << 2;
    QTest::newRow("RGB8") << 0x02180014U << int(ZtRawFormat::Rgb) << 8 << 3;
    QTest::newRow("BGR8") << 0x02180015U << int(ZtRawFormat::Bgr) << 8 << 3;
    QTest::newRow("BayerGR8") << 0x01080008U << int(ZtRawFormat::BayerGr) << 8 << 1;
    QTest::newRow("BayerRG8") << 0x01080009U << int(ZtRawFormat::BayerRg) << 8 << 1;
    QTest::newRow("BayerGB8") << 0x0108000AU << int(ZtRawFormat::BayerGb) << 8 << 1;
    QTest::newRow("BayerBG8") << 0x0108000BU << int(ZtRawFormat::BayerBg) << 8 << 1;
    QTest::newRow("BayerRG12") << 0x01100011U << int(ZtRawFormat::BayerRg) << 12 << 2;
    QTest::newRow("Mono12Packed") << 0x010C0006U << -1 << 0 << 0;
    QTest::newRow("nothing") << 0U << -1 << 0 << 0;
}

void ZtRawFrameTest::knowsGenicamFormats()
{
    QFETCH(quint32, number);
    QFETCH(int, kind);
    QFETCH(int, bits);
    QFETCH(int, bytes);
    const std::optional<ZtRawFormat> format = ZtRawFormat::fromGenicam(number);
    QCOMPARE(format.has_value(), kind >= 0);
    if (!format)
        return;
    QCOMPARE(int(format->kind), kind);
    QCOMPARE(format->bits, bits);
    QCOMPARE(format->bytesPerPixel(), bytes);
    QCOMPARE(format->isBayer(), kind >= ZtRawFormat::BayerRg);
}

void ZtRawFrameTest::shows_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("bits");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QStringList>("shown");
    const QStringList greys{QStringLiteral("000000"), QStringLiteral("808080"), QStringLiteral("ffffff")};
    QTest::newRow("Mono8") << int(ZtRawFormat::Mono) << 8 << QByteArray("\x00\x80\xFF", 3) << greys;
    QTest::newRow("Mono10") << int(ZtRawFormat::Mono) << 10 << QByteArray("\x00\x00\x00\x02\xFF\x03", 6)
                            << greys;
    QTest::newRow("Mono12") << int(ZtRawFormat::Mono) << 12 << QByteArray("\x00\x00\x00\x08\xFF\x0F", 6)
                            << greys;
    QTest::newRow("Mono16") << int(ZtRawFormat::Mono) << 16 << QByteArray("\x00\x00\x00\x80\xFF\xFF", 6)
                            << greys;
    // A camera that sets bits it says it has not.
    QTest::newRow("beyond Mono12") << int(ZtRawFormat::Mono) << 12
                                   << QByteArray("\x00\x00\x00\x08\x00\x10", 6) << greys;
    const QStringList colours{QStringLiteral("ff8000"), QStringLiteral("010203"), QStringLiteral("0000ff")};
    QTest::newRow("RGB8") << int(ZtRawFormat::Rgb) << 8
                          << QByteArray("\xFF\x80\x00\x01\x02\x03\x00\x00\xFF", 9) << colours;
    QTest::newRow("BGR8") << int(ZtRawFormat::Bgr) << 8
                          << QByteArray("\x00\x80\xFF\x03\x02\x01\xFF\x00\x00", 9) << colours;
}

void ZtRawFrameTest::shows()
{
    QFETCH(int, kind);
    QFETCH(int, bits);
    QFETCH(QByteArray, bytes);
    QFETCH(QStringList, shown);
    const ZtRawFormat format{static_cast<ZtRawFormat::Kind>(kind), bits};
    const QImage image = rawFrame(bytes, QSize(3, 1), format).toImage();
    QCOMPARE(image.format(), QImage::Format_RGB32);
    QCOMPARE(colors(image), shown);
    QCOMPARE(qAlpha(reinterpret_cast<const QRgb *>(image.constBits())[0]), 255);
}

void ZtRawFrameTest::bayerOfOneColour_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("bits");
    QTest::addColumn<QSize>("size");
    for (int kind = ZtRawFormat::BayerRg; kind <= ZtRawFormat::BayerBg; ++kind) {
        for (const int bits : {8, 10, 12, 16})
            QTest::addRow("%d, %d bits", kind, bits) << kind << bits << QSize(6, 4);
        QTest::addRow("%d, odd size", kind) << kind << 8 << QSize(5, 3);
        QTest::addRow("%d, smallest", kind) << kind << 8 << QSize(2, 2);
    }
}

// Of one colour, so every pixel has it, those at the borders too.
void ZtRawFrameTest::bayerOfOneColour()
{
    QFETCH(int, kind);
    QFETCH(int, bits);
    QFETCH(QSize, size);
    const ZtRawFormat format{static_cast<ZtRawFormat::Kind>(kind), bits};
    const QByteArray bytes = throughFilter(format, size, QColor(200, 100, 50));
    const QImage image = rawFrame(bytes, size, format).toImage();
    QCOMPARE(image.size(), size);
    const QStringList shown = colors(image);
    QCOMPARE(QSet<QString>(shown.begin(), shown.end()), QSet<QString>{QStringLiteral("c86432")});
}

void ZtRawFrameTest::bayerInterpolates()
{
    //  R  G  R  G
    //  G  B  G  B
    //  R  G  R  G
    const QByteArray bytes("\x10\x20\x30\x40"
                           "\x50\x60\x70\x80"
                           "\x90\xA0\xB0\xC0",
                           12);
    const QImage image = rawFrame(bytes, QSize(4, 3), {ZtRawFormat::BayerRg, 8}).toImage();
    // At blue: green of the four beside it, red of the four at its corners.
    QCOMPARE(image.pixelColor(1, 1),
             QColor((0x10 + 0x30 + 0x90 + 0xB0) / 4, (0x20 + 0xA0 + 0x50 + 0x70) / 4, 0x60));
    // At green in a line with blue: blue at the sides, red above and below.
    QCOMPARE(image.pixelColor(2, 1), QColor((0x30 + 0xB0) / 2, 0x70, (0x60 + 0x80) / 2));
    // At the corner, mirrored: what is inside counts for what is outside.
    QCOMPARE(image.pixelColor(0, 0), QColor(0x10, (0x20 + 0x50) / 2, 0x60));
    QCOMPARE(image.pixelColor(3, 2), QColor(0xB0, 0xC0, 0x80));
}

void ZtRawFrameTest::skipsPadding()
{
    const QByteArray bytes("\x11\x22\xEE\xEE\x33\x44", 6);
    const QImage image = rawFrame(bytes, QSize(2, 2), {ZtRawFormat::Mono, 8}, 2).toImage();
    QCOMPARE(colors(image), QStringList({QStringLiteral("111111"), QStringLiteral("222222"),
                                         QStringLiteral("333333"), QStringLiteral("444444")}));
}

void ZtRawFrameTest::incompleteFrames_data()
{
    QTest::addColumn<int>("bytes");
    QTest::addColumn<QSize>("size");
    QTest::newRow("too short") << 5 << QSize(3, 2);
    QTest::newRow("no width") << 5 << QSize(0, 2);
    QTest::newRow("negative") << 5 << QSize(-3, -2);
    QTest::newRow("huge") << 5 << QSize(2000000000, 2000000000);
}

void ZtRawFrameTest::incompleteFrames()
{
    QFETCH(int, bytes);
    QFETCH(QSize, size);
    const QByteArray buffer(bytes, 'x');
    ZtRawFrame frame = rawFrame(buffer, size, {ZtRawFormat::Mono, 8});
    QVERIFY(!frame.isComplete());
    QVERIFY(frame.toImage().isNull());
    frame = rawFrame(buffer, QSize(5, 1), {ZtRawFormat::Mono, 8});
    QVERIFY(frame.isComplete());
    frame.data = nullptr;
    QVERIFY(!frame.isComplete());
}

void ZtRawFrameTest::takesMemoryFromAPool()
{
    const QByteArray bytes("\x11\x22", 2);
    const ZtRawFrame frame = rawFrame(bytes, QSize(2, 1), {ZtRawFormat::Mono, 8});
    ZtFramePool pool;
    QImage image = frame.toImage(&pool);
    QCOMPARE(colors(image), colors(frame.toImage()));
    const uchar *const pixels = image.constBits();
    const QImage whileHeld = frame.toImage(&pool);
    QVERIFY(whileHeld.constBits() != pixels);
    image = QImage();
    QVERIFY(frame.toImage(&pool).constBits() == pixels);
}

STATREPORT_TEST_MAIN(ZtRawFrameTest)
#include "ZtRawFrameTest.moc"
