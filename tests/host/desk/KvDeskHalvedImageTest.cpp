// SPDX-License-Identifier: MIT
#include "KvDeskHalvedImage.h"

#include "support/StatReportTest.h"

#include <random>

Q_DECLARE_METATYPE(QImage::Format)

namespace {

QImage noise(const QSize &size, QImage::Format format)
{
    std::mt19937 random(7);
    std::uniform_int_distribution<int> level(0, 255);
    QImage image(size, QImage::Format_ARGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x)
            image.setPixel(x, y, qRgba(level(random), level(random), level(random), 255));
    }
    return image.convertToFormat(format);
}

using Channel = int (*)(QRgb);

/// The mean of a channel over the pixels that one of the reduced picture stands for.
double mean(const QImage &image, const QRect &block, Channel channel)
{
    const QRect inside = block & image.rect();
    double sum = 0.0;
    for (int y = inside.top(); y <= inside.bottom(); ++y) {
        for (int x = inside.left(); x <= inside.right(); ++x)
            sum += channel(image.pixel(x, y));
    }
    return sum / (inside.width() * inside.height());
}

} // namespace

class KvDeskHalvedImageTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void averages_data();
    void averages();
    void keepsTheBrightness();
    void oddSizesAreRoundedUp();
    void memoryIsUsedAgain();
    void picturesThatAreHeldStay();
    void keepsTransparency();
};

void KvDeskHalvedImageTest::averages_data()
{
    QTest::addColumn<QImage::Format>("format");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("times");
    for (int times = 1; times <= 3; ++times) {
        QTest::addRow("colours, %d", times) << QImage::Format_RGB32 << QSize(32, 24) << times;
        QTest::addRow("grey, %d", times) << QImage::Format_Grayscale8 << QSize(32, 24) << times;
        QTest::addRow("three bytes, %d", times) << QImage::Format_RGB888 << QSize(40, 24) << times;
        QTest::addRow("deep grey, %d", times) << QImage::Format_Grayscale16 << QSize(40, 24) << times;
    }
}

void KvDeskHalvedImageTest::averages()
{
    QFETCH(QImage::Format, format);
    QFETCH(QSize, size);
    QFETCH(int, times);
    const QImage image = noise(size, format);
    KvDeskHalvedImage halved;
    const QImage result = halved.of(image, times);
    const int side = 1 << times;
    QCOMPARE(result.size(), size / side);
    for (int y = 0; y < result.height(); ++y) {
        for (int x = 0; x < result.width(); ++x) {
            const QRect block(x * side, y * side, side, side);
            for (const Channel channel : {Channel(&qRed), Channel(&qGreen), Channel(&qBlue)})
                QVERIFY(qAbs(channel(result.pixel(x, y)) - mean(image, block, channel)) <= times);
        }
    }
}

void KvDeskHalvedImageTest::keepsTheBrightness()
{
    const QImage image = noise(QSize(256, 256), QImage::Format_Grayscale8);
    KvDeskHalvedImage halved;
    const QImage result = halved.of(image, 4);
    QVERIFY(qAbs(mean(result, result.rect(), &qRed) - mean(image, image.rect(), &qRed)) < 0.6);
}

void KvDeskHalvedImageTest::oddSizesAreRoundedUp()
{
    for (const QImage::Format format : {QImage::Format_RGB32, QImage::Format_Grayscale8}) {
        const QImage image = noise(QSize(7, 5), format);
        KvDeskHalvedImage halved;
        const QImage result = halved.of(image, 1);
        QCOMPARE(result.size(), QSize(4, 3));
        QCOMPARE(qRed(result.pixel(3, 2)), qRed(image.pixel(6, 4)));
        QVERIFY(qAbs(qRed(result.pixel(3, 0)) - mean(image, QRect(6, 0, 2, 2), &qRed)) <= 1.0);
        QCOMPARE(KvDeskHalvedImage().of(image, 4).size(), QSize(1, 1));
    }
}

void KvDeskHalvedImageTest::memoryIsUsedAgain()
{
    KvDeskHalvedImage halved;
    const uchar *const pixels = halved.of(noise(QSize(64, 64), QImage::Format_RGB32), 2).constBits();
    QImage other(64, 64, QImage::Format_RGB32);
    other.fill(Qt::blue);
    const QImage &result = halved.of(other, 2);
    QCOMPARE(result.constBits(), pixels);
    QCOMPARE(result.pixelColor(5, 5), QColor(Qt::blue));
}

void KvDeskHalvedImageTest::picturesThatAreHeldStay()
{
    KvDeskHalvedImage halved;
    QImage blue(64, 64, QImage::Format_RGB32);
    blue.fill(Qt::blue);
    const QImage held = halved.of(blue, 1);
    QImage red(64, 64, QImage::Format_RGB32);
    red.fill(Qt::red);
    QCOMPARE(halved.of(red, 1).pixelColor(3, 3), QColor(Qt::red));
    QCOMPARE(held.pixelColor(3, 3), QColor(Qt::blue));
}

void KvDeskHalvedImageTest::keepsTransparency()
{
    QImage image(2, 2, QImage::Format_ARGB32);
    image.fill(Qt::transparent);
    image.setPixel(0, 0, qRgba(200, 0, 0, 255));
    KvDeskHalvedImage halved;
    const QColor pixel = halved.of(image, 1).pixelColor(0, 0);
    QVERIFY(qAbs(pixel.alpha() - 64) <= 1);
    QVERIFY(qAbs(pixel.red() - 200) <= 6);
}

STATREPORT_TEST_MAIN(KvDeskHalvedImageTest)
#include "KvDeskHalvedImageTest.moc"
