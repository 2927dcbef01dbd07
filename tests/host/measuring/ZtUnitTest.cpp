// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtUnit.h"

#include <cmath>

class ZtUnitTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void parses_data();
    void parses();
    void readsItsOwnTexts_data();
    void readsItsOwnTexts();
    void squares();
    void converts();
};

void ZtUnitTest::parses_data()
{
    QTest::addColumn<QString>("written");
    QTest::addColumn<int>("kind");
    QTest::addColumn<double>("factor");
    QTest::addColumn<QString>("shown");
    const int length = ZtGsManipulator::Length;
    const int area = ZtGsManipulator::Area;
    const int none = ZtGsManipulator::NoKind;
    const QString micrometre = QStringLiteral("\u03BCm");
    QTest::newRow("nm") << "nm" << length << 1e-3 << "nm";
    QTest::newRow("um") << "um" << length << 1.0 << micrometre;
    QTest::newRow("micro sign") << QStringLiteral("\u00B5m") << length << 1.0 << micrometre;
    QTest::newRow("Greek mu") << QStringLiteral("\u03BCm") << length << 1.0 << micrometre;
    QTest::newRow("micron") << "micron" << length << 1.0 << micrometre;
    QTest::newRow("Microns") << "Microns" << length << 1.0 << micrometre;
    QTest::newRow("mm") << "mm" << length << 1e3 << "mm";
    QTest::newRow("cm") << "cm" << length << 1e4 << "cm";
    QTest::newRow("m") << "m" << length << 1e6 << "m";
    QTest::newRow("blanks around") << "  mm\t" << length << 1e3 << "mm";
    QTest::newRow("mm2") << "mm2" << area << 1e6 << QStringLiteral("mm\u00B2");
    QTest::newRow("mm^2") << "mm^2" << area << 1e6 << QStringLiteral("mm\u00B2");
    QTest::newRow("mm superscript two")
        << QStringLiteral("mm\u00B2") << area << 1e6 << QStringLiteral("mm\u00B2");
    QTest::newRow("nm2") << "nm2" << area << 1e-6 << QStringLiteral("nm\u00B2");
    QTest::newRow("micro sign squared")
        << QStringLiteral("\u00B5m\u00B2") << area << 1.0 << QStringLiteral("\u03BCm\u00B2");
    QTest::newRow("microns^2") << "microns^2" << area << 1.0 << QStringLiteral("\u03BCm\u00B2");
    QTest::newRow("cm2") << "cm2" << area << 1e8 << QStringLiteral("cm\u00B2");
    QTest::newRow("m2") << "m2" << area << 1e12 << QStringLiteral("m\u00B2");
    QTest::newRow("deg") << "deg" << int(ZtGsManipulator::Angle) << 1.0 << QStringLiteral("\u00B0");
    QTest::newRow("degree sign") << QStringLiteral("\u00B0") << int(ZtGsManipulator::Angle) << 1.0
                                 << QStringLiteral("\u00B0");
    QTest::newRow("rad") << "rad" << int(ZtGsManipulator::Angle) << 180.0 / std::acos(-1.0) << "rad";
    QTest::newRow("pcs") << "pcs" << int(ZtGsManipulator::Count) << 1.0 << "pcs";
    QTest::newRow("count") << "count" << int(ZtGsManipulator::Count) << 1.0 << "pcs";
    QTest::newRow("%") << "%" << int(ZtGsManipulator::Percentage) << 1.0 << "%";
    QTest::newRow("percent") << "percent" << int(ZtGsManipulator::Percentage) << 1.0 << "%";
    QTest::newRow("g") << "g" << none << 1.0 << "g";
    QTest::newRow("px") << "px" << none << 1.0 << "px";
    QTest::newRow("px2") << "px2" << none << 1.0 << "px2";
    QTest::newRow("M is not m") << "M" << none << 1.0 << "M";
    QTest::newRow("Mm") << "Mm" << none << 1.0 << "Mm";
    QTest::newRow("in") << "in" << none << 1.0 << "in";
    QTest::newRow("cubic") << "mm3" << none << 1.0 << "mm3";
    QTest::newRow("2 alone") << "2" << none << 1.0 << "2";
    QTest::newRow("squared angle") << "deg2" << none << 1.0 << "deg2";
    QTest::newRow("compound") << QStringLiteral("g/cm\u00B3") << none << 1.0 << QStringLiteral("g/cm\u00B3");
    QTest::newRow("empty") << "" << none << 1.0 << "";
    QTest::newRow("blank") << "  " << none << 1.0 << "";
}

void ZtUnitTest::parses()
{
    QFETCH(QString, written);
    QFETCH(QString, shown);
    QFETCH(double, factor);
    const ZtUnit unit = ZtUnit::parse(written);
    QTEST(unit.kind(), "kind");
    QVERIFY(std::abs(unit.factor() - factor) <= 1e-12 * factor);
    QCOMPARE(unit.text(), shown);
    QCOMPARE(unit.isEmpty(), shown.isEmpty());
}

void ZtUnitTest::readsItsOwnTexts_data()
{
    parses_data();
}

void ZtUnitTest::readsItsOwnTexts()
{
    QFETCH(QString, written);
    const ZtUnit unit = ZtUnit::parse(written);
    const ZtUnit again = ZtUnit::parse(unit.text());
    QVERIFY(unit == again);
    QCOMPARE(again.factor(), unit.factor());
}

void ZtUnitTest::squares()
{
    const ZtUnit square = ZtUnit::parse(QStringLiteral("cm")).squared();
    QCOMPARE(square.kind(), int(ZtGsManipulator::Area));
    QCOMPARE(square.factor(), 1e8);
    QVERIFY(square == ZtUnit::parse(QStringLiteral("cm2")));
    const ZtUnit pixels = ZtUnit::parse(QStringLiteral("px")).squared();
    QCOMPARE(pixels.kind(), int(ZtGsManipulator::NoKind));
    QCOMPARE(pixels.text(), QStringLiteral("px\u00B2"));
    QVERIFY(ZtUnit().squared().isEmpty());
}

void ZtUnitTest::converts()
{
    const ZtUnit unit = ZtUnit::parse(QStringLiteral("mm"));
    QCOMPARE(unit.toBase(2.5), 2500.0);
    QCOMPARE(unit.fromBase(2500.0), 2.5);
    QCOMPARE(ZtUnit().toBase(2.5), 2.5);
    QVERIFY(unit != ZtUnit::parse(QStringLiteral("cm")));
}

STATREPORT_TEST_MAIN(ZtUnitTest)
#include "ZtUnitTest.moc"
