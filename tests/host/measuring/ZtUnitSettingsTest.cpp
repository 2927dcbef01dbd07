// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtUnitSettings.h"

#include <QSignalSpy>

namespace {

void set(const char *key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QLatin1String(key), value);
    ZtAppSettings::endGroup();
}

QString chosen(ZtGsManipulator::MeasureKind kind)
{
    return ZtUnitSettings::getInstance()->chosenUnit(kind).text();
}

} // namespace

class ZtUnitSettingsTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void isAutomaticAtFirst();
    void readsUnits_data();
    void readsUnits();
    void readsDigits_data();
    void readsDigits();
    void announcesChangedUnits();
    void saysNothingWhenNothingChanged();
    void followsTheProfile();
};

void ZtUnitSettingsTest::init()
{
    StatReportTest::init();
    ZtUnitSettings::getInstance();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void ZtUnitSettingsTest::isAutomaticAtFirst()
{
    QCOMPARE(ZtUnitSettings::getInstance()->significantDigits(), 0);
    for (int kind = -1; kind < 7; ++kind)
        QVERIFY(ZtUnitSettings::getInstance()->chosenUnit(kind).isEmpty());
}

void ZtUnitSettingsTest::readsUnits_data()
{
    QTest::addColumn<QString>("length");
    QTest::addColumn<QString>("angle");
    QTest::addColumn<QString>("lengthUnit");
    QTest::addColumn<QString>("areaUnit");
    QTest::addColumn<QString>("angleUnit");
    const QString micrometre = QStringLiteral("\u03BCm");
    const QString square = QStringLiteral("\u03BCm\u00B2");
    QTest::newRow("auto") << "auto"
                          << "auto"
                          << ""
                          << ""
                          << "";
    QTest::newRow("nm") << "nm"
                        << "deg"
                        << "nm" << QStringLiteral("nm\u00B2") << QStringLiteral("\u00B0");
    QTest::newRow("um") << "um"
                        << "rad" << micrometre << square << "rad";
    QTest::newRow("micro sign") << QStringLiteral("\u00B5m") << "" << micrometre << square << "";
    QTest::newRow("Greek mu") << micrometre << "" << micrometre << square << "";
    QTest::newRow("mm") << "mm"
                        << ""
                        << "mm" << QStringLiteral("mm\u00B2") << "";
    QTest::newRow("cm") << "cm"
                        << ""
                        << "cm" << QStringLiteral("cm\u00B2") << "";
    QTest::newRow("m") << "m"
                       << ""
                       << "m" << QStringLiteral("m\u00B2") << "";
    QTest::newRow("nonsense") << "furlong"
                              << "42"
                              << ""
                              << ""
                              << "";
    QTest::newRow("units of another kind") << "deg"
                                           << "mm"
                                           << ""
                                           << ""
                                           << "";
}

void ZtUnitSettingsTest::readsUnits()
{
    QFETCH(QString, length);
    QFETCH(QString, angle);
    set("LengthUnit", length);
    set("AngleUnit", angle);
    QTEST(chosen(ZtGsManipulator::Length), "lengthUnit");
    QTEST(chosen(ZtGsManipulator::Area), "areaUnit");
    QTEST(chosen(ZtGsManipulator::Angle), "angleUnit");
    QCOMPARE(chosen(ZtGsManipulator::Count), QString());
    QCOMPARE(chosen(ZtGsManipulator::Percentage), QString());
}

void ZtUnitSettingsTest::readsDigits_data()
{
    QTest::addColumn<QVariant>("written");
    QTest::addColumn<int>("digits");
    QTest::newRow("automatic") << QVariant(0u) << 0;
    QTest::newRow("some") << QVariant(4u) << 4;
    QTest::newRow("as text") << QVariant(QStringLiteral("4")) << 4;
    QTest::newRow("most") << QVariant(15u) << 15;
    QTest::newRow("too many") << QVariant(99u) << 15;
    QTest::newRow("nonsense") << QVariant(QStringLiteral("many")) << 0;
}

void ZtUnitSettingsTest::readsDigits()
{
    QFETCH(QVariant, written);
    set("MeasurementLabelsSignDigits", written);
    QTEST(ZtUnitSettings::getInstance()->significantDigits(), "digits");
}

void ZtUnitSettingsTest::announcesChangedUnits()
{
    QSignalSpy lengths(ZtSignalCenter::getInstance(), SIGNAL(signalLengthUnitChanged()));
    QSignalSpy angles(ZtSignalCenter::getInstance(), SIGNAL(signalAngleUnitChanged()));
    set("LengthUnit", QStringLiteral("mm"));
    QCOMPARE(lengths.size(), 1);
    QCOMPARE(angles.size(), 0);
    set("AngleUnit", QStringLiteral("rad"));
    QCOMPARE(lengths.size(), 1);
    QCOMPARE(angles.size(), 1);
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::remove(QString());
    ZtAppSettings::endGroup();
    QCOMPARE(lengths.size(), 2);
    QCOMPARE(angles.size(), 2);
}

void ZtUnitSettingsTest::saysNothingWhenNothingChanged()
{
    set("LengthUnit", QStringLiteral("um"));
    QSignalSpy lengths(ZtSignalCenter::getInstance(), SIGNAL(signalLengthUnitChanged()));
    set("LengthUnit", QStringLiteral("\u00B5m"));
    set("MeasurementLabelsSignDigits", 3u);
    ZtAppSettings::setValue(QStringLiteral("LengthUnit"), QStringLiteral("m"));
    ZtUnitSettings::getInstance()->reload();
    QCOMPARE(lengths.size(), 0);
}

void ZtUnitSettingsTest::followsTheProfile()
{
    set("LengthUnit", QStringLiteral("mm"));
    QSignalSpy lengths(ZtSignalCenter::getInstance(), SIGNAL(signalLengthUnitChanged()));
    ZtAppSettings::getInstance()->setCurrentProfile(QStringLiteral("Other"));
    QCOMPARE(chosen(ZtGsManipulator::Length), QString());
    ZtAppSettings::getInstance()->setCurrentProfile(QString());
    QCOMPARE(chosen(ZtGsManipulator::Length), QStringLiteral("mm"));
    QCOMPARE(lengths.size(), 2);
}

STATREPORT_TEST_MAIN(ZtUnitSettingsTest)
#include "ZtUnitSettingsTest.moc"
