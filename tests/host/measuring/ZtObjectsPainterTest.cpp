// SPDX-License-Identifier: MIT
#include "measuring/ZtObjectsPainter.h"

#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtLabelLayout.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QPainter>

#include <cmath>
#include <random>

namespace {

constexpr QSize size(640, 480);
const QRectF page(QPointF(), size);

} // namespace

class ZtObjectsPainterTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void labelsReadAsTheirObjects();
    void labelsKeepClearOfHandles_data();
    void labelsKeepClearOfHandles();
    void labelsDoNotOverlap();
    void labelsStayOnThePage();
    void onlyTextsHaveLabelsWhereCrowded();
    void hiddenLabelsAreLeftOut();
    void objectsThatAreGoneHaveNone();
    void drawsTheTypesThatAreAskedFor();
    void drawsEveryObjectHoweverMany();
    void countersHaveTheirColours();
    void counterColoursDiffer();
    void firstCountersAreSeenOnStainedCells();
    void scaleBarNeedsACalibration();
    void scaleBarBelongsToAllTypes();

private:
    ZtObjectsPainter::Object add(int type, const QPolygonF &points, const QString &text = QString())
    {
        return {type, m_document.addObject(type, points, QString(), text)};
    }
    QVector<ZtDrawnLabel> labels(const QVector<ZtObjectsPainter::Object> &objects,
                                 const QTransform &toDevice = QTransform()) const
    {
        return m_document.objectsPainter()->labels(objects, toDevice, page);
    }
    static QImage drawn(const ZtObjectsPainter &painter, const QList<int> &types = {})
    {
        QImage image(size, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::transparent);
        QPainter onImage(&image);
        painter.drawObjects(&onImage, types);
        return image;
    }
    static bool isEmpty(const QImage &image)
    {
        QImage empty(image.size(), image.format());
        empty.fill(Qt::transparent);
        return image == empty;
    }

    ZtMeasuringDocument m_document;
};

void ZtObjectsPainterTest::cleanup()
{
    m_document.clear();
    m_document.objectsPainter()->setLabelsShown(true);
    m_document.objectsPainter()->setScaleBarShown(false);
    StatReportTest::cleanup();
}

void ZtObjectsPainterTest::labelsReadAsTheirObjects()
{
    const QVector<ZtDrawnLabel> found =
        labels({add(ZtDrawnType::Line, polygon({{100, 100}, {103, 104}})),
                add(ZtDrawnType::TextNote, polygon({{300, 300}}), QStringLiteral("Look here")),
                add(ZtDrawnType::Counter, polygon({{200, 200}, {220, 220}}))});
    QCOMPARE(found.size(), 3);
    QCOMPARE(found.at(0).text, QStringLiteral("Line 1  5.0 px"));
    QCOMPARE(found.at(1).text, QStringLiteral("Look here"));
    QCOMPARE(found.at(2).text, QStringLiteral("Counter 1  2 pcs"));
    for (const ZtDrawnLabel &label : found)
        QCOMPARE(label.box.size(), ZtDrawnObjectPainter::labelSize(label.text));
}

void ZtObjectsPainterTest::labelsKeepClearOfHandles_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    const auto row = [](int type, const QPolygonF &points) {
        QTest::newRow(ZtDrawnType::find(type)->key) << type << points;
    };
    row(ZtDrawnType::Rectangle, polygon({{60, 60}, {75, 70}}));
    row(ZtDrawnType::Line, polygon({{60, 60}, {90, 45}}));
    row(ZtDrawnType::Arc, polygon({{60, 60}, {75, 45}, {90, 60}}));
    row(ZtDrawnType::Polygon, polygon({{60, 60}, {80, 50}, {90, 40}, {100, 45}, {50, 40}, {70, 75}}));
    row(ZtDrawnType::Polyline, polygon({{60, 60}, {80, 50}, {90, 40}, {50, 40}, {70, 75}}));
    row(ZtDrawnType::ParallelDistance, polygon({{60, 60}, {90, 60}, {70, 45}}));
    row(ZtDrawnType::TextNote, polygon({{60, 60}}));
    row(ZtDrawnType::ScaleBar, polygon({{60, 60}, {120, 60}}));
    row(ZtDrawnType::Counter, polygon({{60, 60}, {75, 50}, {45, 50}, {75, 72}, {45, 72}}));
    row(ZtDrawnType::Circle, polygon({{60, 60}, {75, 60}}));
}

void ZtObjectsPainterTest::labelsKeepClearOfHandles()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    const ZtObjectsPainter::Object object = add(type, points, QStringLiteral("A note of some words"));
    for (const double zoom : {0.5, 1.0, 3.0}) {
        const QTransform toDevice = QTransform::fromScale(zoom, zoom);
        const QVector<ZtDrawnLabel> found = labels({object}, toDevice);
        QCOMPARE(found.size(), 1);
        QVERIFY(!found.first().box.isNull());
        constexpr double room = ZtLabelLayout::handleRoom - 0.01;
        const QRectF wide = found.first().box.adjusted(-room, -room, room, room);
        for (const QPointF &handle : toDevice.map(points))
            QVERIFY(!wide.contains(handle));
    }
}

void ZtObjectsPainterTest::labelsDoNotOverlap()
{
    std::mt19937 random(3);
    std::uniform_real_distribution<double> x(0.0, size.width());
    std::uniform_real_distribution<double> y(0.0, size.height());
    QVector<ZtObjectsPainter::Object> objects;
    for (int i = 0; i < 200; ++i) {
        const QPointF start(x(random), y(random));
        objects.append(
            add(i % 2 ? ZtDrawnType::Line : ZtDrawnType::Circle, polygon({start, start + QPointF(20, 10)})));
    }
    const QVector<ZtDrawnLabel> found = labels(objects);
    int shown = 0;
    for (int i = 0; i < found.size(); ++i) {
        shown += found.at(i).box.isNull() ? 0 : 1;
        for (int j = 0; j < i && !found.at(i).box.isNull(); ++j)
            QVERIFY(!found.at(i).box.intersects(found.at(j).box));
    }
    QVERIFY2(shown > 40 && shown < 200, qPrintable(QString::number(shown)));
    // The first one is the most important.
    QVERIFY(!found.first().box.isNull());
}

void ZtObjectsPainterTest::labelsStayOnThePage()
{
    for (const QPointF &corner : {page.topLeft(), page.topRight(), page.bottomLeft(), page.bottomRight()}) {
        const QPointF inside = corner + (page.center() - corner) * 0.02;
        const QVector<ZtDrawnLabel> found = labels({add(ZtDrawnType::Line, polygon({corner, inside}))});
        QVERIFY(!found.first().box.isNull());
        QVERIFY(page.contains(found.first().box));
    }
}

void ZtObjectsPainterTest::onlyTextsHaveLabelsWhereCrowded()
{
    QVector<ZtObjectsPainter::Object> objects{
        add(ZtDrawnType::TextNote, polygon({{300, 300}}), QStringLiteral("Look here"))};
    const ZtObjectsPainter::Object line = add(ZtDrawnType::Line, polygon({{100, 100}, {130, 140}}));
    objects += QVector<ZtObjectsPainter::Object>(ZtObjectsPainter::maximumLabels - 1, line);
    QCOMPARE(labels(objects).size(), ZtObjectsPainter::maximumLabels);
    objects.append(line);
    const QVector<ZtDrawnLabel> found = labels(objects);
    QCOMPARE(found.size(), 1);
    QCOMPARE(found.first().text, QStringLiteral("Look here"));
}

void ZtObjectsPainterTest::hiddenLabelsAreLeftOut()
{
    m_document.objectsPainter()->setLabelsShown(false);
    const QVector<ZtDrawnLabel> found =
        labels({add(ZtDrawnType::Line, polygon({{100, 100}, {130, 140}})),
                add(ZtDrawnType::TextNote, polygon({{300, 300}}), QStringLiteral("Look here")),
                add(ZtDrawnType::ScaleBar, polygon({{200, 300}, {260, 300}}))});
    QCOMPARE(found.size(), 2);
    QCOMPARE(found.at(0).text, QStringLiteral("Look here"));
    QCOMPARE(found.at(1).text, QStringLiteral("60.0 px"));
}

void ZtObjectsPainterTest::objectsThatAreGoneHaveNone()
{
    QVERIFY(labels({{ZtDrawnType::Line, 77}, {12, 1}}).isEmpty());
    QImage image(8, 8, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    ZtObjectsPainter::drawShape(&painter, {ZtDrawnType::Line, 77});
    ZtObjectsPainter::drawShape(&painter, {12, 1});
    painter.end();
    QVERIFY(isEmpty(image));
}

void ZtObjectsPainterTest::drawsTheTypesThatAreAskedFor()
{
    m_document.objectsPainter()->setLabelsShown(false);
    add(ZtDrawnType::Line, polygon({{100, 100}, {130, 140}}));
    const QImage line = drawn(*m_document.objectsPainter());
    add(ZtDrawnType::Circle, polygon({{300, 300}, {340, 300}}));
    QCOMPARE(drawn(*m_document.objectsPainter(), {ZtDrawnType::Line}), line);
    QVERIFY(drawn(*m_document.objectsPainter()) != line);
    QVERIFY(isEmpty(drawn(*m_document.objectsPainter(), {ZtDrawnType::Polygon})));
}

void ZtObjectsPainterTest::drawsEveryObjectHoweverMany()
{
    // 2500 points of lines, 8 pixels apart, each with its dark halo: pictures leave nothing out.
    for (int i = 0; i < 2500; ++i) {
        const QPointF start(20 + 8 * (i % 70), 20 + 8 * (i / 70));
        add(ZtDrawnType::Line, polygon({start, start + QPointF(3, 0)}));
    }
    const QImage image = drawn(*m_document.objectsPainter());
    for (int i = 0; i < 2500; ++i) {
        const QPoint middle(21 + 8 * (i % 70), 20 + 8 * (i / 70));
        QVERIFY(qRed(image.pixel(middle)) > 150);
        // Three pixels of halo above, softer than a hard line.
        QVERIFY(qAlpha(image.pixel(middle - QPoint(0, 2))) > 0);
    }
}

void ZtObjectsPainterTest::countersHaveTheirColours()
{
    m_document.objectsPainter()->setLabelsShown(false);
    for (int id = 1; id <= 4; ++id)
        QCOMPARE(add(ZtDrawnType::Counter, polygon({{50.5 * id, 50.5}})).second, id);
    const QImage image = drawn(*m_document.objectsPainter());
    for (int id = 1; id <= 4; ++id) {
        const QColor found = image.pixelColor(static_cast<int>(50.5 * id), 50);
        const QColor expected = ZtDrawnObjectPainter::counterColor(id);
        QVERIFY(qAbs(found.red() - expected.red()) < 40 && qAbs(found.green() - expected.green()) < 40 &&
                qAbs(found.blue() - expected.blue()) < 40);
    }
}

void ZtObjectsPainterTest::counterColoursDiffer()
{
    const QVector<QColor> &colors = ZtDrawnObjectPainter::counterColors();
    QVERIFY(colors.size() >= 8);
    QCOMPARE(colors.first(), ZtDrawnObjectPainter::lineColor());
    QCOMPARE(ZtDrawnObjectPainter::counterColor(colors.size() + 1), colors.first());
    QCOMPARE(ZtDrawnObjectPainter::counterColor(0), colors.first());
    for (int i = 0; i < colors.size(); ++i) {
        // Seen on the dark line below it, and so on any image.
        QVERIFY(qGray(colors.at(i).rgb()) - qGray(ZtDrawnObjectPainter::haloColor().rgb()) >= 100);
        for (int other = 0; other < i; ++other) {
            const QColor &a = colors.at(i);
            const QColor &b = colors.at(other);
            QVERIFY(qAbs(a.red() - b.red()) + qAbs(a.green() - b.green()) + qAbs(a.blue() - b.blue()) >= 120);
        }
    }
}

// Stains are dark blue, and most people count two classes.
void ZtObjectsPainterTest::firstCountersAreSeenOnStainedCells()
{
    const auto part = [](double value) {
        return value <= 0.04045 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
    };
    const auto brightness = [&part](const QColor &color) {
        return 0.2126 * part(color.redF()) + 0.7152 * part(color.greenF()) + 0.0722 * part(color.blueF());
    };
    const double stain = brightness(QColor(75, 105, 180));
    for (int id = 1; id <= 2; ++id)
        QVERIFY((brightness(ZtDrawnObjectPainter::counterColor(id)) + 0.05) / (stain + 0.05) >= 3.0);
}

void ZtObjectsPainterTest::scaleBarNeedsACalibration()
{
    m_document.objectsPainter()->setScaleBarShown(true);
    m_document.setCalibration(ZtCalibration(2.0));
    QVERIFY(!isEmpty(drawn(*m_document.objectsPainter())));
    ZtObjectsPainter without;
    without.setScaleBarShown(true);
    QVERIFY(isEmpty(drawn(without)));
}

void ZtObjectsPainterTest::scaleBarBelongsToAllTypes()
{
    m_document.setCalibration(ZtCalibration(2.0));
    QVERIFY(isEmpty(drawn(*m_document.objectsPainter())));
    m_document.objectsPainter()->setScaleBarShown(true);
    QVERIFY(isEmpty(drawn(*m_document.objectsPainter(), {ZtDrawnType::Line})));
    QVERIFY(!isEmpty(drawn(*m_document.objectsPainter())));
}

STATREPORT_TEST_MAIN(ZtObjectsPainterTest)
#include "ZtObjectsPainterTest.moc"
