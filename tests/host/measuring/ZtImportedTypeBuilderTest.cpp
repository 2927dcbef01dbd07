// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTypeBuilder.h"

namespace {

const ZtUnit millimetre = ZtUnit::parse(QStringLiteral("mm"));
const ZtUnit centimetre = ZtUnit::parse(QStringLiteral("cm"));
const ZtUnit gram = ZtUnit::parse(QStringLiteral("g"));

QString text(const char *latin1)
{
    return QString::fromLatin1(latin1);
}

} // namespace

class ZtImportedTypeBuilderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void sortsCells();
    void keepsUnits();
    void refusesUnitsThatDoNotFit();
    void refusesTheSameValueTwice();
    void buildsEmptyTypes();
};

void ZtImportedTypeBuilderTest::sortsCells()
{
    ZtImportedTypeBuilder builder(text("Leaf"));
    QCOMPARE(builder.addValue(text("a")), 0);
    QCOMPARE(builder.addValue(text("b")), 1);
    QCOMPARE(builder.addValue(text("a")), 0);
    for (int i = 0; i < 4; ++i)
        QCOMPARE(builder.addRow(i == 1 ? text("second") : QString()), i);
    QVERIFY(builder.addCell(3, 1, 31, "31", ZtUnit()));
    QVERIFY(builder.addCell(0, 1, 1, "1", ZtUnit()));
    QVERIFY(builder.addCell(0, 0, 0, "0", ZtUnit()));
    QVERIFY(builder.addCell(1, 0, 10, "10", ZtUnit()));
    ZtFault fault;
    const auto type = builder.build(&fault);
    QVERIFY(type);
    QCOMPARE(type->rowCount(), 4);
    QCOMPARE(type->rowName(1), text("second"));
    QVERIFY(type->rowName(0).isNull());
    QCOMPARE(type->text(*type->cell(0, 0)), text("0"));
    QCOMPARE(type->text(*type->cell(0, 1)), text("1"));
    QCOMPARE(type->cell(1, 0)->value, 10.0);
    QVERIFY(!type->cell(1, 1));
    QVERIFY(!type->cell(2, 0));
    QVERIFY(!type->cell(3, 0));
    QCOMPARE(type->text(*type->cell(3, 1)), text("31"));
    QCOMPARE(type->valueIndex(text("b")), 1);
    QCOMPARE(type->valueIndex(text("c")), -1);
}

void ZtImportedTypeBuilderTest::keepsUnits()
{
    ZtImportedTypeBuilder builder(text("Leaf"));
    builder.addValue(text("first cell's"));
    builder.appendValue(text("stated"), millimetre);
    const int row = builder.addRow();
    QVERIFY(builder.addCell(row, 0, 2, "2", centimetre));
    QVERIFY(builder.addCell(row, 1, 3, "3", centimetre));
    ZtFault fault;
    const auto type = builder.build(&fault);
    QCOMPARE(type->values().at(0).unit.text(), text("cm"));
    QCOMPARE(type->values().at(1).unit.text(), text("mm"));
    const ZtImportedCell &cell = *type->cell(0, 1);
    QCOMPARE(cell.value, 30000.0);
    QCOMPARE(type->text(cell), text("3 cm"));
    QCOMPARE(type->unit(cell).text(), text("cm"));
    QCOMPARE(type->numberText(cell), text("3"));
}

void ZtImportedTypeBuilderTest::refusesUnitsThatDoNotFit()
{
    ZtImportedTypeBuilder builder(text("Leaf"));
    const int length = builder.appendValue(text("Length"), millimetre);
    const int mass = builder.appendValue(text("Mass"), gram);
    const int row = builder.addRow();
    QVERIFY(!builder.addCell(row, length, 1, "1", gram));
    QVERIFY(!builder.addCell(row, length, 1, "1", ZtUnit()));
    QVERIFY(!builder.addCell(row, mass, 1, "1", ZtUnit::parse(text("kg"))));
    QVERIFY(builder.addCell(row, mass, 1, "1", gram));
}

void ZtImportedTypeBuilderTest::refusesTheSameValueTwice()
{
    ZtImportedTypeBuilder builder(text("Leaf"));
    const int length = builder.addValue(text("Length"));
    const int row = builder.addRow();
    builder.addRow();
    QVERIFY(builder.addCell(row, length, 1, "1", millimetre, {2, 5}));
    QVERIFY(builder.addCell(row + 1, length, 1, "1", millimetre, {3, 5}));
    QVERIFY(builder.addCell(row, length, 1, "1", millimetre, {7, 5}));
    ZtFault fault;
    QVERIFY(!builder.build(&fault));
    QCOMPARE(fault.line, 7);
    QCOMPARE(fault.column, 5);
    QCOMPARE(fault.message, text("\"Leaf 1\" already has a value \"Length\" in line 2"));
}

void ZtImportedTypeBuilderTest::buildsEmptyTypes()
{
    ZtFault fault;
    const auto nothing = ZtImportedTypeBuilder(text("None")).build(&fault);
    QCOMPARE(nothing->rowCount(), 0);
    QVERIFY(nothing->valueNames().isEmpty());
    ZtImportedTypeBuilder builder(text("Leaf"));
    builder.addRow();
    const auto noValues = builder.build(&fault);
    QVERIFY(noValues->row(0).begin() == noValues->row(0).end());
}

STATREPORT_TEST_MAIN(ZtImportedTypeBuilderTest)
#include "ZtImportedTypeBuilderTest.moc"
