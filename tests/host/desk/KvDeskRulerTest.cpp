// SPDX-License-Identifier: MIT
#include "KvDeskRuler.h"

#include "measuring/ZtUnit.h"
#include "support/StatReportTest.h"

#include <algorithm>
#include <cmath>

class KvDeskRulerTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void ticksAreRound_data();
    void ticksAreRound();
    void noTicksWithoutAScale();
    void units_data();
    void units();
    void isDrawn();
    void labelsAreWhole_data();
    void labelsAreWhole();
    void topmostLabelIsWhole();
};

void KvDeskRulerTest::ticksAreRound_data()
{
    QTest::addColumn<double>("pixelsPerUnit");
    QTest::addColumn<double>("labelStep");
    QTest::newRow("one to one") << 1.0 << 100.0;
    QTest::newRow("halved") << 0.5 << 200.0;
    QTest::newRow("a third") << 0.3 << 500.0;
    QTest::newRow("enlarged") << 64.0 << 1.0;
    QTest::newRow("tiny units") << 0.0001 << 1000000.0;
    QTest::newRow("huge units") << 5000.0 << 0.02;
}

void KvDeskRulerTest::ticksAreRound()
{
    QFETCH(double, pixelsPerUnit);
    QFETCH(double, labelStep);
    const QVector<KvDeskRuler::Tick> ticks = KvDeskRuler::ticks(-1234.0, pixelsPerUnit, 800.0);
    QVector<double> labelled;
    for (const KvDeskRuler::Tick &tick : ticks) {
        QVERIFY(tick.position >= 0.0 && tick.position <= 800.0);
        QVERIFY(qAbs(tick.position - (-1234.0 + tick.value * pixelsPerUnit)) < 1e-6);
        if (tick.isLabelled)
            labelled.append(tick.value);
    }
    QVERIFY(labelled.size() >= 4);
    QVERIFY(ticks.size() >= 4 * labelled.size() - 4);
    for (int i = 1; i < labelled.size(); ++i)
        QVERIFY(qAbs(labelled.at(i) - labelled.at(i - 1) - labelStep) < 1e-9 * labelStep);
    QVERIFY(qAbs(std::remainder(labelled.first(), labelStep)) < 1e-9 * labelStep);
}

void KvDeskRulerTest::noTicksWithoutAScale()
{
    QVERIFY(KvDeskRuler::ticks(0.0, 0.0, 100.0).isEmpty());
    QVERIFY(KvDeskRuler::ticks(0.0, -1.0, 100.0).isEmpty());
    QVERIFY(KvDeskRuler::ticks(std::nan(""), 1.0, 100.0).isEmpty());
    QVERIFY(KvDeskRuler::ticks(0.0, 1.0, 0.0).size() <= 1);
}

void KvDeskRulerTest::units_data()
{
    QTest::addColumn<double>("pixelSize");
    QTest::addColumn<QString>("unit");
    QTest::newRow("none") << 0.0 << QStringLiteral("px");
    QTest::newRow("calibrated") << 0.5 << QStringLiteral("mm");
}

void KvDeskRulerTest::units()
{
    QFETCH(double, pixelSize);
    KvDeskRuler ruler(Qt::Horizontal);
    ruler.resize(800, KvDeskRuler::thickness);
    ruler.setScale(0.0, 1.0, pixelSize, ZtUnit::parse(QStringLiteral("mm")));
    QCOMPARE(ruler.extent(2.0, pixelSize), 400.0 * pixelSize);
    QTEST(ruler.unitText(), "unit");
    QCOMPARE(ruler.toolTip(), QStringLiteral("Ruler in %1").arg(ruler.unitText()));
}

void KvDeskRulerTest::isDrawn()
{
    for (const Qt::Orientation orientation : {Qt::Horizontal, Qt::Vertical}) {
        KvDeskRuler ruler(orientation);
        const bool isLevel = orientation == Qt::Horizontal;
        ruler.resize(isLevel ? QSize(300, KvDeskRuler::thickness) : QSize(KvDeskRuler::thickness, 300));
        ruler.setScale(50.0, 1.0, 0.0, ZtUnit());
        const auto grab = [&ruler, isLevel]() {
            const QImage image = ruler.grab().toImage();
            return isLevel ? image : image.transformed(QTransform().rotate(90).scale(1, -1));
        };
        const QImage plain = grab();
        QVERIFY(!ruler.accessibleName().isEmpty());
        // A long mark at zero, none beside it.
        QVERIFY(plain.pixelColor(50, 15) != plain.pixelColor(55, 2));
        ruler.setPointer(120.0);
        QVERIFY(grab() != plain);
        ruler.setPointer(std::nullopt);
        QVERIFY(grab() == plain);
    }
}

void KvDeskRulerTest::labelsAreWhole_data()
{
    QTest::addColumn<double>("width");
    QTest::addColumn<double>("room");
    QTest::addColumn<double>("distance");
    QTest::addColumn<bool>("isDrawn");
    QTest::addColumn<bool>("isBehind");
    QTest::newRow("room behind") << 20.0 << 100.0 << 64.0 << true << true;
    QTest::newRow("just room behind") << 20.0 << 23.0 << 64.0 << true << true;
    QTest::newRow("cut off behind") << 20.0 << 22.0 << 64.0 << true << false;
    QTest::newRow("at the end") << 20.0 << 0.0 << 64.0 << true << false;
    QTest::newRow("another label before") << 40.0 << 10.0 << 64.0 << false << false;
}

void KvDeskRulerTest::labelsAreWhole()
{
    QFETCH(double, width);
    QFETCH(double, room);
    QFETCH(double, distance);
    QFETCH(bool, isBehind);
    const std::optional<double> start = KvDeskRuler::textStart(width, room, distance);
    QTEST(start.has_value(), "isDrawn");
    if (!start)
        return;
    QCOMPARE(*start > 0.0, isBehind);
    QVERIFY(isBehind ? *start + width <= room : *start + width < 0.0);
    QVERIFY(isBehind || *start - width > -distance);
}

// The text of a mark at the very top lies below it instead of outside.
void KvDeskRulerTest::topmostLabelIsWhole()
{
    KvDeskRuler ruler(Qt::Vertical);
    ruler.resize(KvDeskRuler::thickness, 300);
    const auto textColumns = [&ruler](int from, int to) {
        const QImage image = ruler.grab().toImage();
        const QColor ground = image.pixelColor(1, 60);
        int count = 0;
        for (int y = from; y < to; ++y) {
            for (int x = 1; x < KvDeskRuler::thickness / 2; ++x)
                count += image.pixelColor(x, y) != ground ? 1 : 0;
        }
        return count;
    };
    ruler.setScale(1.0, 1.0, 0.0, ZtUnit());
    QVERIFY(textColumns(2, 14) > 0);
    ruler.setScale(40.0, 1.0, 0.0, ZtUnit());
    QVERIFY(textColumns(26, 38) > 0);
}

STATREPORT_TEST_MAIN(KvDeskRulerTest)
#include "KvDeskRulerTest.moc"
