// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/Polygon.h"
#include "image/ZtImage.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtImageTools.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtObjectsPainter.h"
#include "measuring/ZtScaleBar.h"
#include "measuring/ZtUnitSettings.h"

#include <QPainter>

#include <limits>

Q_DECLARE_METATYPE(ZtCalibration)

namespace {

QImage black(const QSize &size)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(Qt::black);
    return image;
}

/// The smallest rectangle with all pixels that are nearly white.
QRect whitePart(const QImage &image)
{
    QRect part;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qGray(image.pixel(x, y)) > 200)
                part |= QRect(x, y, 1, 1);
        }
    }
    return part;
}

} // namespace

class ZtScaleBarTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();

    void roundsLengths_data();
    void roundsLengths();
    void everyLengthIsRoundAndNotTooSmall();
    void choosesTheBar_data();
    void choosesTheBar();
    void readsInTheChosenUnit();
    void liesAtTheLowerRight();
    void leavesOutWhatHasNoRoom();
    void comesWithTheObjectsOnlyWhenShown_data();
    void comesWithTheObjectsOnlyWhenShown();
    void isBurntIntoPictures();
};

void ZtScaleBarTest::init()
{
    StatReportTest::init();
    ZtUnitSettings::getInstance();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void ZtScaleBarTest::roundsLengths_data()
{
    QTest::addColumn<double>("atMost");
    QTest::addColumn<double>("rounded");
    QTest::newRow("1") << 1.0 << 1.0;
    QTest::newRow("below 2") << 1.999 << 1.0;
    QTest::newRow("2") << 2.0 << 2.0;
    QTest::newRow("below 5") << 4.99 << 2.0;
    QTest::newRow("5") << 5.0 << 5.0;
    QTest::newRow("below 10") << 9.99 << 5.0;
    QTest::newRow("10") << 10.0 << 10.0;
    QTest::newRow("1000, whose logarithm is rounded") << 1000.0 << 1000.0;
    QTest::newRow("sum of tenths") << 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 << 1.0;
    QTest::newRow("small") << 0.00037 << 0.0002;
    QTest::newRow("large") << 7.3e12 << 5e12;
    QTest::newRow("0") << 0.0 << 0.0;
    QTest::newRow("negative") << -3.0 << 0.0;
    QTest::newRow("infinite") << std::numeric_limits<double>::infinity() << 0.0;
    QTest::newRow("no number") << std::numeric_limits<double>::quiet_NaN() << 0.0;
}

void ZtScaleBarTest::roundsLengths()
{
    QFETCH(double, atMost);
    QTEST(ZtScaleBar::roundLength(atMost), "rounded");
}

void ZtScaleBarTest::everyLengthIsRoundAndNotTooSmall()
{
    for (double length = 1e-6; length < 1e6; length *= 1.07) {
        const double rounded = ZtScaleBar::roundLength(length);
        QVERIFY2(rounded <= length * 1.000001 && rounded > length / 2.5000001,
                 qPrintable(QString::number(length)));
        const QString digits = QString::number(rounded, 'e', 6);
        QVERIFY2(digits.startsWith(QLatin1String("1.000000")) ||
                     digits.startsWith(QLatin1String("2.000000")) ||
                     digits.startsWith(QLatin1String("5.000000")),
                 qPrintable(digits));
    }
}

void ZtScaleBarTest::choosesTheBar_data()
{
    QTest::addColumn<ZtCalibration>("calibration");
    QTest::addColumn<double>("scale");
    QTest::addColumn<double>("pageWidth");
    QTest::addColumn<double>("length");
    QTest::addColumn<QString>("text");
    const auto text = [](const char *utf8) { return QString::fromUtf8(utf8); };
    QTest::newRow("micrometres") << ZtCalibration(0.5) << 1.0 << 800.0 << 200.0 << text("100 μm");
    QTest::newRow("twice the zoom") << ZtCalibration(0.5) << 2.0 << 800.0 << 200.0 << text("50 μm");
    QTest::newRow("nanometres") << ZtCalibration(0.001) << 1.0 << 800.0 << 200.0 << text("200 nm");
    QTest::newRow("millimetres") << ZtCalibration(12.5) << 1.0 << 800.0 << 160.0 << text("2 mm");
    QTest::newRow("centimetres") << ZtCalibration(100.0) << 1.0 << 800.0 << 200.0 << text("2 cm");
    QTest::newRow("metres") << ZtCalibration(1e5) << 1.0 << 800.0 << 200.0 << text("20 m");
    QTest::newRow("the width counts") << ZtCalibration(0.5, 3.0) << 1.0 << 800.0 << 200.0 << text("100 μm");
    QTest::newRow("uncalibrated") << ZtCalibration() << 1.0 << 800.0 << 200.0 << text("200 px");
    QTest::newRow("large page") << ZtCalibration(0.5) << 1.0 << 4000.0 << 200.0 << text("100 μm");
    QTest::newRow("small page") << ZtCalibration(0.5) << 1.0 << 120.0 << 20.0 << text("10 μm");
    QTest::newRow("too small a page") << ZtCalibration(0.5) << 1.0 << 119.0 << 0.0 << QString();
    QTest::newRow("no scale") << ZtCalibration(0.5) << 0.0 << 800.0 << 0.0 << QString();
}

void ZtScaleBarTest::choosesTheBar()
{
    QFETCH(ZtCalibration, calibration);
    QFETCH(double, scale);
    QFETCH(double, pageWidth);
    const ZtScaleBar bar = ZtScaleBar::choose(calibration, scale, pageWidth);
    QTEST(bar.length, "length");
    QTEST(bar.text, "text");
}

void ZtScaleBarTest::readsInTheChosenUnit()
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("LengthUnit"), QStringLiteral("mm"));
    ZtAppSettings::endGroup();
    const ZtScaleBar bar = ZtScaleBar::choose(ZtCalibration(0.5), 1.0, 800.0);
    ZtAppSettings::getInstance()->setStoragePath(QString());
    QCOMPARE(bar.text, QStringLiteral("0.1 mm"));
    QCOMPARE(bar.length, 200.0);
}

void ZtScaleBarTest::liesAtTheLowerRight()
{
    QImage image = black(QSize(800, 600));
    QPainter painter(&image);
    painter.scale(3.0, 3.0);
    const QTransform before = painter.worldTransform();
    const ZtScaleBar bar{200.0, QStringLiteral("100 \u03BCm")};
    bar.draw(&painter, QRectF(0, 0, 700, 500));
    QCOMPARE(painter.worldTransform(), before);
    painter.end();
    const QRect part = whitePart(image);
    QCOMPARE(part.width(), 200);
    QCOMPARE(part.right() + 1, 700 - 24);
    QCOMPARE(part.bottom() + 1, 500 - 24);
    QVERIFY(part.height() > 12 && part.height() < 30);
}

void ZtScaleBarTest::leavesOutWhatHasNoRoom()
{
    QImage image = black(QSize(800, 600));
    QPainter painter(&image);
    const ZtScaleBar bar{200.0, QStringLiteral("1 mm")};
    bar.draw(&painter, QRectF(0, 0, 210, 500));
    bar.draw(&painter, QRectF(0, 0, 800, 30));
    ZtScaleBar().draw(&painter, QRectF(0, 0, 800, 600));
    painter.end();
    QCOMPARE(image, black(image.size()));
}

void ZtScaleBarTest::comesWithTheObjectsOnlyWhenShown_data()
{
    QTest::addColumn<bool>("isShown");
    QTest::addColumn<QList<int>>("types");
    QTest::addColumn<bool>("isDrawn");
    QTest::newRow("not shown") << false << QList<int>() << false;
    QTest::newRow("shown") << true << QList<int>() << true;
    QTest::newRow("some types only") << true << QList<int>{ZtDrawnType::Line} << false;
}

void ZtScaleBarTest::comesWithTheObjectsOnlyWhenShown()
{
    QFETCH(bool, isShown);
    QFETCH(QList<int>, types);
    ZtObjectsPainter objects(std::make_shared<ZtCalibration>(0.5));
    QVERIFY(!objects.isScaleBarShown());
    objects.setScaleBarShown(isShown);
    QImage image = black(QSize(800, 600));
    QPainter painter(&image);
    objects.drawObjects(&painter, types);
    painter.end();
    QTEST(image != black(image.size()), "isDrawn");
}

// On a large picture it is drawn in proportion, as on the screen.
void ZtScaleBarTest::isBurntIntoPictures()
{
    ZtMeasuringDocument document;
    document.setCalibration(ZtCalibration(0.5));
    document.objectsPainter()->setScaleBarShown(true);
    ZtImage image(black(QSize(2560, 1920)));
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&image, QTransform(), QList<int>());
    const QRect part = whitePart(image.getQImage());
    QCOMPARE(part.width(), 400); // 200 micrometres
    QCOMPARE(part.right() + 1, 2560 - 48);
    QCOMPARE(part.bottom() + 1, 1920 - 48);
}

STATREPORT_TEST_MAIN(ZtScaleBarTest)
#include "ZtScaleBarTest.moc"
