// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/FakeManipulator.h"
#include "image/ZtImage.h"
#include "kernel/ZtImageTools.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"

namespace {

constexpr int redType = 1;
constexpr int blueType = 2;

ZtImage whiteImage()
{
    QImage image(32, 32, QImage::Format_RGB32);
    image.fill(Qt::white);
    return ZtImage(image);
}

QColor colorAt(const ZtImage &image, int x, int y)
{
    return image.getQImage().pixelColor(x, y);
}

} // namespace

class ZtImageToolsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanupTestCase();
    void nothingIsDrawnOnNothing();
    void drawsTheWantedTypes_data();
    void drawsTheWantedTypes();
    void drawsThroughTheTransform();
    void drawsInColourOnEveryFormat_data();
    void drawsInColourOnEveryFormat();
    void transparencyStays();
    void typesWithoutAManipulatorAreSkipped();
};

/// A red square at (2, 2) and another at (10, 10), a blue one at (20, 20).
void ZtImageToolsTest::initTestCase()
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    kernel->registerType(redType, std::make_unique<FakeManipulator>(redType, Qt::red), nullptr);
    kernel->registerType(blueType, std::make_unique<FakeManipulator>(blueType, Qt::blue), nullptr);
    kernel->addObject(redType, std::make_unique<ZtKernelObjectData>(), 2);
    kernel->addObject(redType, std::make_unique<ZtKernelObjectData>(), 10);
    kernel->addObject(blueType, std::make_unique<ZtKernelObjectData>(), 20);
}

void ZtImageToolsTest::cleanupTestCase()
{
    ZtKernelData::getInstance()->unregisterType(redType);
    ZtKernelData::getInstance()->unregisterType(blueType);
}

void ZtImageToolsTest::nothingIsDrawnOnNothing()
{
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(nullptr, QTransform());
    ZtImage empty;
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&empty, QTransform());
    QVERIFY(empty.isNull());
}

void ZtImageToolsTest::drawsTheWantedTypes_data()
{
    QTest::addColumn<QList<int>>("types");
    QTest::addColumn<bool>("red");
    QTest::addColumn<bool>("blue");
    QTest::newRow("all") << QList<int>() << true << true;
    QTest::newRow("red") << QList<int>{redType} << true << false;
    QTest::newRow("blue") << QList<int>{blueType} << false << true;
    QTest::newRow("both") << QList<int>{blueType, redType} << true << true;
    QTest::newRow("unknown") << QList<int>{99} << false << false;
}

void ZtImageToolsTest::drawsTheWantedTypes()
{
    QFETCH(QList<int>, types);
    QFETCH(bool, red);
    QFETCH(bool, blue);
    ZtImage image = whiteImage();
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, QTransform(), types);
    QCOMPARE(colorAt(image, 3, 3), QColor(red ? Qt::red : Qt::white));
    QCOMPARE(colorAt(image, 12, 12), QColor(red ? Qt::red : Qt::white));
    QCOMPARE(colorAt(image, 22, 22), QColor(blue ? Qt::blue : Qt::white));
    QCOMPARE(colorAt(image, 28, 28), QColor(Qt::white));
}

void ZtImageToolsTest::drawsThroughTheTransform()
{
    ZtImage image = whiteImage();
    const QTransform transform = QTransform::fromScale(2, 2) * QTransform::fromTranslate(-4, 0);
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, transform, {redType});
    // The square from (2, 2) to (6, 6) comes out from (0, 4) to (8, 12).
    QCOMPARE(colorAt(image, 0, 4), QColor(Qt::red));
    QCOMPARE(colorAt(image, 7, 11), QColor(Qt::red));
    QCOMPARE(colorAt(image, 8, 11), QColor(Qt::white));
    QCOMPARE(colorAt(image, 0, 3), QColor(Qt::white));
}

void ZtImageToolsTest::drawsInColourOnEveryFormat_data()
{
    QTest::addColumn<int>("format");
    QTest::newRow("mono") << int(QImage::Format_Mono);
    QTest::newRow("indexed") << int(QImage::Format_Indexed8);
    QTest::newRow("grey") << int(QImage::Format_Grayscale8);
    QTest::newRow("grey, 16 bits") << int(QImage::Format_Grayscale16);
    QTest::newRow("rgb") << int(QImage::Format_RGB888);
    QTest::newRow("rgb, 32 bits") << int(QImage::Format_RGB32);
    QTest::newRow("argb") << int(QImage::Format_ARGB32);
}

void ZtImageToolsTest::drawsInColourOnEveryFormat()
{
    QFETCH(int, format);
    ZtImage image(whiteImage().getQImage().convertToFormat(static_cast<QImage::Format>(format)));
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, QTransform());
    QCOMPARE(colorAt(image, 3, 3), QColor(Qt::red));
    QCOMPARE(colorAt(image, 22, 22), QColor(Qt::blue));
    QCOMPARE(colorAt(image, 30, 30), QColor(Qt::white));
}

void ZtImageToolsTest::transparencyStays()
{
    QImage source(32, 32, QImage::Format_ARGB32);
    source.fill(Qt::transparent);
    ZtImage image(source);
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, QTransform());
    QCOMPARE(colorAt(image, 30, 30).alpha(), 0);
    QCOMPARE(colorAt(image, 3, 3), QColor(Qt::red));
}

void ZtImageToolsTest::typesWithoutAManipulatorAreSkipped()
{
    constexpr int bareType = 3;
    ZtKernelData::getInstance()->addObject(bareType, std::make_unique<ZtKernelObjectData>());
    ZtImage image = whiteImage();
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, QTransform());
    QCOMPARE(colorAt(image, 3, 3), QColor(Qt::red));
    ZtKernelData::getInstance()->unregisterType(bareType);
}

STATREPORT_TEST_MAIN(ZtImageToolsTest)
#include "ZtImageToolsTest.moc"
