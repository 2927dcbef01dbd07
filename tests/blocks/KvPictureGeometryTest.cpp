// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/common/KvPictureGeometry.h"

class KvPictureGeometryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void turnsSizes_data();
    void turnsSizes();
    void fitsPictures_data();
    void fitsPictures();
    void everyPercentIsExact();
    void blocksAreAsWideAsTheirRoom_data();
    void blocksAreAsWideAsTheirRoom();
    void placesPictures_data();
    void placesPictures();
};

void KvPictureGeometryTest::turnsSizes_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<int>("degrees");
    QTest::addColumn<QSize>("turned");
    QTest::newRow("0") << QSize(400, 300) << 0 << QSize(400, 300);
    QTest::newRow("90") << QSize(400, 300) << 90 << QSize(300, 400);
    QTest::newRow("180") << QSize(400, 300) << 180 << QSize(400, 300);
    QTest::newRow("270") << QSize(400, 300) << 270 << QSize(300, 400);
    QTest::newRow("square") << QSize(5, 5) << 90 << QSize(5, 5);
    QTest::newRow("odd numbers") << QSize(4001, 1) << 270 << QSize(1, 4001);
    QTest::newRow("once around and a quarter") << QSize(400, 300) << 450 << QSize(300, 400);
    QTest::newRow("the other way") << QSize(400, 300) << -90 << QSize(300, 400);
    QTest::newRow("an eighth: all of it fits in") << QSize(100, 100) << 45 << QSize(141, 141);
    QTest::newRow("nothing") << QSize(0, 0) << 90 << QSize(0, 0);
    QTest::newRow("far around") << QSize(400, 300) << 2147483647
                                << QTransform().rotate(127).mapRect(QRectF(0, 0, 400, 300)).size().toSize();
}

void KvPictureGeometryTest::turnsSizes()
{
    QFETCH(QSize, picture);
    QFETCH(int, degrees);
    QTEST(KvPictureGeometry::turned(picture, degrees), "turned");
}

void KvPictureGeometryTest::fitsPictures_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QSize>("room");
    QTest::addColumn<int>("percent");
    QTest::addColumn<QSize>("fitted");
    const QSize page(724, 1302); // a page of 952 by 1346 with its margins
    QTest::newRow("as wide as it may be") << QSize(800, 400) << page << 100 << QSize(724, 362);
    QTest::newRow("three quarters") << QSize(800, 400) << page << 75 << QSize(543, 271);
    QTest::newRow("enlarged") << QSize(8, 4) << page << 100 << QSize(724, 362);
    QTest::newRow("very tall") << QSize(100, 1000) << page << 100 << QSize(130, 1302);
    QTest::newRow("as tall as the page") << QSize(724, 1302) << page << 100 << QSize(724, 1302);
    QTest::newRow("very tall, narrow share") << QSize(100, 10000) << page << 1 << QSize(7, 700);
    QTest::newRow("a line stays visible") << QSize(10000, 1) << page << 100 << QSize(724, 1);
    QTest::newRow("an upright line, too") << QSize(1, 10000) << page << 100 << QSize(1, 1302);
    QTest::newRow("one percent") << QSize(100, 100) << page << 1 << QSize(7, 7);
    QTest::newRow("no picture") << QSize(0, 0) << page << 75 << QSize(0, 0);
    QTest::newRow("none, and not even that") << QSize() << page << 75 << QSize(0, 0);
    QTest::newRow("no width") << QSize(4, 3) << QSize(0, 100) << 75 << QSize(0, 0);
    QTest::newRow("no height") << QSize(4, 3) << QSize(100, 0) << 75 << QSize(0, 0);
    QTest::newRow("less than none") << QSize(4, 3) << QSize(-100, -100) << 75 << QSize(0, 0);
    QTest::newRow("a share of nothing") << QSize(4, 3) << page << 0 << QSize(0, 0);
    QTest::newRow("less than nothing") << QSize(4, 3) << page << -75 << QSize(0, 0);
    QTest::newRow("more than all") << QSize(800, 400) << page << 150 << QSize(1086, 543);
    QTest::newRow("far more") << QSize(4, 3) << page << 2147483647 << QSize(1736, 1302);
    QTest::newRow("far less") << QSize(4, 3) << page << int(-2147483647 - 1) << QSize(0, 0);
}

void KvPictureGeometryTest::fitsPictures()
{
    QFETCH(QSize, picture);
    QFETCH(QSize, room);
    QFETCH(int, percent);
    QTEST(KvPictureGeometry::fitted(picture, room, percent), "fitted");
}

void KvPictureGeometryTest::everyPercentIsExact()
{
    for (int percent = 1; percent <= 100; ++percent)
        QCOMPARE(KvPictureGeometry::fitted(QSize(10, 1), QSize(200, 1000), percent).width(), 2 * percent);
}

void KvPictureGeometryTest::blocksAreAsWideAsTheirRoom_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<int>("percent");
    QTest::addColumn<QSize>("block");
    QTest::newRow("normal") << QSize(800, 400) << 50 << QSize(724, 181);
    QTest::newRow("flat") << QSize(1000, 10) << 100 << QSize(724, 20);
    QTest::newRow("just as high as the least") << QSize(724, 20) << 100 << QSize(724, 20);
    QTest::newRow("one more") << QSize(724, 21) << 100 << QSize(724, 21);
    QTest::newRow("tall") << QSize(10, 1000) << 75 << QSize(724, 1302);
    QTest::newRow("no picture") << QSize(0, 0) << 75 << QSize(724, 20);
}

void KvPictureGeometryTest::blocksAreAsWideAsTheirRoom()
{
    QFETCH(QSize, picture);
    QFETCH(int, percent);
    QTEST(KvPictureGeometry::blockSize(picture, QSize(724, 1302), percent), "block");
}

void KvPictureGeometryTest::placesPictures_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("percent");
    QTest::addColumn<QRect>("place");
    QTest::newRow("left") << 1 << 50 << QRect(0, 0, 100, 50);
    QTest::newRow("right") << 2 << 50 << QRect(101, 0, 100, 50);
    QTest::newRow("centred both ways") << 132 << 50 << QRect(50, 0, 100, 50);
    QTest::newRow("centred") << 4 << 50 << QRect(50, 0, 100, 50);
    QTest::newRow("vertically only") << 128 << 50 << QRect(0, 0, 100, 50);
    QTest::newRow("nothing") << 0 << 50 << QRect(0, 0, 100, 50);
    QTest::newRow("right, vertically centred") << 130 << 50 << QRect(101, 0, 100, 50);
    QTest::newRow("all of the width") << 2 << 100 << QRect(0, 0, 201, 100);
    QTest::newRow("limited by the height") << 2 << 300 << QRect(-79, 0, 280, 140);
    QTest::newRow("left and too wide") << 1 << 300 << QRect(0, 0, 280, 140);
}

void KvPictureGeometryTest::placesPictures()
{
    QFETCH(int, alignment);
    QFETCH(int, percent);
    QTEST(KvPictureGeometry::placed(QSize(200, 100), QSize(201, 140), percent, Qt::Alignment(alignment)),
          "place");
}

STATREPORT_TEST_MAIN(KvPictureGeometryTest)
#include "KvPictureGeometryTest.moc"
