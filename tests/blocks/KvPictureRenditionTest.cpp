// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvImageSamples.h"
#include "blocks/common/KvPictureRendition.h"

#include <QPainter>
#include <QPdfWriter>

using KvImageSamples::pixels;

class KvPictureRenditionTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void screenPicturesAreNoLargerThanShown_data();
    void screenPicturesAreNoLargerThanShown();
    void screenPicturesAreMadeOnce();
    void screenPicturesFollowTheZoom();
    void paperHasAllPixels_data();
    void paperHasAllPixels();
    void quarterTurnsOnlyMovePixels_data();
    void quarterTurnsOnlyMovePixels();
};

void KvPictureRenditionTest::screenPicturesAreNoLargerThanShown_data()
{
    QTest::addColumn<int>("degrees");
    QTest::addColumn<QSize>("size");
    QTest::addColumn<QSize>("made");
    QTest::newRow("smaller") << 0 << QSize(40, 30) << QSize(40, 30);
    QTest::newRow("smaller, turned") << 90 << QSize(30, 40) << QSize(30, 40);
    QTest::newRow("as it is") << 0 << QSize(400, 300) << QSize(400, 300);
    QTest::newRow("larger: left to the painter") << 0 << QSize(800, 600) << QSize(400, 300);
    QTest::newRow("larger, turned") << 270 << QSize(600, 800) << QSize(300, 400);
    QTest::newRow("hardly there") << 0 << QSize(1, 1) << QSize(1, 1);
}

void KvPictureRenditionTest::screenPicturesAreNoLargerThanShown()
{
    QFETCH(int, degrees);
    QFETCH(QSize, size);
    QImage screen(1000, 1000, QImage::Format_RGB32);
    QPainter painter(&screen);
    KvPictureRendition rendition;
    QTEST(rendition.make(KvImageSamples::plain(QSize(400, 300)), degrees, size, painter).size(), "made");
}

void KvPictureRenditionTest::screenPicturesAreMadeOnce()
{
    QImage screen(1000, 1000, QImage::Format_RGB32);
    QPainter painter(&screen);
    const QPixmap picture = KvImageSamples::plain(QSize(400, 300));
    KvPictureRendition rendition;
    const QSize size(40, 30);
    const qint64 first = rendition.make(picture, 0, size, painter).cacheKey();
    painter.translate(17, 4); // scrolled
    QCOMPARE(rendition.make(picture, 0, size, painter).cacheKey(), first);

    const QPixmap other = KvImageSamples::plain(QSize(400, 300), Qt::blue);
    const QPixmap ofOther = rendition.make(other, 0, size, painter);
    QVERIFY(ofOther.cacheKey() != first);
    QVERIFY(KvImageSamples::isLike(pixels(ofOther).pixel(20, 15), Qt::blue));
    const qint64 turned = rendition.make(other, 180, size, painter).cacheKey();
    QVERIFY(turned != ofOther.cacheKey());
    QVERIFY(rendition.make(other, 180, QSize(80, 60), painter).cacheKey() != turned);
}

void KvPictureRenditionTest::screenPicturesFollowTheZoom()
{
    QImage screen(1000, 1000, QImage::Format_RGB32);
    QPainter painter(&screen);
    painter.scale(2.0, 2.0);
    KvPictureRendition rendition;
    QCOMPARE(rendition.make(KvImageSamples::plain(QSize(400, 300)), 0, QSize(40, 30), painter).size(),
             QSize(80, 60));

    QImage fineScreen(1000, 1000, QImage::Format_RGB32);
    fineScreen.setDevicePixelRatio(3.0);
    QPainter finePainter(&fineScreen);
    QCOMPARE(rendition.make(KvImageSamples::plain(QSize(400, 300)), 0, QSize(40, 30), finePainter).size(),
             QSize(120, 90));
}

void KvPictureRenditionTest::paperHasAllPixels_data()
{
    QTest::addColumn<int>("degrees");
    QTest::addColumn<QSize>("made");
    QTest::newRow("upright") << 0 << QSize(40, 30);
    QTest::newRow("turned") << 90 << QSize(30, 40);
    QTest::newRow("upside down") << 180 << QSize(40, 30);
}

void KvPictureRenditionTest::paperHasAllPixels()
{
    QFETCH(int, degrees);
    QFETCH(QSize, made);
    const QPixmap picture = KvImageSamples::noise(QSize(40, 30));
    QPdfWriter writer(temporaryPath(QStringLiteral("rendition.pdf")));
    QPainter paper(&writer);
    QImage screen(100, 100, QImage::Format_RGB32);
    QPainter painter(&screen);
    KvPictureRendition rendition;
    QCOMPARE(rendition.make(picture, degrees, QSize(4, 4), painter).size(), QSize(4, 4));
    QCOMPARE(rendition.make(picture, degrees, QSize(4, 4), paper).size(), made);
    QCOMPARE(pixels(rendition.make(picture, 0, QSize(4, 3), paper)), pixels(picture));
}

void KvPictureRenditionTest::quarterTurnsOnlyMovePixels_data()
{
    QTest::addColumn<int>("degrees");
    QTest::newRow("0") << 0;
    QTest::newRow("90") << 90;
    QTest::newRow("180") << 180;
    QTest::newRow("270") << 270;
}

void KvPictureRenditionTest::quarterTurnsOnlyMovePixels()
{
    QFETCH(int, degrees);
    const QImage picture = pixels(KvImageSamples::noise(QSize(4, 3)));
    QPdfWriter writer(temporaryPath(QStringLiteral("rendition.pdf")));
    QPainter paper(&writer);
    KvPictureRendition rendition;
    const QImage made = pixels(rendition.make(QPixmap::fromImage(picture), degrees, QSize(100, 100), paper));
    for (int y = 0; y < 3; ++y) {
        for (int x = 0; x < 4; ++x) {
            const QPoint places[] = {{x, y}, {2 - y, x}, {3 - x, 2 - y}, {y, 3 - x}};
            QCOMPARE(made.pixel(places[degrees / 90]), picture.pixel(x, y));
        }
    }
}

STATREPORT_TEST_MAIN(KvPictureRenditionTest)
#include "KvPictureRenditionTest.moc"
