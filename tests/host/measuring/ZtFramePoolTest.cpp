// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFramePool.h"

namespace {

constexpr QImage::Format format = QImage::Format_RGB32;
const QSize size(20, 10);

} // namespace

class ZtFramePoolTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void usesFreePicturesAgain();
    void leavesHeldPicturesAlone();
    void forgetsOtherSizes();
    void isLimited();
};

void ZtFramePoolTest::usesFreePicturesAgain()
{
    ZtFramePool pool;
    QImage image = pool.take(size, format);
    QCOMPARE(image.size(), size);
    QCOMPARE(image.format(), format);
    const uchar *const pixels = image.constBits();
    pool.keep(image);
    image = QImage();
    QImage again = pool.take(size, format);
    // Writing does not copy it either.
    QVERIFY(again.bits() == pixels);
}

void ZtFramePoolTest::leavesHeldPicturesAlone()
{
    ZtFramePool pool;
    QImage image = pool.take(size, format);
    image.fill(Qt::red);
    pool.keep(image);
    QImage other = pool.take(size, format);
    QVERIFY(other.constBits() != image.constBits());
    other.fill(Qt::blue);
    QCOMPARE(image.pixelColor(0, 0), QColor(Qt::red));
}

void ZtFramePoolTest::forgetsOtherSizes()
{
    ZtFramePool pool;
    for (int i = 0; i < 3; ++i)
        pool.keep(QImage(size, format));
    QCOMPARE(pool.take(QSize(5, 5), format).size(), QSize(5, 5));
    QCOMPARE(pool.take(size, QImage::Format_Grayscale8).format(), QImage::Format_Grayscale8);
    QVERIFY(pool.take(QSize(), format).isNull());
}

void ZtFramePoolTest::isLimited()
{
    ZtFramePool pool;
    QVector<const uchar *> kept;
    QVector<QImage> held;
    for (int i = 0; i < ZtFramePool::capacity + 2; ++i) {
        held.append(pool.take(size, format));
        kept.append(held.last().constBits());
        pool.keep(held.last());
    }
    // Those above the limit die with their last holder; the others come back in their order.
    held.clear();
    QVector<QImage> again;
    for (int i = 0; i < ZtFramePool::capacity; ++i) {
        again.append(pool.take(size, format));
        QVERIFY(again.last().constBits() == kept.at(i));
    }
}

STATREPORT_TEST_MAIN(ZtFramePoolTest)
#include "ZtFramePoolTest.moc"
