// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtMeasureFormat.h"
#include "measuring/ZtUnit.h"
#include "measuring/ZtUnitSettings.h"

#include <QLocale>
#include <QTextLayout>

namespace {

void set(const char *key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QLatin1String(key), value);
    ZtAppSettings::endGroup();
}

} // namespace

class ZtMeasureFormatTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void writesSignificantDigits_data();
    void writesSignificantDigits();
    void writesReadableNumbers_data();
    void writesReadableNumbers();
    void choosesAReadableUnit_data();
    void choosesAReadableUnit();
    void writesDrawnValues_data();
    void writesDrawnValues();
    void writesPixels();
    void keepsImportedTextsAsLongAsAutomatic();
    void convertsImportedValues_data();
    void convertsImportedValues();
    void writesADecimalPointInEveryLanguage();
    void namesStandBeforeTheirValues_data();
    void namesStandBeforeTheirValues();
};

void ZtMeasureFormatTest::init()
{
    StatReportTest::init();
    ZtUnitSettings::getInstance();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void ZtMeasureFormatTest::writesSignificantDigits_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<int>("digits");
    QTest::addColumn<QString>("text");
    QTest::newRow("zero") << 0.0 << 3 << "0";
    QTest::newRow("minus zero") << -0.0 << 3 << "0";
    QTest::newRow("one digit") << 123.0 << 1 << "100";
    QTest::newRow("rounded up to another power") << 9.996 << 3 << "10.0";
    QTest::newRow("as many as there are") << 123.0 << 3 << "123";
    QTest::newRow("more than there are") << 123.0 << 5 << "123.00";
    QTest::newRow("fraction") << 0.00123456 << 3 << "0.00123";
    QTest::newRow("negative") << -12.3456 << 4 << "-12.35";
    QTest::newRow("large") << 1234567.0 << 3 << "1230000";
    QTest::newRow("fifteen") << 3.14159265358979 << 15 << "3.14159265358979";
    QTest::newRow("very large") << 1.234e20 << 2 << "1.2e+20";
    QTest::newRow("very small") << 1.234e-20 << 2 << "1.2e-20";
}

void ZtMeasureFormatTest::writesSignificantDigits()
{
    QFETCH(double, value);
    QFETCH(int, digits);
    QTEST(ZtMeasureFormat::significant(value, digits), "text");
}

void ZtMeasureFormatTest::writesReadableNumbers_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<QString>("text");
    QTest::newRow("zero") << 0.0 << "0.000";
    QTest::newRow("below 100") << 12.34567 << "12.346";
    QTest::newRow("below 1000") << 123.4567 << "123.46";
    QTest::newRow("above") << 12345.67 << "12345.7";
    QTest::newRow("negative") << -12.34567 << "-12.346";
    QTest::newRow("rounded to nothing") << -0.0001 << "0.000";
    QTest::newRow("very large") << 1e15 << "1.000000e+15";
}

void ZtMeasureFormatTest::writesReadableNumbers()
{
    QFETCH(double, value);
    QTEST(ZtMeasureFormat::readable(value), "text");
}

void ZtMeasureFormatTest::choosesAReadableUnit_data()
{
    QTest::addColumn<double>("length");
    QTest::addColumn<QString>("unit");
    QTest::newRow("zero") << 0.0 << "nm";
    QTest::newRow("below a micrometre") << 0.999 << "nm";
    QTest::newRow("micrometre") << 1.0 << QStringLiteral("\u03BCm");
    QTest::newRow("below a millimetre") << 999.0 << QStringLiteral("\u03BCm");
    QTest::newRow("millimetre") << 1000.0 << "mm";
    QTest::newRow("below a centimetre") << 9999.0 << "mm";
    QTest::newRow("centimetre") << 10000.0 << "cm";
    QTest::newRow("below a metre") << 999999.0 << "cm";
    QTest::newRow("metre") << 1000000.0 << "m";
}

void ZtMeasureFormatTest::choosesAReadableUnit()
{
    QFETCH(double, length);
    QFETCH(QString, unit);
    QCOMPARE(ZtMeasureFormat::readableUnit(length, ZtGsManipulator::Length).text(), unit);
    QCOMPARE(ZtMeasureFormat::readableUnit(-length, ZtGsManipulator::Length).text(), unit);
    QCOMPARE(ZtMeasureFormat::readableUnit(length * length, ZtGsManipulator::Area).text(),
             unit + QStringLiteral("\u00B2"));
    QVERIFY(ZtMeasureFormat::readableUnit(length, ZtGsManipulator::Angle).isEmpty());
    QVERIFY(ZtMeasureFormat::readableUnit(length, ZtGsManipulator::NoKind).isEmpty());
}

void ZtMeasureFormatTest::writesDrawnValues_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<int>("kind");
    QTest::addColumn<uint>("digits");
    QTest::addColumn<QString>("lengthUnit");
    QTest::addColumn<QString>("angleUnit");
    QTest::addColumn<QString>("text");
    const int length = ZtGsManipulator::Length;
    const int area = ZtGsManipulator::Area;
    const int angle = ZtGsManipulator::Angle;
    QTest::newRow("length") << 1234.5 << length << 0u << "auto"
                            << "auto"
                            << "1.234 mm";
    QTest::newRow("length, digits") << 1234.5 << length << 2u << "auto"
                                    << "auto"
                                    << "1.2 mm";
    QTest::newRow("length, unit") << 1234.5 << length << 0u << "cm"
                                  << "auto"
                                  << "0.123 cm";
    QTest::newRow("length, unit and digits") << 1234.5 << length << 5u << "um"
                                             << "auto" << QStringLiteral("1234.5 \u03BCm");
    QTest::newRow("area") << 2.5e6 << area << 0u << "auto"
                          << "auto" << QStringLiteral("2.500 mm\u00B2");
    QTest::newRow("area, unit") << 2.5e6 << area << 3u << "um"
                                << "auto" << QStringLiteral("2500000 \u03BCm\u00B2");
    QTest::newRow("angle") << 90.0 << angle << 0u << "auto"
                           << "auto" << QStringLiteral("90.000 \u00B0");
    QTest::newRow("angle in degrees") << 90.0 << angle << 3u << "auto"
                                      << "deg" << QStringLiteral("90.0 \u00B0");
    QTest::newRow("angle in radians") << 180.0 << angle << 6u << "auto"
                                      << "rad"
                                      << "3.14159 rad";
    QTest::newRow("count") << 12345.0 << int(ZtGsManipulator::Count) << 2u << "mm"
                           << "rad"
                           << "12345 pcs";
    QTest::newRow("percentage") << 12.34567 << int(ZtGsManipulator::Percentage) << 0u << "mm"
                                << "rad"
                                << "12.346 %";
    QTest::newRow("percentage, digits") << 12.34567 << int(ZtGsManipulator::Percentage) << 2u << "mm"
                                        << "rad"
                                        << "12 %";
    QTest::newRow("no kind") << 12.5 << int(ZtGsManipulator::NoKind) << 0u << "mm"
                             << "rad"
                             << "12.500";
}

void ZtMeasureFormatTest::writesDrawnValues()
{
    QFETCH(double, value);
    QFETCH(int, kind);
    QFETCH(uint, digits);
    QFETCH(QString, lengthUnit);
    QFETCH(QString, angleUnit);
    set("MeasurementLabelsSignDigits", digits);
    set("LengthUnit", lengthUnit);
    set("AngleUnit", angleUnit);
    QTEST(ZtMeasureFormat::drawnText(value, kind), "text");
}

void ZtMeasureFormatTest::writesPixels()
{
    QCOMPARE(ZtMeasureFormat::pixelText(123.44, 1), QStringLiteral("123.4 px"));
    QCOMPARE(ZtMeasureFormat::pixelText(0.0, 1), QStringLiteral("0.0 px"));
    QCOMPARE(ZtMeasureFormat::pixelText(100.0, 2), QStringLiteral("100.0 px\u00B2"));
    set("LengthUnit", QStringLiteral("mm"));
    set("MeasurementLabelsSignDigits", 2u);
    QCOMPARE(ZtMeasureFormat::pixelText(123.44, 1), QStringLiteral("120 px"));
}

void ZtMeasureFormatTest::keepsImportedTextsAsLongAsAutomatic()
{
    const ZtUnit unit = ZtUnit::parse(QStringLiteral("mm"));
    const QString written = QStringLiteral("+05.100 mm");
    QCOMPARE(ZtMeasureFormat::importedText(5100.0, unit, written), written);
    set("LengthUnit", QStringLiteral("mm"));
    QCOMPARE(ZtMeasureFormat::importedText(5100.0, unit, written), written);
    QVERIFY(ZtMeasureFormat::importedText(5100.0, unit, written).constData() == written.constData());
}

void ZtMeasureFormatTest::convertsImportedValues_data()
{
    QTest::addColumn<QString>("unit");
    QTest::addColumn<double>("number");
    QTest::addColumn<uint>("digits");
    QTest::addColumn<QString>("lengthUnit");
    QTest::addColumn<QString>("text");
    QTest::newRow("digits") << "mm" << 5.1 << 3u << "auto"
                            << "5.10 mm";
    QTest::newRow("unit") << "mm" << 5.1 << 0u << "cm"
                          << "0.510 cm";
    QTest::newRow("unit and digits") << "mm" << 5.1 << 4u << "um" << QStringLiteral("5100 \u03BCm");
    QTest::newRow("area") << "mm2" << 5.1 << 2u << "cm" << QStringLiteral("0.051 cm\u00B2");
    QTest::newRow("no kind") << "g" << 3750.0 << 2u << "cm"
                             << "3800 g";
    QTest::newRow("no unit") << "" << 0.63 << 1u << "cm"
                             << "0.6";
    QTest::newRow("pieces stay whole") << "pcs" << 123.0 << 2u << "cm"
                                       << "as written";
}

void ZtMeasureFormatTest::convertsImportedValues()
{
    QFETCH(QString, unit);
    QFETCH(double, number);
    QFETCH(uint, digits);
    QFETCH(QString, lengthUnit);
    set("MeasurementLabelsSignDigits", digits);
    set("LengthUnit", lengthUnit);
    const ZtUnit source = ZtUnit::parse(unit);
    QTEST(ZtMeasureFormat::importedText(source.toBase(number), source, QStringLiteral("as written")), "text");
}

void ZtMeasureFormatTest::writesADecimalPointInEveryLanguage()
{
    const QLocale before;
    QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany));
    const QStringList texts = {ZtMeasureFormat::readable(1234567.5), ZtMeasureFormat::significant(1234.5, 5),
                               ZtMeasureFormat::pixelText(1234.5, 1)};
    QLocale::setDefault(before);
    QCOMPARE(texts, (QStringList{QStringLiteral("1234567.5"), QStringLiteral("1234.5"),
                                 QStringLiteral("1234.5 px")}));
}

void ZtMeasureFormatTest::namesStandBeforeTheirValues_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("Latin") << QStringLiteral("Line 1");
    QTest::newRow("Arabic") << QString::fromUtf8("\u0645\u0633\u0627\u0641\u0629 1");
    QTest::newRow("Arabic without a number") << QString::fromUtf8("\u0645\u0633\u0627\u0641\u0629");
    QTest::newRow("Japanese") << QString::fromUtf8("\u76f4\u7dda 1");
}

// As the letters lie on the line, which images draw from left to right.
void ZtMeasureFormatTest::namesStandBeforeTheirValues()
{
    QFETCH(QString, name);
    const QString label = ZtMeasureFormat::named(name, QStringLiteral("20.509 mm"));
    QTextLayout layout(label, QFont());
    QTextOption option;
    option.setTextDirection(Qt::LeftToRight);
    layout.setTextOption(option);
    layout.beginLayout();
    const QTextLine line = layout.createLine();
    layout.endLayout();
    const auto middle = [&](int position) {
        return (line.cursorToX(position) + line.cursorToX(position + 1)) / 2;
    };
    const int value = label.indexOf(QLatin1String("20.509"));
    const int unit = label.indexOf(QLatin1String("mm"));
    QVERIFY(middle(value) < middle(value + 5));
    QVERIFY(middle(value + 5) < middle(unit));
    for (int i = 0; i < name.size(); ++i)
        QVERIFY2(middle(i) < middle(value), qPrintable(QString::number(i)));
}

STATREPORT_TEST_MAIN(ZtMeasureFormatTest)
#include "ZtMeasureFormatTest.moc"
