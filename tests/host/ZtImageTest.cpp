// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "image/ZtImage.h"

namespace {

/// Every pixel tells where it was.
QImage coordinates(const QSize &size)
{
    QImage image(size, QImage::Format_RGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x)
            image.setPixel(x, y, qRgb(x, y, 0));
    }
    return image;
}

} // namespace

class ZtImageTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void aNewOneIsNull();
    void parts_data();
    void parts();
    void theWholePictureSharesItsPixels();
    void copiesAreIndependent();
};

void ZtImageTest::aNewOneIsNull()
{
    ZtImage image;
    QVERIFY(image.isNull());
    QCOMPARE(image.size(), QSize(0, 0));
    QVERIFY(image.getQImage().isNull());
    QVERIFY(image.getQImage(QRect(0, 0, 2, 2)).isNull());

    image.setQImage(coordinates(QSize(3, 2)));
    QVERIFY(!image.isNull());
    QCOMPARE(image.size(), QSize(3, 2));
}

void ZtImageTest::parts_data()
{
    QTest::addColumn<QRect>("rect");
    QTest::addColumn<QRect>("expected");
    QTest::newRow("null is the whole") << QRect() << QRect(0, 0, 10, 8);
    QTest::newRow("empty is the whole") << QRect(3, 3, 0, 5) << QRect(0, 0, 10, 8);
    QTest::newRow("the whole") << QRect(0, 0, 10, 8) << QRect(0, 0, 10, 8);
    QTest::newRow("inside") << QRect(2, 3, 4, 5) << QRect(2, 3, 4, 5);
    QTest::newRow("over the lower right corner") << QRect(7, 6, 10, 10) << QRect(7, 6, 3, 2);
    QTest::newRow("over the upper left corner") << QRect(-5, -5, 7, 6) << QRect(0, 0, 2, 1);
    QTest::newRow("around") << QRect(-5, -5, 50, 50) << QRect(0, 0, 10, 8);
    QTest::newRow("outside") << QRect(20, 20, 4, 4) << QRect();
}

void ZtImageTest::parts()
{
    QFETCH(QRect, rect);
    QFETCH(QRect, expected);
    const QImage whole = coordinates(QSize(10, 8));
    const QImage part = ZtImage(whole).getQImage(rect);
    QCOMPARE(part, expected.isEmpty() ? QImage() : whole.copy(expected));
}

void ZtImageTest::theWholePictureSharesItsPixels()
{
    const QImage picture = coordinates(QSize(4, 4));
    const ZtImage image(picture);
    QCOMPARE(image.getQImage().cacheKey(), picture.cacheKey());
}

void ZtImageTest::copiesAreIndependent()
{
    const ZtImage original(coordinates(QSize(4, 4)));
    ZtImage copy = original;
    QImage painted = copy.getQImage();
    painted.fill(Qt::red);
    copy.setQImage(painted);
    QCOMPARE(original.getQImage().pixel(0, 0), qRgb(0, 0, 0));
    QCOMPARE(copy.getQImage().pixel(0, 0), qRgb(255, 0, 0));
}

STATREPORT_TEST_MAIN(ZtImageTest)
#include "ZtImageTest.moc"
