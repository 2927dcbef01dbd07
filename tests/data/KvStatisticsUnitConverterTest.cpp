// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "data/KvStatisticsUnitConverter.h"
#include "kernel/ZtAppSettings.h"
#include "support/BracketTranslator.h"

#include <cmath>
#include <limits>

namespace {

const double notANumber = std::numeric_limits<double>::quiet_NaN();
const double infinity = std::numeric_limits<double>::infinity();

void setDigits(const QVariant &digits)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), digits);
    ZtAppSettings::endGroup();
}

QByteArray compared(double actual, double expected)
{
    return QByteArray::number(actual, 'g', 17) + " instead of " + QByteArray::number(expected, 'g', 17);
}

} // namespace

class KvStatisticsUnitConverterTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void unitTexts_data();
    void unitTexts();
    void unitTextsAreTranslated();
    void autoUnits_data();
    void autoUnits();
    void commonUnits_data();
    void commonUnits();
    void conversions_data();
    void conversions();
    void conversionOfANegativeAreaIsNoNumber();
    void automaticDigits_data();
    void automaticDigits();
    void givenDigits_data();
    void givenDigits();
    void digitsComeFromTheSettings();
    void numbersThatAreNotFinite_data();
    void numbersThatAreNotFinite();
    void numbersIgnoreTheLocale();
    void values_data();
    void values();
    void valuesUseTheDigits();
};

void KvStatisticsUnitConverterTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvStatisticsUnitConverterTest::unitTexts_data()
{
    QTest::addColumn<int>("unit");
    QTest::addColumn<QString>("text");
    const QString mu(QChar(0x03BC)); // the Greek letter, not the micro sign U+00B5
    const QString square(QChar(0x00B2));
    QTest::newRow("none") << 0 << QString();
    QTest::newRow("automatic") << 1 << QString();
    QTest::newRow("nanometre") << 2 << QStringLiteral("nm");
    QTest::newRow("micrometre") << 3 << mu + QStringLiteral("m");
    QTest::newRow("millimetre") << 4 << QStringLiteral("mm");
    QTest::newRow("centimetre") << 5 << QStringLiteral("cm");
    QTest::newRow("metre") << 6 << QStringLiteral("m");
    QTest::newRow("square nanometre") << 7 << QStringLiteral("nm") + square;
    QTest::newRow("square micrometre") << 8 << mu + QStringLiteral("m") + square;
    QTest::newRow("square millimetre") << 9 << QStringLiteral("mm") + square;
    QTest::newRow("square centimetre") << 10 << QStringLiteral("cm") + square;
    QTest::newRow("square metre") << 11 << QStringLiteral("m") + square;
    QTest::newRow("degree") << 12 << QStringLiteral("deg(") + QChar(0x00B0) + QLatin1Char(')');
    QTest::newRow("pieces") << 13 << QStringLiteral("pcs");
    QTest::newRow("percent") << 14 << QStringLiteral("%");
    QTest::newRow("unknown") << 15 << QString();
    QTest::newRow("negative") << -1 << QString();
}

void KvStatisticsUnitConverterTest::unitTexts()
{
    QFETCH(int, unit);
    QFETCH(QString, text);
    QCOMPARE(KvStatisticsUnitConverter::unitText(unit), text);
}

void KvStatisticsUnitConverterTest::unitTextsAreTranslated()
{
    const BracketTranslator translator(QStringLiteral("KvStatisticsUnitConverter"));
    QCOMPARE(KvStatisticsUnitConverter::unitText(12),
             QStringLiteral("[deg](") + QChar(0x00B0) + QLatin1Char(')'));
    QCOMPARE(KvStatisticsUnitConverter::unitText(13), QStringLiteral("[pcs]"));
    QCOMPARE(KvStatisticsUnitConverter::unitText(14), QStringLiteral("[%]"));
    QCOMPARE(KvStatisticsUnitConverter::unitText(4), QStringLiteral("mm"));
}

void KvStatisticsUnitConverterTest::autoUnits_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("unit");
    QTest::newRow("length 0") << 0.0 << 1 << 2;
    QTest::newRow("length below 0") << -5000.0 << 1 << 2;
    QTest::newRow("length 0.0005") << 0.0005 << 1 << 2;
    QTest::newRow("length below 1") << 0.999 << 1 << 2;
    QTest::newRow("length 1") << 1.0 << 1 << 3;
    QTest::newRow("length below 1000") << 999.9 << 1 << 3;
    QTest::newRow("length 1000") << 1000.0 << 1 << 4;
    QTest::newRow("length below 1 cm") << 9999.9 << 1 << 4;
    QTest::newRow("length 1 cm") << 10000.0 << 1 << 5;
    QTest::newRow("length below 1 m") << 999999.0 << 1 << 5;
    QTest::newRow("length 1 m") << 1000000.0 << 1 << 6;
    QTest::newRow("length 1 km") << 1e9 << 1 << 6;
    QTest::newRow("area 0") << 0.0 << 2 << 7;
    QTest::newRow("area below 1") << 0.999 << 2 << 7;
    QTest::newRow("area 1") << 1.0 << 2 << 8;
    QTest::newRow("area below 1 mm") << 999000.0 << 2 << 8;
    QTest::newRow("area 1 mm") << 1e6 << 2 << 9;
    QTest::newRow("area 1.5 mm") << 1.5e6 << 2 << 9;
    QTest::newRow("area below 1 cm") << 9.99e7 << 2 << 9;
    QTest::newRow("area 1 cm") << 1e8 << 2 << 10;
    QTest::newRow("area below 1 m") << 9.99e11 << 2 << 10;
    QTest::newRow("area 1 m") << 1e12 << 2 << 11;
    QTest::newRow("area below 0") << -1.0 << 2 << 10; // its root is no number, which is in none of the ranges
    QTest::newRow("angle") << 90.0 << 3 << 12;
    QTest::newRow("count") << 5.0 << 4 << 13;
    QTest::newRow("percentage") << 50.0 << 5 << 14;
    QTest::newRow("no kind") << 5.0 << 0 << 0;
    QTest::newRow("unknown kind") << 5.0 << 6 << 0;
    QTest::newRow("negative kind") << 5.0 << -1 << 0;
}

void KvStatisticsUnitConverterTest::autoUnits()
{
    QFETCH(double, value);
    QFETCH(int, kind);
    QFETCH(int, unit);
    QCOMPARE(KvStatisticsUnitConverter::autoUnit(value, kind), unit);
}

void KvStatisticsUnitConverterTest::commonUnits_data()
{
    QTest::addColumn<double>("low");
    QTest::addColumn<double>("high");
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("unit");
    QTest::newRow("equal") << 2.0 << 900.0 << 1 << 3;
    QTest::newRow("neighbours") << 500.0 << 5000.0 << 1 << 4;   // (3 + 1 + 4) / 2
    QTest::newRow("one between") << 500.0 << 50000.0 << 1 << 4; // (3 + 1 + 5) / 2 = 4.5
    QTest::newRow("all lengths") << 0.5 << 5e6 << 1 << 4;       // (2 + 1 + 6) / 2 = 4.5
    QTest::newRow("areas") << 5.0 << 5e6 << 2 << 9;             // (8 + 1 + 9) / 2
    QTest::newRow("all areas") << 0.5 << 5e12 << 2 << 9;        // (7 + 1 + 11) / 2 = 9.5
    QTest::newRow("counts") << 1.0 << 1e9 << 4 << 13;
    QTest::newRow("no kind") << 1.0 << 1e9 << 0 << 0;
}

void KvStatisticsUnitConverterTest::commonUnits()
{
    QFETCH(double, low);
    QFETCH(double, high);
    QFETCH(int, kind);
    QFETCH(int, unit);
    QCOMPARE(KvStatisticsUnitConverter::commonUnit(low, high, kind), unit);
}

void KvStatisticsUnitConverterTest::conversions_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("unit");
    QTest::addColumn<double>("converted");
    QTest::newRow("nm") << 0.0005 << 1 << 2 << 0.5;
    QTest::newRow("µm") << 12.5 << 1 << 3 << 12.5;
    QTest::newRow("mm") << 12.5 << 1 << 4 << 0.0125;
    QTest::newRow("cm") << 12.5 << 1 << 5 << 0.00125;
    QTest::newRow("m") << 12.5 << 1 << 6 << 0.0000125;
    QTest::newRow("nm²") << 0.25 << 2 << 7 << 250000.0;
    QTest::newRow("µm²") << 12.5 << 2 << 8 << 12.5;
    QTest::newRow("mm²") << 1.5e6 << 2 << 9 << 1.5;
    QTest::newRow("cm²") << 2.5e8 << 2 << 10 << 2.5;
    QTest::newRow("m²") << 2.5e12 << 2 << 11 << 2.5;
    QTest::newRow("length without a unit") << 12.5 << 1 << 0 << 12.5;
    QTest::newRow("length, automatic") << 12.5 << 1 << 1 << 12.5;
    QTest::newRow("length in an angle's unit") << 12.5 << 1 << 12 << 12.5;
    QTest::newRow("length in an area's unit") << 12500.0 << 1 << 9 << 12.5;
    QTest::newRow("area in a length's unit") << 4e6 << 2 << 4 << 4.0;
    QTest::newRow("negative length") << -2000.0 << 1 << 4 << -2.0;
    QTest::newRow("angle") << 90.0 << 3 << 4 << 90.0;
    QTest::newRow("count") << 5.0 << 4 << 6 << 5.0;
    QTest::newRow("percentage") << 50.0 << 5 << 2 << 50.0;
    QTest::newRow("no kind") << 50.0 << 0 << 2 << 50.0;
}

void KvStatisticsUnitConverterTest::conversions()
{
    QFETCH(double, value);
    QFETCH(int, kind);
    QFETCH(int, unit);
    QFETCH(double, converted);
    const double actual = KvStatisticsUnitConverter::convert(value, kind, unit);
    QVERIFY2(std::abs(actual - converted) <= 1e-12 * std::abs(converted), compared(actual, converted));
}

void KvStatisticsUnitConverterTest::conversionOfANegativeAreaIsNoNumber()
{
    QVERIFY(std::isnan(KvStatisticsUnitConverter::convert(-4.0, 2, 9)));
    // It gets through to a text all the same.
    QVERIFY(KvStatisticsUnitConverter::formatValue(-4.0, 2, 1).endsWith(QStringLiteral(" cm²")));
}

void KvStatisticsUnitConverterTest::automaticDigits_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<QString>("text");
    QTest::newRow("0") << 0.0 << QStringLiteral("0");
    QTest::newRow("rounded to 0") << 0.00004 << QStringLiteral("0");
    QTest::newRow("the least") << 0.00006 << QStringLiteral("0.0001");
    QTest::newRow("0.5") << 0.5 << QStringLiteral("0.5000");
    QTest::newRow("just below 1") << 0.99999 << QStringLiteral("1.0000");
    QTest::newRow("1") << 1.0 << QStringLiteral("1.000");
    QTest::newRow("12.3456") << 12.3456 << QStringLiteral("12.346");
    QTest::newRow("just below 100") << 99.9996 << QStringLiteral("100.000");
    QTest::newRow("100") << 100.0 << QStringLiteral("100.00");
    QTest::newRow("below 1000") << 999.994 << QStringLiteral("999.99");
    QTest::newRow("1000") << 1000.0 << QStringLiteral("1000.0");
    QTest::newRow("below 10000") << 9999.9 << QStringLiteral("9999.9");
    QTest::newRow("10000") << 10000.0 << QStringLiteral("10.000∙10³");
    QTest::newRow("12345.678") << 12345.678 << QStringLiteral("12.346∙10³");
    QTest::newRow("100000") << 100000.0 << QStringLiteral("100.00∙10³");
    QTest::newRow("below a million") << 999999.0 << QStringLiteral("1000.00∙10³");
    QTest::newRow("a million") << 1000000.0 << QStringLiteral("1.0000∙10⁶");
    QTest::newRow("1234567") << 1234567.0 << QStringLiteral("1.2346∙10⁶");
    QTest::newRow("ten millions") << 10000000.0 << QStringLiteral("10.000∙10⁶");
    QTest::newRow("more than 32 bits") << 2.5e13 << QStringLiteral("25000000.000∙10⁶");
    // Negative numbers are on the lowest rung, and halves go up.
    QTest::newRow("-5.25") << -5.25 << QStringLiteral("-5.2499");
    QTest::newRow("rounded to 0 from below") << -0.00004 << QStringLiteral("0");
    QTest::newRow("-1 after truncation") << -0.00016 << QStringLiteral("-0.0001");
    QTest::newRow("negative, more than 32 bits") << -3e5 << QStringLiteral("-299999.9999");
}

void KvStatisticsUnitConverterTest::automaticDigits()
{
    QFETCH(double, value);
    QFETCH(QString, text);
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(value), text);
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(value, 0), text);
}

void KvStatisticsUnitConverterTest::givenDigits_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<uint>("digits");
    QTest::addColumn<QString>("text");
    QTest::newRow("0") << 0.0 << 3u << QStringLiteral("0");
    // The logarithm is truncated: 0.5 counts as one digit before the point, 0.05 as none.
    QTest::newRow("0.5") << 0.5 << 3u << QStringLiteral("0.50");
    QTest::newRow("0.05") << 0.05 << 3u << QStringLiteral("0.050");
    QTest::newRow("0.005") << 0.005 << 3u << QStringLiteral("0.005");
    QTest::newRow("rounded to 0") << 0.0004 << 3u << QStringLiteral("0");
    QTest::newRow("5") << 5.0 << 3u << QStringLiteral("5.00");
    QTest::newRow("50") << 50.0 << 3u << QStringLiteral("50.0");
    QTest::newRow("rounded up to one digit more") << 9.99 << 2u << QStringLiteral("10.0");
    QTest::newRow("as many as there are") << 123.4 << 3u << QStringLiteral("123");
    QTest::newRow("as many as there are, a power of ten") << 1000.0 << 4u << QStringLiteral("1000");
    QTest::newRow("one digit") << 7.6 << 1u << QStringLiteral("8");
    // Exponents other than 3 and 6 have no superscript.
    QTest::newRow("one too many") << 1234.0 << 3u << QStringLiteral("123∙10");
    QTest::newRow("two too many") << 12345.0 << 3u << QStringLiteral("123∙10");
    QTest::newRow("three too many") << 123456.0 << 3u << QStringLiteral("123∙10³");
    QTest::newRow("six too many") << 12345678.0 << 2u << QStringLiteral("12∙10⁶");
    QTest::newRow("seven too many") << 12345678.0 << 1u << QStringLiteral("1∙10");
    QTest::newRow("-5.25") << -5.25 << 3u << QStringLiteral("-5.249");
    QTest::newRow("negative, more than 32 bits") << -2.5e7 << 3u << QStringLiteral("-24999999.999");
    QTest::newRow("ten digits") << 10.0 << 10u << QStringLiteral("10.00000000");
    QTest::newRow("ten digits, whole") << 9876543210.4 << 10u << QStringLiteral("9876543210");
    QTest::newRow("more digits than a double has") << 5.0 << 20u << QStringLiteral("5.0000000000000000000");
    QTest::newRow("more digits than anything has")
        << 5.0 << 4294967295u << QStringLiteral("5.") + QString(299, QLatin1Char('0'));
}

void KvStatisticsUnitConverterTest::givenDigits()
{
    QFETCH(double, value);
    QFETCH(uint, digits);
    QFETCH(QString, text);
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(value, digits), text);
    setDigits(digits);
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(value), text);
}

void KvStatisticsUnitConverterTest::digitsComeFromTheSettings()
{
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(1.5), QStringLiteral("1.500"));
    setDigits(2);
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(1.5), QStringLiteral("1.5"));
    setDigits(QStringLiteral("5")); // as a settings file has it
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(1.5), QStringLiteral("1.5000"));
    setDigits(QStringLiteral("many"));
    QCOMPARE(KvStatisticsUnitConverter::formatNumber(1.5), QStringLiteral("1.500"));
}

void KvStatisticsUnitConverterTest::numbersThatAreNotFinite_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<uint>("digits");
    for (const uint digits : {0u, 3u, 10u, 300u}) {
        QTest::addRow("no number, %u digits", digits) << notANumber << digits;
        QTest::addRow("infinity, %u digits", digits) << infinity << digits;
        QTest::addRow("minus infinity, %u digits", digits) << -infinity << digits;
    }
}

void KvStatisticsUnitConverterTest::numbersThatAreNotFinite()
{
    QFETCH(double, value);
    QFETCH(uint, digits);
    const QString text = KvStatisticsUnitConverter::formatNumber(value, digits);
    QVERIFY2(text.contains(std::isnan(value) ? QStringLiteral("nan") : QStringLiteral("inf")),
             qPrintable(text));
}

void KvStatisticsUnitConverterTest::numbersIgnoreTheLocale()
{
    const QLocale previous;
    QLocale::setDefault(QLocale(QLocale::German));
    const QString number = KvStatisticsUnitConverter::formatNumber(1234.5);
    const QString value = KvStatisticsUnitConverter::formatValue(1234.5, 3, 12);
    const QString whole = KvStatisticsUnitConverter::formatValue(1234567, 4, 13);
    QLocale::setDefault(previous);
    QCOMPARE(number, QStringLiteral("1234.5"));
    QCOMPARE(value, QStringLiteral("1234.500 deg(°)"));
    QCOMPARE(whole, QStringLiteral("1234567 pcs"));
}

void KvStatisticsUnitConverterTest::values_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("unit");
    QTest::addColumn<QString>("text");
    const QString mu(QChar(0x03BC));
    QTest::newRow("nothing") << QVariant() << 1 << 1 << QString();
    QTest::newRow("a null double") << QVariant(QVariant::Double) << 1 << 3 << QString();
    QTest::newRow("a null text") << QVariant(QString()) << 0 << 0 << QString();
    QTest::newRow("length") << QVariant(12.5) << 1 << 3 << QStringLiteral("12.500 ") + mu + QLatin1Char('m');
    QTest::newRow("length, automatic") << QVariant(0.0005) << 1 << 1 << QStringLiteral("0.5000 nm");
    QTest::newRow("length 0, automatic") << QVariant(0.0) << 1 << 1 << QStringLiteral("0 nm");
    QTest::newRow("whole length") << QVariant(5000) << 1 << 1 << QStringLiteral("5.000 mm");
    QTest::newRow("length without a unit") << QVariant(5.0) << 1 << 0 << QStringLiteral("5.000 ");
    QTest::newRow("area, automatic") << QVariant(1500000.0) << 2 << 1 << QStringLiteral("1.500 mm²");
    QTest::newRow("area") << QVariant(2.5e8) << 2 << 10 << QStringLiteral("2.500 cm²");
    QTest::newRow("angle") << QVariant(45.0) << 3 << 12 << QStringLiteral("45.000 deg(°)");
    QTest::newRow("angle, automatic") << QVariant(45.12345) << 3 << 1 << QStringLiteral("45.123 deg(°)");
    QTest::newRow("count") << QVariant(5) << 4 << 13 << QStringLiteral("5 pcs");
    QTest::newRow("count, automatic") << QVariant(5) << 4 << 1 << QStringLiteral("5 pcs");
    QTest::newRow("average of counts") << QVariant(5.0) << 4 << 13 << QStringLiteral("5.000 pcs");
    QTest::newRow("unsigned count") << QVariant(4000000000u) << 4 << 13 << QStringLiteral("4000000000 pcs");
    QTest::newRow("long count") << QVariant(Q_INT64_C(-5000000000)) << 4 << 13
                                << QStringLiteral("-5000000000 pcs");
    QTest::newRow("longest count") << QVariant(Q_UINT64_C(18446744073709551615)) << 4 << 13
                                   << QStringLiteral("18446744073709551615 pcs");
    QTest::newRow("percentage") << QVariant(12.3456) << 5 << 14 << QStringLiteral("12.346 %");
    QTest::newRow("no kind") << QVariant(7.0) << 0 << 0 << QStringLiteral("7.000 ");
    QTest::newRow("no kind, automatic") << QVariant(7) << 9 << 1 << QStringLiteral("7 ");
    QTest::newRow("almost 0 from below") << QVariant(-0.0004) << 5 << 14 << QStringLiteral("-0.000 %");
    QTest::newRow("rounded away from 0") << QVariant(0.0625) << 5 << 14 << QStringLiteral("0.063 %");
    QTest::newRow("text") << QVariant(QStringLiteral("wide")) << 0 << 0 << QStringLiteral("wide ");
    QTest::newRow("text with a unit")
        << QVariant(QStringLiteral("wide")) << 4 << 13 << QStringLiteral("wide pcs");
    QTest::newRow("bool") << QVariant(true) << 0 << 0 << QStringLiteral("true ");
}

void KvStatisticsUnitConverterTest::values()
{
    QFETCH(QVariant, value);
    QFETCH(int, kind);
    QFETCH(int, unit);
    QFETCH(QString, text);
    QCOMPARE(KvStatisticsUnitConverter::formatValue(value, kind, unit), text);
}

void KvStatisticsUnitConverterTest::valuesUseTheDigits()
{
    setDigits(3);
    QCOMPARE(KvStatisticsUnitConverter::formatValue(1500000.0, 2, 1), QStringLiteral("1.50 mm²"));
    // Only lengths and areas follow the setting.
    QCOMPARE(KvStatisticsUnitConverter::formatValue(45.0, 3, 1), QStringLiteral("45.000 deg(°)"));
}

STATREPORT_TEST_MAIN(KvStatisticsUnitConverterTest)
#include "KvStatisticsUnitConverterTest.moc"
