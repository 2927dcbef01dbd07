// SPDX-License-Identifier: MIT
#include "KvDeskImageFrame.h"

#include "support/StatReportTest.h"

#include <QPainter>

namespace {

QImage halves()
{
    QImage image(8, 4, QImage::Format_RGB32);
    image.fill(Qt::red);
    QPainter(&image).fillRect(4, 0, 4, 4, Qt::green);
    return image;
}

QImage drawn(const KvDeskImageFrame &frame, const QSize &size, double scale)
{
    QImage canvas(size, QImage::Format_RGB32);
    canvas.fill(Qt::black);
    QPainter painter(&canvas);
    painter.scale(scale, scale);
    frame.draw(&painter, QRectF(QPointF(), QSizeF(size) / scale), scale);
    return canvas;
}

} // namespace

class KvDeskImageFrameTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void drawsPixelForPixel();
    void enlargesInPlainPixels();
    void liesInTheScene();
    void averagesWhenReduced();
    void drawsOnlyWhatIsExposed();
    void knowsWhatIsSet();
    void nothingIsDrawnWithoutAPicture();
};

void KvDeskImageFrameTest::drawsPixelForPixel()
{
    KvDeskImageFrame frame;
    frame.set(halves(), QRectF(0, 0, 8, 4));
    const QImage canvas = drawn(frame, QSize(10, 6), 1.0);
    QCOMPARE(canvas.copy(0, 0, 8, 4), halves());
    QCOMPARE(canvas.pixelColor(8, 0), QColor(Qt::black));
    QCOMPARE(canvas.pixelColor(0, 4), QColor(Qt::black));
}

void KvDeskImageFrameTest::enlargesInPlainPixels()
{
    KvDeskImageFrame frame;
    frame.set(halves(), QRectF(0, 0, 8, 4));
    const QImage canvas = drawn(frame, QSize(80, 40), 10.0);
    QCOMPARE(canvas.pixelColor(39, 20), QColor(Qt::red));
    QCOMPARE(canvas.pixelColor(40, 20), QColor(Qt::green));
}

void KvDeskImageFrameTest::liesInTheScene()
{
    KvDeskImageFrame frame;
    // Half a scene unit per pixel, two units to the right.
    frame.set(halves(), QRectF(2, 0, 4, 2));
    const QImage canvas = drawn(frame, QSize(20, 20), 2.0);
    QCOMPARE(canvas.pixelColor(3, 0), QColor(Qt::black));
    QCOMPARE(canvas.pixelColor(4, 0), QColor(Qt::red));
    QCOMPARE(canvas.pixelColor(11, 3), QColor(Qt::green));
    QCOMPARE(canvas.pixelColor(12, 0), QColor(Qt::black));
}

void KvDeskImageFrameTest::averagesWhenReduced()
{
    // Lines of one pixel: taking single pixels would give all white or all black.
    QImage lines(256, 256, QImage::Format_RGB32);
    for (int x = 0; x < 256; ++x)
        QPainter(&lines).fillRect(x, 0, 1, 256, x % 2 ? Qt::white : Qt::black);
    KvDeskImageFrame frame;
    frame.set(lines, QRectF(0, 0, 256, 256));
    const QImage canvas = drawn(frame, QSize(32, 32), 0.125);
    for (int x = 2; x < 30; ++x) {
        const int gray = qGray(canvas.pixel(x, 16));
        QVERIFY2(gray > 110 && gray < 145, qPrintable(QString::number(gray)));
    }
}

void KvDeskImageFrameTest::drawsOnlyWhatIsExposed()
{
    KvDeskImageFrame frame;
    frame.set(halves(), QRectF(0, 0, 8, 4));
    QImage canvas(8, 4, QImage::Format_RGB32);
    canvas.fill(Qt::black);
    {
        QPainter painter(&canvas);
        frame.draw(&painter, QRectF(6, 0, 2, 4), 1.0);
    }
    QCOMPARE(canvas.pixelColor(1, 1), QColor(Qt::black));
    QCOMPARE(canvas.pixelColor(7, 1), QColor(Qt::green));
}

void KvDeskImageFrameTest::knowsWhatIsSet()
{
    const QImage image = halves();
    KvDeskImageFrame frame;
    QVERIFY(frame.isNull());
    frame.set(image, QRectF(0, 0, 8, 4));
    QVERIFY(!frame.isNull());
    QVERIFY(frame.isSame(image, QRectF(0, 0, 8, 4)));
    QVERIFY(!frame.isSame(image, QRectF(1, 0, 8, 4)));
    QVERIFY(!frame.isSame(halves(), QRectF(0, 0, 8, 4)));
    frame.clear();
    QVERIFY(frame.isNull());
}

void KvDeskImageFrameTest::nothingIsDrawnWithoutAPicture()
{
    const QImage canvas = drawn(KvDeskImageFrame(), QSize(4, 4), 1.0);
    QCOMPARE(canvas.pixelColor(0, 0), QColor(Qt::black));
}

STATREPORT_TEST_MAIN(KvDeskImageFrameTest)
#include "KvDeskImageFrameTest.moc"
