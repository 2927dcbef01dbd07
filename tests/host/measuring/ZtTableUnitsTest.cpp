// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtTableUnits.h"

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

class ZtTableUnitsTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void prefersTheUsersUnitOfAValue();
    void prefersTheTablesUnitToTheUsersDefault();
    void knowsWhatResultsMean_data();
    void knowsWhatResultsMean();
    void remembersNamesThatNobodyAskedFor();
};

void ZtTableUnitsTest::prefersTheUsersUnitOfAValue()
{
    ZtTableUnits units({text("Area=mm2"), text("Bill_Length_mm = cm"), text("a=b=g"), text("area=cm2")});
    QCOMPARE(units.unitOf(text("Area"), text("m2")).text(), text("cm\u00B2"));
    QCOMPARE(units.unitOf(text("bill length"), text("mm"), text("bill_length_mm")).text(), text("cm"));
    QCOMPARE(units.unitOf(text("A=B"), QString()).text(), text("g"));
    QCOMPARE(units.resultsUnitOf(text("Area"), QString()).text(), text("cm\u00B2"));
}

void ZtTableUnitsTest::prefersTheTablesUnitToTheUsersDefault()
{
    ZtTableUnits units({text("cm"), text("mm")});
    QCOMPARE(units.unitOf(text("Length"), text("nm")).text(), text("nm"));
    QCOMPARE(units.unitOf(text("Length"), QString()).text(), text("mm"));
    QVERIFY(ZtTableUnits({}).unitOf(text("Length"), QString()).isEmpty());
}

void ZtTableUnitsTest::knowsWhatResultsMean_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("stated");
    QTest::addColumn<QString>("unit");
    QTest::newRow("area") << "Area"
                          << "" << text("mm\u00B2");
    QTest::newRow("perimeter") << "Perim."
                               << ""
                               << "mm";
    QTest::newRow("place") << "XM"
                           << ""
                           << "mm";
    QTest::newRow("angle") << "Angle"
                           << "" << text("\u00B0");
    QTest::newRow("share") << "%Area"
                           << ""
                           << "%";
    QTest::newRow("shape") << "Circ."
                           << ""
                           << "";
    QTest::newRow("grey value") << "Mean"
                                << ""
                                << "";
    QTest::newRow("stated") << "Mean"
                            << "V"
                            << "V";
}

void ZtTableUnitsTest::knowsWhatResultsMean()
{
    QFETCH(QString, name);
    QFETCH(QString, stated);
    ZtTableUnits units({text("mm")});
    QTEST(units.resultsUnitOf(name, stated).text(), "unit");
}

void ZtTableUnitsTest::remembersNamesThatNobodyAskedFor()
{
    ZtTableUnits units({text("Area=mm2"), text("Lenght=mm"), text("cm")});
    units.unitOf(text("area"), QString());
    units.unitOf(text("Length"), QString());
    QCOMPARE(units.unusedNames(), QStringList(text("Lenght")));
}

STATREPORT_TEST_MAIN(ZtTableUnitsTest)
#include "ZtTableUnitsTest.moc"
