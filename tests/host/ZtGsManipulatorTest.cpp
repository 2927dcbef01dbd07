// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/FakeManipulator.h"

namespace {

/// Leaves the drawing to the base class.
class UndrawnManipulator : public FakeManipulator
{
public:
    using FakeManipulator::FakeManipulator;
    void draw(QPainter *painter, int id, const ZtKernelObjectData *object) const override
    {
        ZtGsManipulator::draw(painter, id, object);
    }
};

} // namespace

class ZtGsManipulatorTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void measureKindsAreFixed_data();
    void measureKindsAreFixed();
    void valueNamesKeepTheirOrder();
    void objectsAreNamedAfterTheirType();
    void objectsCanHaveNamesOfTheirOwn();
    void allNamesCanBeTakenAway();
    void nothingIsDrawnByDefault();
};

void ZtGsManipulatorTest::measureKindsAreFixed_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("expected");
    QTest::newRow("none") << int(ZtGsManipulator::NoKind) << 0;
    QTest::newRow("length") << int(ZtGsManipulator::Length) << 1;
    QTest::newRow("area") << int(ZtGsManipulator::Area) << 2;
    QTest::newRow("angle") << int(ZtGsManipulator::Angle) << 3;
    QTest::newRow("count") << int(ZtGsManipulator::Count) << 4;
    QTest::newRow("percentage") << int(ZtGsManipulator::Percentage) << 5;
    QTest::newRow("measurement flag") << int(ZtGsManipulator::MeasurementFlag) << 0x200;
}

void ZtGsManipulatorTest::measureKindsAreFixed()
{
    QFETCH(int, kind);
    QTEST(kind, "expected");
}

void ZtGsManipulatorTest::valueNamesKeepTheirOrder()
{
    FakeManipulator manipulator(1);
    QCOMPARE(manipulator.getValueNames(), QStringList({QStringLiteral("width"), QStringLiteral("height")}));
    manipulator.setValueNames({QStringLiteral("z"), QStringLiteral("a")});
    QCOMPARE(manipulator.getValueNames(), QStringList({QStringLiteral("z"), QStringLiteral("a")}));
}

void ZtGsManipulatorTest::objectsAreNamedAfterTheirType()
{
    const FakeManipulator manipulator(1);
    QCOMPARE(manipulator.getObjectName(7), QStringLiteral("Square 7"));
}

void ZtGsManipulatorTest::objectsCanHaveNamesOfTheirOwn()
{
    FakeManipulator manipulator(1);
    manipulator.setObjectName(2, QStringLiteral("Left wing"));
    QCOMPARE(manipulator.getObjectName(2), QStringLiteral("Left wing"));
    QCOMPARE(manipulator.getObjectName(1), QStringLiteral("Square 1"));
    manipulator.setObjectName(2, QString());
    QCOMPARE(manipulator.getObjectName(2), QStringLiteral("Square 2"));
}

void ZtGsManipulatorTest::allNamesCanBeTakenAway()
{
    FakeManipulator manipulator(1);
    manipulator.setObjectName(1, QStringLiteral("a"));
    manipulator.setObjectName(2, QStringLiteral("b"));
    manipulator.clearObjectNames();
    QCOMPARE(manipulator.getObjectName(1), QStringLiteral("Square 1"));
    QCOMPARE(manipulator.getObjectName(2), QStringLiteral("Square 2"));
}

void ZtGsManipulatorTest::nothingIsDrawnByDefault()
{
    QImage image(4, 4, QImage::Format_RGB32);
    image.fill(Qt::white);
    const QImage before = image.copy();
    QPainter painter(&image);
    UndrawnManipulator(1).draw(&painter, 1, nullptr);
    painter.end();
    QCOMPARE(image, before);
}

STATREPORT_TEST_MAIN(ZtGsManipulatorTest)
#include "ZtGsManipulatorTest.moc"
