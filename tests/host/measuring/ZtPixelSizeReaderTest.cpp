// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtPixelSizeReader.h"

#include <cmath>
#include <limits>

class ZtPixelSizeReaderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void units_data();
    void units();
    void resolutions_data();
    void resolutions();
    void ome_data();
    void ome();
    void imageJ_data();
    void imageJ();
    void knowsItsDescriptions();
};

void ZtPixelSizeReaderTest::units_data()
{
    QTest::addColumn<QString>("unit");
    QTest::addColumn<double>("micrometres");
    const auto row = [](const char *unit, double micrometres) {
        QTest::newRow(unit) << QString::fromUtf8(unit) << micrometres;
    };
    row("um", 1.0);
    row("\u00B5m", 1.0);
    row("\u03BCm", 1.0);
    row("\\u00B5m", 1.0);
    row("\\u03bcm", 1.0);
    row("micron", 1.0);
    row("Microns", 1.0);
    row(" micrometer ", 1.0);
    row("nm", 1e-3);
    row("pm", 1e-6);
    row("\u00C5", 1e-4);
    row("mm", 1e3);
    row("cm", 1e4);
    row("m", 1e6);
    row("inch", 25400.0);
    row("in", 25400.0);
    row("pixel", 0.0);
    row("reference frame", 0.0);
    row("\\u00B5", 0.0);
    row("\\u", 0.0);
    row("deg", 0.0);
    row("", 0.0);
}

void ZtPixelSizeReaderTest::units()
{
    QFETCH(QString, unit);
    QFETCH(double, micrometres);
    QCOMPARE(ZtPixelSizeReader::micrometresOf(unit), micrometres);
}

void ZtPixelSizeReaderTest::resolutions_data()
{
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("y");
    QTest::addColumn<double>("sizeX");
    QTest::addColumn<double>("sizeY");
    const double infinity = std::numeric_limits<double>::infinity();
    QTest::newRow("one micrometre") << 1e6 << 1e6 << 1.0 << 1.0;
    QTest::newRow("oblong") << 1e6 << 2e6 << 1.0 << 0.5;
    QTest::newRow("72 dpi") << 72.0 / 0.0254 << 72.0 / 0.0254 << 0.0 << 0.0;
    QTest::newRow("72 and 96 dpi") << 72.0 / 0.0254 << 96.0 / 0.0254 << 0.0 << 0.0;
    QTest::newRow("300 dpi") << 300.0 / 0.0254 << 300.0 / 0.0254 << 25400.0 / 300 << 25400.0 / 300;
    QTest::newRow("x alone") << 1e6 << 0.0 << 1.0 << 1.0;
    QTest::newRow("y alone") << 0.0 << 1e6 << 1.0 << 1.0;
    QTest::newRow("none") << 0.0 << 0.0 << 0.0 << 0.0;
    QTest::newRow("negative") << -1e6 << -1e6 << 0.0 << 0.0;
    QTest::newRow("not a number") << std::nan("") << std::nan("") << 0.0 << 0.0;
    QTest::newRow("infinite") << infinity << infinity << 0.0 << 0.0;
}

void ZtPixelSizeReaderTest::resolutions()
{
    QFETCH(double, x);
    QFETCH(double, y);
    QFETCH(double, sizeX);
    QFETCH(double, sizeY);
    const ZtOfferedPixelSize size = ZtPixelSizeReader::fromResolution(x, y, QStringLiteral("PNG"));
    QCOMPARE(size.x, sizeX);
    QCOMPARE(size.y, sizeY);
    QCOMPARE(size.isKnown(), sizeX > 0.0);
    QCOMPARE(size.origin, sizeX > 0.0 ? QStringLiteral("PNG") : QString());
}

void ZtPixelSizeReaderTest::ome_data()
{
    QTest::addColumn<QString>("xml");
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("y");
    QTest::addColumn<int>("bits");
    const auto row = [](const char *name, const char *pixels, double x, double y, int bits = 0) {
        QTest::newRow(name) << QStringLiteral("<?xml version=\"1.0\" encoding=\"UTF-8\"?><OME "
                                              "xmlns=\"http://www.openmicroscopy.org/Schemas/OME/2016-06\">"
                                              "<Image ID=\"Image:0\"><Pixels %1/></Image></OME>")
                                   .arg(QString::fromUtf8(pixels))
                            << x << y << bits;
    };
    row("micrometres", "PhysicalSizeX=\"0.5\" PhysicalSizeY=\"0.25\" SignificantBits=\"12\"", 0.5, 0.25, 12);
    row("with units",
        "PhysicalSizeX=\"0.5\" PhysicalSizeXUnit=\"\u00B5m\" PhysicalSizeY=\"250\" "
        "PhysicalSizeYUnit=\"nm\"",
        0.5, 0.25);
    row("exponent", "PhysicalSizeX=\"5.0E-1\" PhysicalSizeY=\"5.0E-1\"", 0.5, 0.5);
    row("x alone", "PhysicalSizeX=\"0.5\"", 0.5, 0.5);
    row("pixels",
        "PhysicalSizeX=\"1\" PhysicalSizeXUnit=\"pixel\" PhysicalSizeY=\"1\" "
        "PhysicalSizeYUnit=\"pixel\"",
        0.0, 0.0);
    row("zero", "PhysicalSizeX=\"0\" PhysicalSizeY=\"0\"", 0.0, 0.0);
    row("no number", "PhysicalSizeX=\"wide\" PhysicalSizeY=\"-1\"", 0.0, 0.0);
    row("nothing", "", 0.0, 0.0);
    QTest::newRow("of the first picture")
        << "<OME><Image><Pixels PhysicalSizeX=\"1\"/></Image><Image><Pixels "
           "PhysicalSizeX=\"2\"/></Image></OME>"
        << 1.0 << 1.0 << 0;
    QTest::newRow("cut off") << "<OME><Image><Pixels PhysicalSizeX=\"1" << 0.0 << 0.0 << 0;
    QTest::newRow("entities without end")
        << "<!DOCTYPE x [<!ENTITY a \"aaaaaaaaaa\"><!ENTITY b \"&a;&a;&a;&a;&a;&a;&a;&a;\"><!ENTITY c "
           "\"&b;&b;&b;&b;&b;&b;&b;&b;\"><!ENTITY d \"&c;&c;&c;&c;&c;&c;&c;&c;\"><!ENTITY e "
           "\"&d;&d;&d;&d;&d;&d;&d;&d;\"><!ENTITY f \"&e;&e;&e;&e;&e;&e;&e;&e;\"><!ENTITY g "
           "\"&f;&f;&f;&f;&f;&f;&f;&f;\">]><OME>&g;</OME>"
        << 0.0 << 0.0 << 0;
}

void ZtPixelSizeReaderTest::ome()
{
    QFETCH(QString, xml);
    QFETCH(double, x);
    QFETCH(double, y);
    QFETCH(int, bits);
    QVERIFY(ZtPixelSizeReader::isOme(xml));
    const ZtOfferedPixelSize size = ZtPixelSizeReader::fromOme(xml);
    QCOMPARE(size.x, x);
    QCOMPARE(size.y, y);
    QCOMPARE(size.origin, x > 0.0 ? QStringLiteral("OME") : QString());
    QCOMPARE(ZtPixelSizeReader::significantBitsOfOme(xml), bits);
}

void ZtPixelSizeReaderTest::imageJ_data()
{
    QTest::addColumn<QString>("description");
    QTest::addColumn<double>("x");
    QTest::addColumn<double>("y");
    QTest::newRow("unit") << "ImageJ=1.53t\nunit=um\n" << 0.25 << 0.5;
    QTest::newRow("with carriage returns") << "ImageJ=1.53t\r\nunit=um\r\nloop=false" << 0.25 << 0.5;
    QTest::newRow("two units") << "ImageJ=1.53t\nunit=um\nyunit=nm\n" << 0.25 << 0.0005;
    QTest::newRow("other keys that end so") << "ImageJ=1.53t\ntunit=um\n" << 0.0 << 0.0;
    QTest::newRow("pixels") << "ImageJ=1.53t\nunit=pixel\n" << 0.0 << 0.0;
    QTest::newRow("none") << "ImageJ=1.53t\n" << 0.0 << 0.0;
    QTest::newRow("blank") << "ImageJ=1.53t\nunit=\n" << 0.0 << 0.0;
}

void ZtPixelSizeReaderTest::imageJ()
{
    QFETCH(QString, description);
    QFETCH(double, x);
    QFETCH(double, y);
    const ZtOfferedPixelSize size = ZtPixelSizeReader::fromImageJ(description, 4.0, 2.0);
    QCOMPARE(size.x, x);
    QCOMPARE(size.y, y);
    QVERIFY(!ZtPixelSizeReader::fromImageJ(description, 0.0, 0.0).isKnown());
}

void ZtPixelSizeReaderTest::knowsItsDescriptions()
{
    QVERIFY(ZtPixelSizeReader::isOme(QStringLiteral("<ns0:OME xmlns:ns0=\"x\">")));
    QVERIFY(!ZtPixelSizeReader::isOme(QStringLiteral("At home")));
    QVERIFY(ZtPixelSizeReader::isImageJ(QStringLiteral("ImageJ=1.53t")));
    QVERIFY(!ZtPixelSizeReader::isImageJ(QStringLiteral("Made with ImageJ=1.53t")));
}

STATREPORT_TEST_MAIN(ZtPixelSizeReaderTest)
#include "ZtPixelSizeReaderTest.moc"
