// SPDX-License-Identifier: MIT
#include "widgets/KvThemedFrame.h"
#include "support/StatReportTest.h"
#include "widgets/KvThemePainting.h"

#include "gui/QtAdvancedStylesheet.h"

class KvThemedFrameTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void isFilledWithAThemeColor();
    void followsTheTheme();
    void hasLines_data();
    void hasLines();
};

void KvThemedFrameTest::cleanup()
{
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    StatReportTest::cleanup();
}

void KvThemedFrameTest::isFilledWithAThemeColor()
{
    KvThemedFrame frame;
    frame.resize(20, 20);
    QCOMPARE(frame.grab().toImage().pixelColor(0, 0), KvThemePainting::color("window"));
    frame.setColorName("panel");
    QCOMPARE(frame.grab().toImage().pixelColor(10, 10), KvThemePainting::color("panel"));
}

void KvThemedFrameTest::followsTheTheme()
{
    KvThemedFrame frame;
    frame.resize(20, 20);
    const QColor dark = frame.grab().toImage().pixelColor(10, 10);
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    const QColor light = frame.grab().toImage().pixelColor(10, 10);
    QCOMPARE(light, KvThemePainting::color("window"));
    QVERIFY(light != dark);
}

void KvThemedFrameTest::hasLines_data()
{
    QTest::addColumn<int>("edges");
    QTest::newRow("none") << 0;
    QTest::newRow("bottom") << int(Qt::BottomEdge);
    QTest::newRow("top and left") << int(Qt::TopEdge | Qt::LeftEdge);
    QTest::newRow("all") << int(Qt::TopEdge | Qt::BottomEdge | Qt::LeftEdge | Qt::RightEdge);
}

void KvThemedFrameTest::hasLines()
{
    QFETCH(int, edges);
    KvThemedFrame frame;
    frame.resize(20, 20);
    frame.setLines(Qt::Edges(edges));
    const QImage picture = frame.grab().toImage();
    const auto color = [edges](Qt::Edge edge) {
        return KvThemePainting::color((edges & edge) != 0 ? "line" : "window");
    };
    QCOMPARE(picture.pixelColor(0, 10), color(Qt::LeftEdge));
    QCOMPARE(picture.pixelColor(19, 10), color(Qt::RightEdge));
    QCOMPARE(picture.pixelColor(10, 0), color(Qt::TopEdge));
    QCOMPARE(picture.pixelColor(10, 19), color(Qt::BottomEdge));
    QCOMPARE(picture.pixelColor(1, 10), KvThemePainting::color("window"));
    QCOMPARE(frame.contentsMargins().bottom(), (edges & Qt::BottomEdge) != 0 ? 1 : 0);
    QCOMPARE(frame.contentsMargins().left(), (edges & Qt::LeftEdge) != 0 ? 1 : 0);
}

STATREPORT_TEST_MAIN(KvThemedFrameTest)
#include "KvThemedFrameTest.moc"
