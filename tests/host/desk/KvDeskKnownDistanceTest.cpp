// SPDX-License-Identifier: MIT
#include "KvDeskKnownDistance.h"

#include "CalibratedDesk.h"
#include "KvDeskNumberBox.h"

class KvDeskKnownDistanceTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void units_data();
    void units();
    void takesASelectedLineAtFirst();
    void onlyOneLineCanBeUsed_data();
    void onlyOneLineCanBeUsed();
    void followsTheLine();
    void pixelsKeepTheirShape();
    void lengthIsMissing();
    void lengthIsJudgedWithoutALine();
    void offersTheUsualUnits();
};

void KvDeskKnownDistanceTest::units_data()
{
    QTest::addColumn<QString>("unit");
    QTest::addColumn<double>("micrometres");
    QTest::newRow("micrometre") << QStringLiteral("μm") << 1.0;
    QTest::newRow("millimetre") << QStringLiteral("mm") << 1000.0;
    QTest::newRow("centimetre") << QStringLiteral("cm") << 10000.0;
    QTest::newRow("metre") << QStringLiteral("m") << 1e6;
    QTest::newRow("inch") << QStringLiteral("inch") << 25400.0;
}

void KvDeskKnownDistanceTest::units()
{
    QFETCH(QString, unit);
    QFETCH(double, micrometres);
    CalibratedDesk desk;
    desk.selection.select(desk.line({0, 0}, {30, 40}));
    const KvDeskKnownDistance way(&desk.calibrator);
    QTest::keyClicks(way.lengthBox(), QStringLiteral("2"));
    way.unitBox()->setCurrentText(unit);
    const ZtCalibration result = way.calibration();
    QCOMPARE(result.micrometresPerPixelX(), 2.0 * micrometres / 50.0);
    QVERIFY(result.isSquare());
    QVERIFY(result.origin() == ZtCalibration::Origin::KnownDistance);
}

void KvDeskKnownDistanceTest::takesASelectedLineAtFirst()
{
    CalibratedDesk desk;
    const KvDeskObjectId line = desk.line({0, 0}, {30, 40});
    KvDeskKnownDistance without(&desk.calibrator);
    QVERIFY(without.reference().isNull());
    QCOMPARE(without.referenceText(), QStringLiteral("No line yet"));
    QVERIFY(!without.useButton()->isEnabled());
    QCOMPARE(without.useButton()->toolTip(), QStringLiteral("Select one line on the image first"));
    desk.selection.select(line);
    QVERIFY(without.useButton()->isEnabled());
    QCOMPARE(without.useButton()->toolTip(), QStringLiteral("Take the selected line as the known distance"));
    QSignalSpy changed(&without, SIGNAL(signalChanged()));
    without.useButton()->click();
    QCOMPARE(changed.count(), 1);
    QVERIFY(without.reference() == line);
    QCOMPARE(without.referenceText(), QStringLiteral("Line 1: 50.0 px"));
    const KvDeskKnownDistance with(&desk.calibrator);
    QVERIFY(with.reference() == line);
}

void KvDeskKnownDistanceTest::onlyOneLineCanBeUsed_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<bool>("isWithAnother");
    QTest::addColumn<bool>("canBeUsed");
    const QPolygonF pair = polygon({{0, 0}, {10, 0}});
    QTest::newRow("line") << static_cast<int>(ZtDrawnType::Line) << pair << false << true;
    QTest::newRow("two lines") << static_cast<int>(ZtDrawnType::Line) << pair << true << false;
    QTest::newRow("line of no length")
        << static_cast<int>(ZtDrawnType::Line) << polygon({{5, 5}, {5, 5}}) << false << false;
    QTest::newRow("rectangle") << static_cast<int>(ZtDrawnType::Rectangle) << pair << false << false;
}

void KvDeskKnownDistanceTest::onlyOneLineCanBeUsed()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    QFETCH(bool, isWithAnother);
    CalibratedDesk desk;
    const KvDeskKnownDistance way(&desk.calibrator);
    const KvDeskObjectId object = desk.add(type, points);
    QSet<KvDeskObjectId> selected{object};
    if (isWithAnother)
        selected.insert(desk.line({1, 1}, {2, 2}));
    desk.selection.set(selected, object);
    QTEST(way.useButton()->isEnabled(), "canBeUsed");
}

void KvDeskKnownDistanceTest::followsTheLine()
{
    CalibratedDesk desk;
    const KvDeskObjectId line = desk.line({0, 0}, {100, 0});
    desk.selection.select(line);
    const KvDeskKnownDistance way(&desk.calibrator);
    QTest::keyClicks(way.lengthBox(), QStringLiteral("1"));
    QCOMPARE(way.calibration().micrometresPerPixel(), 10.0);
    // Another selection leaves the reference alone.
    desk.selection.clear();
    QSignalSpy changed(&way, SIGNAL(signalChanged()));
    desk.editor.setPoints(line, polygon({{0, 0}, {200, 0}}));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(way.calibration().micrometresPerPixel(), 5.0);
    QCOMPARE(way.referenceText(), QStringLiteral("Line 1: 200.0 px"));
    desk.editor.remove({line});
    QCOMPARE(changed.count(), 2);
    QVERIFY(way.reference().isNull());
    QVERIFY(!way.calibration().isCalibrated());
    QCOMPARE(way.referenceText(), QStringLiteral("No line yet"));
}

// One line tells nothing about the other direction.
void KvDeskKnownDistanceTest::pixelsKeepTheirShape()
{
    CalibratedDesk desk;
    desk.document.setCalibration(ZtCalibration(1.0, 2.0));
    desk.selection.select(desk.line({0, 0}, {0, 100}));
    const KvDeskKnownDistance way(&desk.calibrator);
    QTest::keyClicks(way.lengthBox(), QStringLiteral("1"));
    const ZtCalibration result = way.calibration();
    QCOMPARE(result.micrometresPerPixelX(), 5.0);
    QCOMPARE(result.micrometresPerPixelY(), 10.0);
}

void KvDeskKnownDistanceTest::lengthIsMissing()
{
    CalibratedDesk desk;
    desk.selection.select(desk.line({0, 0}, {0, 100}));
    const KvDeskKnownDistance way(&desk.calibrator);
    QVERIFY(!way.calibration().isCalibrated());
}

void KvDeskKnownDistanceTest::lengthIsJudgedWithoutALine()
{
    CalibratedDesk desk;
    const KvDeskKnownDistance way(&desk.calibrator);
    QCOMPARE(way.fault(), QString());
    for (const char *const text : {"-1", "0", "1e400", "1 000"}) {
        way.lengthBox()->clear();
        QTest::keyClicks(way.lengthBox(), QLatin1String(text));
        QVERIFY2(!way.fault().isEmpty(), text);
        QCOMPARE(way.lengthBox()->fault(), way.fault());
    }
    way.lengthBox()->clear();
    QTest::keyClicks(way.lengthBox(), QStringLiteral("1e9"));
    QCOMPARE(way.fault(), QString());
    // Too long for the line that is there now.
    desk.selection.select(desk.line({0, 0}, {30, 40}));
    way.useButton()->click();
    QVERIFY(!way.fault().isEmpty());
    QVERIFY(!way.calibration().isCalibrated());
}

void KvDeskKnownDistanceTest::offersTheUsualUnits()
{
    CalibratedDesk desk;
    const KvDeskKnownDistance way(&desk.calibrator);
    QStringList units;
    for (int i = 0; i < way.unitBox()->count(); ++i)
        units.append(way.unitBox()->itemText(i));
    QCOMPARE(units, QStringList({QStringLiteral("μm"), QStringLiteral("mm"), QStringLiteral("cm"),
                                 QStringLiteral("m"), QStringLiteral("inch")}));
    QCOMPARE(way.unitBox()->currentText(), QStringLiteral("mm"));
    QCOMPARE(way.unitBox()->accessibleName(), QStringLiteral("Unit of the length"));
    QCOMPARE(way.lengthBox()->accessibleName(), QStringLiteral("Length of the line"));
}

STATREPORT_TEST_MAIN(KvDeskKnownDistanceTest)
#include "KvDeskKnownDistanceTest.moc"
