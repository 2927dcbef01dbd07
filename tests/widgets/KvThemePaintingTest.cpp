// SPDX-License-Identifier: MIT
#include "widgets/KvThemePainting.h"
#include "gui/QtAdvancedStylesheet.h"
#include "support/StatReportTest.h"

#include <QPainter>

class KvThemePaintingTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void colorsAreThoseOfTheTheme();
    void focusRingIsTwoPixelsInsideTheEdge();
};

void KvThemePaintingTest::colorsAreThoseOfTheTheme()
{
    auto *style = acss::QtAdvancedStylesheet::getInstance();
    QCOMPARE(KvThemePainting::color("text"), style->color(QStringLiteral("text")));
    QVERIFY(style->setCurrentTheme(QStringLiteral("Light")));
    QCOMPARE(KvThemePainting::color("text"), style->color(QStringLiteral("text")));
    QVERIFY(style->setCurrentTheme(QStringLiteral("Dark")));
    QVERIFY(!KvThemePainting::color("no such colour").isValid());
}

void KvThemePaintingTest::focusRingIsTwoPixelsInsideTheEdge()
{
    QImage image(40, 30, QImage::Format_ARGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    KvThemePainting::drawFocusRing(painter, image.rect(), Qt::red);
    painter.end();
    for (const int y : {0, 1, 28, 29})
        QCOMPARE(image.pixelColor(20, y), QColor(Qt::red));
    for (const int x : {0, 1, 38, 39})
        QCOMPARE(image.pixelColor(x, 15), QColor(Qt::red));
    for (const int y : {2, 15, 27})
        QCOMPARE(image.pixelColor(20, y), QColor(Qt::white));
    QVERIFY2(image.pixelColor(0, 0) != QColor(Qt::red), "the corners are round");
}

STATREPORT_TEST_MAIN(KvThemePaintingTest)
#include "KvThemePaintingTest.moc"
