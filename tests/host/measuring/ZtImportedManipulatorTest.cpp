// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtImportedManipulator.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtTableImport.h"
#include "measuring/ZtUnitSettings.h"

#include <QElapsedTimer>

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

void set(const char *key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QLatin1String(key), value);
    ZtAppSettings::endGroup();
}

QVector<int> import(const QByteArray &table)
{
    ZtImportedTable result;
    ZtFault fault;
    if (!ZtTableImport::parse(table, text("t.csv"), ZtTableImportOptions(), &result, &fault))
        qCritical("%s", qPrintable(fault.text()));
    return ZtTableImport::apply(result);
}

ZtImportedManipulator *manipulator(int type)
{
    return static_cast<ZtImportedManipulator *>(ZtKernelData::getInstance()->getGsManipulator(type));
}

const ZtKernelObjectData *object(int type, int id)
{
    return ZtKernelData::getInstance()->object(type, id);
}

/// What a report asks for, object by object and value by value. Returns the number of values.
int askForEverything(int type)
{
    const ZtGsManipulator &asked = *manipulator(type);
    const QStringList names = asked.getValueNames();
    const ZtObjectMap objects = ZtKernelData::getInstance()->objects().value(type);
    int count = 0;
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it) {
        const QStringList shown = asked.valueSet(it.key());
        for (const QString &name : names) {
            int kind = 0;
            const bool isComplete =
                asked.isValueShown(name, shown) && !asked.valueText(name, it.value()).isEmpty() &&
                asked.value(name, it.value(), kind).isValid() && !asked.getObjectName(it.key()).isEmpty() &&
                !asked.objectTypeName(it.key()).isEmpty();
            count += isComplete ? 1 : 0;
        }
    }
    return count;
}

} // namespace

class ZtImportedManipulatorTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();
    void tellsValuesInBaseUnits();
    void followsTheSettings();
    void answersNothingForMissingCells();
    void hidesValues();
    void allValuesAreThoseByName();
    void sharesItsTexts();
    void isFast();

private:
    QVector<int> m_types;
};

void ZtImportedManipulatorTest::init()
{
    StatReportTest::init();
    ZtUnitSettings::getInstance();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void ZtImportedManipulatorTest::cleanup()
{
    for (const int type : qAsConst(m_types))
        ZtKernelData::getInstance()->unregisterType(type);
    m_types.clear();
    StatReportTest::cleanup();
}

void ZtImportedManipulatorTest::tellsValuesInBaseUnits()
{
    m_types = import("type,Length [cm],Area [mm2],Angle [rad],Cells [pcs],Share [%],Mass [g],Ratio\n"
                     "Leaf,5.10,2,3.14159265358979,12,12.5,3750,0.630\n"
                     "Leaf,1,1,1,12.5,1,1,1\n");
    const int type = m_types.value(0);
    QVERIFY(type >= ZtTableImport::firstTypeId);
    QCOMPARE(manipulator(type)->typeFlags(0), 0x200);
    QCOMPARE(manipulator(type)->objectTypeId(), type);
    const struct
    {
        const char *name;
        int kind;
        QVariant::Type variant;
        double value;
        const char *shown;
    } expected[] = {
        {"Length", ZtGsManipulator::Length, QVariant::Double, 51000.0, "5.10 cm"},
        {"Area", ZtGsManipulator::Area, QVariant::Double, 2e6, "2 mm\u00B2"},
        {"Angle", ZtGsManipulator::Angle, QVariant::Double, 180.0, "3.14159265358979 rad"},
        {"Cells", ZtGsManipulator::Count, QVariant::Int, 12.0, "12 pcs"},
        {"Share", ZtGsManipulator::Percentage, QVariant::Double, 12.5, "12.5 %"},
        {"Mass", ZtGsManipulator::NoKind, QVariant::Double, 3750.0, "3750 g"},
        {"Ratio", ZtGsManipulator::NoKind, QVariant::Double, 0.63, "0.630"},
    };
    for (const auto &row : expected) {
        int kind = -1;
        const QVariant value = manipulator(type)->value(text(row.name), object(type, 1), kind);
        QCOMPARE(kind, row.kind);
        QCOMPARE(value.type(), row.variant);
        QCOMPARE(value.toDouble(), row.value);
        QCOMPARE(manipulator(type)->valueText(text(row.name), object(type, 1)), text(row.shown));
    }
    int kind = -1;
    QCOMPARE(manipulator(type)->value(text("Cells"), object(type, 2), kind), QVariant(12.5));
}

void ZtImportedManipulatorTest::followsTheSettings()
{
    m_types = import("Length [cm],Angle [deg]\n5.10,180\n");
    const int type = m_types.value(0);
    const auto texts = [type] {
        return QStringList{manipulator(type)->valueText(text("Length"), object(type, 1)),
                           manipulator(type)->valueText(text("Angle"), object(type, 1))};
    };
    QCOMPARE(texts(), (QStringList{text("5.10 cm"), text("180 \u00B0")}));
    set("LengthUnit", text("mm"));
    QCOMPARE(texts(), (QStringList{text("51.000 mm"), text("180 \u00B0")}));
    set("AngleUnit", text("rad"));
    set("MeasurementLabelsSignDigits", 4u);
    QCOMPARE(texts(), (QStringList{text("51.00 mm"), text("3.142 rad")}));
    set("LengthUnit", text("auto"));
    QCOMPARE(texts(), (QStringList{text("5.100 cm"), text("3.142 rad")}));
}

void ZtImportedManipulatorTest::answersNothingForMissingCells()
{
    m_types = import("a,b\n1,NA\n");
    const int type = m_types.value(0);
    QCOMPARE(manipulator(type)->getValueNames(), QStringList(text("a")));
    m_types += import("a,b\n1,NA\n2,3\n");
    const int other = m_types.value(1);
    int kind = -1;
    QVERIFY(!manipulator(other)->value(text("b"), object(other, 1), kind).isValid());
    QCOMPARE(kind, 0);
    QCOMPARE(manipulator(other)->valueText(text("b"), object(other, 1)), QString());
    QVERIFY(!manipulator(other)->value(text("c"), object(other, 1), kind).isValid());
    QVERIFY(!manipulator(other)->value(text("a"), nullptr, kind).isValid());
}

void ZtImportedManipulatorTest::hidesValues()
{
    m_types = import("a,b,c\n1,2,3\n4,5,6\n");
    const int type = m_types.value(0);
    ZtImportedManipulator &hiding = *manipulator(type);
    auto *first = static_cast<ZtMeasuredObjectData *>(ZtKernelData::getInstance()->object(type, 1));
    hiding.setValueShown(first, 1, false);
    hiding.setValueShown(first, 1, false);
    QCOMPARE(hiding.valueSet(1), (QStringList{text("a"), text("c")}));
    QCOMPARE(hiding.valueSet(2), hiding.getValueNames());
    QVERIFY(!hiding.isValueShown(text("b"), hiding.valueSet(1)));
    QVERIFY(hiding.isValueShown(text("c"), hiding.valueSet(1)));
    QVERIFY(hiding.isValueShown(text("b"), hiding.valueSet(2)));
    QVERIFY(!hiding.isValueShown(text("d"), hiding.valueSet(2)));
    QVERIFY(!hiding.isValueShown(*first, 1));
    hiding.setValueShown(first, 1, true);
    QCOMPARE(hiding.valueSet(1), hiding.getValueNames());
}

void ZtImportedManipulatorTest::allValuesAreThoseByName()
{
    m_types = import("type,Length [cm],Cells [pcs],Mass [g]\nLeaf,5.10,12,\nLeaf,,1,3\nLeaf,7,8,9\n");
    ZtImportedManipulator *const asked = manipulator(m_types.value(0));
    for (int id = 1; id <= 3; ++id) {
        std::vector<ZtMeasuredValue> values;
        asked->appendShownValues(object(m_types.value(0), id), &values);
        QCOMPARE(values.size(), id == 3 ? std::size_t(3) : std::size_t(2));
        for (const ZtMeasuredValue &value : values) {
            int kind = 0;
            const QString name = asked->getValueNames().at(value.position);
            QCOMPARE(value.value, asked->value(name, object(m_types.value(0), id), kind).toDouble());
            QCOMPARE(value.kind, kind);
        }
    }
    auto *const third =
        static_cast<ZtImportedObjectData *>(ZtKernelData::getInstance()->object(m_types.value(0), 3));
    asked->setValueShown(third, 1, false);
    std::vector<ZtMeasuredValue> values;
    asked->appendShownValues(third, &values);
    QCOMPARE(values.size(), std::size_t(2));
    QCOMPARE(values.back().position, 2);
    asked->appendShownValues(nullptr, &values);
    QCOMPARE(values.size(), std::size_t(2));
}

void ZtImportedManipulatorTest::sharesItsTexts()
{
    m_types = import("type,name,Length [cm]\nLeaf,,5.1\nLeaf,long one,7\n");
    const int type = m_types.value(0);
    const ZtImportedManipulator &asked = *manipulator(type);
    QCOMPARE(asked.getObjectName(1), text("Leaf 1"));
    QCOMPARE(asked.getObjectName(2), text("long one"));
    const auto isShared = [](const QString &a, const QString &b) { return a.constData() == b.constData(); };
    QVERIFY(isShared(asked.getObjectName(1), asked.getObjectName(1)));
    QVERIFY(isShared(asked.getObjectName(2), asked.getObjectName(2)));
    QVERIFY(isShared(asked.objectTypeName(1), asked.objectTypeName(2)));
    QVERIFY(isShared(asked.valueText(text("Length"), object(type, 1)),
                     asked.valueText(text("Length"), object(type, 1))));
    QVERIFY(asked.valueSet(1).isSharedWith(asked.getValueNames()));
}

void ZtImportedManipulatorTest::isFast()
{
    QByteArray table = "Length [mm],Width [mm],Mass [g],Count [pcs]\n";
    for (int i = 0; i < 25000; ++i)
        table += QByteArray::number(i) + ".5,2.25,3750,7\n";
    m_types = import(table);
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(askForEverything(m_types.value(0)), 100000);
    // Far more than it takes, for slow machines and instrumented builds.
    QVERIFY2(timer.elapsed() < 2000, qPrintable(QString::number(timer.elapsed())));
    qInfo("100 000 values in %lld ms", timer.elapsed());
}

STATREPORT_TEST_MAIN(ZtImportedManipulatorTest)
#include "ZtImportedManipulatorTest.moc"
