// SPDX-License-Identifier: MIT
#include "KvDeskMarks.h"

#include "gui/QtAdvancedStylesheet.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "support/StatReportTest.h"

#include <QPainter>

#include <functional>

namespace {

constexpr QSize size(200, 120);
const QPointF centre(100, 60);

using Draw = std::function<void(const KvDeskMarks &)>;

QImage drawn(const Draw &draw, const QColor &background = Qt::transparent)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(background);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    draw(KvDeskMarks(&painter));
    return image;
}

/// The smallest rectangle around all pixels that were painted.
QRect painted(const QImage &image)
{
    QRect result;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) > 40)
                result |= QRect(x, y, 1, 1);
        }
    }
    return result;
}

QColor color(const char *token)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
}

} // namespace

class KvDeskMarksTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void handleIsADotWithARim();
    void marksHaveTheirPlaceInTheMiddle_data();
    void marksHaveTheirPlaceInTheMiddle();
    void marksLeaveTheirPointFree_data();
    void marksLeaveTheirPointFree();
    void marksAreSeenOnAnyPicture_data();
    void marksAreSeenOnAnyPicture();
    void bandLetsThePictureThrough();
    void textLiesBesideThePoint();
    void textStaysOnThePage_data();
    void textStaysOnThePage();
    void emptyTextIsNothing();
};

void KvDeskMarksTest::handleIsADotWithARim()
{
    const QImage image = drawn([](const KvDeskMarks &marks) { marks.drawHandle(centre); });
    QCOMPARE(image.pixelColor(centre.toPoint()), color("on-accent"));
    // The pen is two pixels wide, half of it outside of the radius.
    const int outside = qRound(KvDeskMarks::handleRadius + 1.0);
    const QRect expected = QRect(centre.toPoint(), QSize()).adjusted(-outside, -outside, outside, outside);
    const QRect found = painted(image);
    QVERIFY(qAbs(found.left() - expected.left()) <= 1 && qAbs(found.width() - 2 * outside) <= 1);
    QCOMPARE(found.width(), found.height());
    QCOMPARE(image.pixelColor(95, 60).rgb(), color("accent").rgb());
}

void KvDeskMarksTest::marksHaveTheirPlaceInTheMiddle_data()
{
    QTest::addColumn<int>("mark");
    QTest::newRow("handle") << 0;
    QTest::newRow("snap mark") << 1;
    QTest::newRow("crosshair") << 2;
}

namespace {

void drawMark(const KvDeskMarks &marks, int mark)
{
    if (mark == 0)
        marks.drawHandle(centre);
    else if (mark == 1)
        marks.drawSnapMark(centre);
    else
        marks.drawCrosshair(centre);
}

} // namespace

void KvDeskMarksTest::marksHaveTheirPlaceInTheMiddle()
{
    QFETCH(int, mark);
    const QRect found = painted(drawn([mark](const KvDeskMarks &marks) { drawMark(marks, mark); }));
    QVERIFY(found.width() > 8 && found.width() < 40);
    QVERIFY(QLineF(QRectF(found).center(), centre).length() < 1.0);
}

void KvDeskMarksTest::marksLeaveTheirPointFree_data()
{
    QTest::addColumn<int>("mark");
    QTest::newRow("snap mark") << 1;
    QTest::newRow("crosshair") << 2;
}

void KvDeskMarksTest::marksLeaveTheirPointFree()
{
    QFETCH(int, mark);
    const QImage image = drawn([mark](const KvDeskMarks &marks) { drawMark(marks, mark); });
    QCOMPARE(qAlpha(image.pixel(centre.toPoint())), 0);
}

void KvDeskMarksTest::marksAreSeenOnAnyPicture_data()
{
    QTest::addColumn<int>("mark");
    QTest::addColumn<QColor>("background");
    for (int mark = 0; mark < 3; ++mark) {
        for (const QColor &background : {QColor(Qt::black), QColor(Qt::white), QColor(Qt::gray)})
            QTest::addRow("%d on %s", mark, qPrintable(background.name())) << mark << background;
    }
}

void KvDeskMarksTest::marksAreSeenOnAnyPicture()
{
    QFETCH(int, mark);
    QFETCH(QColor, background);
    const QImage image = drawn([mark](const KvDeskMarks &marks) { drawMark(marks, mark); }, background);
    int different = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            different += qAbs(qGray(image.pixel(x, y)) - qGray(background.rgb())) > 60 ? 1 : 0;
    }
    QVERIFY2(different > 15, qPrintable(QString::number(different)));
}

void KvDeskMarksTest::bandLetsThePictureThrough()
{
    const QRectF band(20, 20, 60, 40);
    const QImage image = drawn([&band](const KvDeskMarks &marks) { marks.drawBand(band); });
    const QRect found = painted(image);
    QVERIFY(qAbs(found.left() - 20) <= 1 && qAbs(found.right() - 80) <= 1 && qAbs(found.top() - 20) <= 1);
    const int inside = qAlpha(image.pixel(50, 40));
    QVERIFY(inside > 30 && inside < 80);
    QVERIFY(qAlpha(image.pixel(50, 20)) > inside);
}

void KvDeskMarksTest::textLiesBesideThePoint()
{
    const QString text = QStringLiteral("12.3 px");
    const QRect found = painted(drawn([&text](const KvDeskMarks &marks) {
        marks.drawText(QPointF(40, 30), text, QRectF(QPointF(), size));
    }));
    QVERIFY(found.left() > 40 && found.top() > 30);
    const QSize expected = ZtDrawnObjectPainter::labelSize(text).toSize();
    QVERIFY(qAbs(found.width() - expected.width()) <= 2 && qAbs(found.height() - expected.height()) <= 2);
}

void KvDeskMarksTest::textStaysOnThePage_data()
{
    QTest::addColumn<QPointF>("place");
    QTest::newRow("right") << QPointF(195, 30);
    QTest::newRow("bottom") << QPointF(40, 118);
    QTest::newRow("corner") << QPointF(198, 118);
}

void KvDeskMarksTest::textStaysOnThePage()
{
    QFETCH(QPointF, place);
    const QString text = QStringLiteral("12.3 px");
    const QRect found = painted(
        drawn([&](const KvDeskMarks &marks) { marks.drawText(place, text, QRectF(QPointF(), size)); }));
    // As large as anywhere else, and the point itself stays free.
    QVERIFY(qAbs(found.width() - qRound(ZtDrawnObjectPainter::labelSize(text).width())) <= 2);
    QVERIFY(QRect(QPoint(), size).adjusted(1, 1, -1, -1).contains(found));
    QVERIFY(!found.contains(place.toPoint()));
}

void KvDeskMarksTest::emptyTextIsNothing()
{
    const QImage image =
        drawn([](const KvDeskMarks &marks) { marks.drawText(centre, QString(), QRectF(QPointF(), size)); });
    QVERIFY(painted(image).isNull());
}

STATREPORT_TEST_MAIN(KvDeskMarksTest)
#include "KvDeskMarksTest.moc"
