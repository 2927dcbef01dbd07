// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtDeepGrey.h"

namespace {

QImage deepPixel(int value)
{
    QImage image(1, 1, QImage::Format_Grayscale16);
    *reinterpret_cast<quint16 *>(image.bits()) = static_cast<quint16>(value);
    return image;
}

} // namespace

class ZtDeepGreyTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void significantBits_data();
    void significantBits();
    void toEightBits_data();
    void toEightBits();
    void keepsTheResolution();
    void nothingOfNothing();
};

void ZtDeepGreyTest::significantBits_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("bits");
    QTest::newRow("black") << 0 << 8;
    QTest::newRow("eight") << 255 << 8;
    QTest::newRow("nine") << 256 << 9;
    QTest::newRow("ten") << 1023 << 10;
    QTest::newRow("eleven") << 1024 << 11;
    QTest::newRow("all") << 65535 << 16;
}

void ZtDeepGreyTest::significantBits()
{
    QFETCH(int, value);
    QFETCH(int, bits);
    QCOMPARE(ZtDeepGrey::significantBits(deepPixel(value)), bits);
}

void ZtDeepGreyTest::toEightBits_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("bits");
    QTest::addColumn<int>("shown");
    QTest::newRow("black") << 0 << 12 << 0;
    QTest::newRow("white") << 4095 << 12 << 255;
    QTest::newRow("beyond white") << 5000 << 12 << 255;
    QTest::newRow("rounded down") << 8 << 12 << 0;
    QTest::newRow("rounded up") << 9 << 12 << 1;
    QTest::newRow("eight bits stay") << 77 << 8 << 77;
    QTest::newRow("sixteen bits") << 65535 << 16 << 255;
}

void ZtDeepGreyTest::toEightBits()
{
    QFETCH(int, value);
    QFETCH(int, bits);
    QFETCH(int, shown);
    const QImage image = ZtDeepGrey::toEightBits(deepPixel(value), bits);
    QCOMPARE(image.format(), QImage::Format_Grayscale8);
    QCOMPARE(int(image.constBits()[0]), shown);
}

void ZtDeepGreyTest::keepsTheResolution()
{
    QImage image = deepPixel(1);
    image.setDotsPerMeterX(1234);
    image.setDotsPerMeterY(567);
    const QImage shown = ZtDeepGrey::toEightBits(image, 16);
    QCOMPARE(shown.dotsPerMeterX(), 1234);
    QCOMPARE(shown.dotsPerMeterY(), 567);
}

void ZtDeepGreyTest::nothingOfNothing()
{
    QCOMPARE(ZtDeepGrey::significantBits(QImage()), 8);
    QVERIFY(ZtDeepGrey::toEightBits(QImage(), 8).isNull());
}

STATREPORT_TEST_MAIN(ZtDeepGreyTest)
#include "ZtDeepGreyTest.moc"
