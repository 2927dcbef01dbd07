// SPDX-License-Identifier: MIT
#include "KvDeskSelectionStatistics.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "support/RightToLeft.h"
#include "support/StatReportTest.h"

#include <limits>

namespace {

using Group = KvDeskSelectionStatistics::Group;

Group group(const QString &name, int kind, const QVector<double> &numbers, const QString &unit = QString())
{
    Group result;
    result.valueName = name;
    result.kind = kind;
    result.unit = unit;
    for (const double number : numbers)
        result.numbers.add(number);
    return result;
}

Group lengths(const QVector<double> &numbers)
{
    return group(QStringLiteral("Length"), ZtGsManipulator::Length, numbers);
}

void setSetting(const QString &key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(key, value);
    ZtAppSettings::endGroup();
}

} // namespace

Q_DECLARE_METATYPE(Group)

class KvDeskSelectionStatisticsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void texts_data();
    void texts();
    void followsTheSettings();
    void details();
    void unitsFollowNumbersFromRightToLeft();
    void detailsOfAMixture();
};

void KvDeskSelectionStatisticsTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvDeskSelectionStatisticsTest::texts_data()
{
    QTest::addColumn<QVector<Group>>("groups");
    QTest::addColumn<QString>("text");
    const auto row = [](const char *name, const QVector<Group> &groups, const char *text) {
        QTest::newRow(name) << groups << QString::fromUtf8(text);
    };
    using M = ZtGsManipulator;
    const double nan = std::numeric_limits<double>::quiet_NaN();
    row("nothing", {}, "");
    row("group of nothing", {lengths({})}, "");
    row("one value", {lengths({1500.0})}, "1.500 mm");
    row("values of one name", {lengths({10, 20, 30})},
        "n = 3, mean 20.000 μm, SD 8.165 μm, min 10.000 μm, max 30.000 μm");
    row("values of one kind", {lengths({10}), group(QStringLiteral("Width"), M::Length, {30})},
        "n = 2, mean 20.000 μm, SD 10.000 μm, min 10.000 μm, max 30.000 μm");
    row("mixed kinds", {lengths({10, 30}), group(QStringLiteral("Area"), M::Area, {5, 7})},
        "Selected values: 4; Length: n = 2, mean 20.000 μm, SD 10.000 μm, min 10.000 μm, max 30.000 μm");
    row("mixed kinds, two names of one",
        {group(QStringLiteral("Width"), M::Length, {10}), lengths({20}),
         group(QStringLiteral("Area"), M::Area, {5})},
        "Selected values: 3; Width: 10.000 μm");
    row("mean of counts", {group(QStringLiteral("Count"), M::Count, {2, 3})},
        "n = 2, mean 2.500 pcs, SD 0.500 pcs, min 2 pcs, max 3 pcs");
    row("shares", {group(QStringLiteral("Share"), M::Percentage, {25, 75})},
        "n = 2, mean 50.000 %, SD 25.000 %, min 25.000 %, max 75.000 %");
    row("angles", {group(QStringLiteral("Angle"), M::Angle, {90, 90})},
        "n = 2, mean 90.000 °, SD 0.000 °, min 90.000 °, max 90.000 °");
    row("unit without a kind", {group(QStringLiteral("Mass"), M::NoKind, {1, 2}, QStringLiteral("g"))},
        "n = 2, mean 1.500 g, SD 0.500 g, min 1.000 g, max 2.000 g");
    row("mixed units without a kind",
        {group(QStringLiteral("Mass"), M::NoKind, {1}, QStringLiteral("g")),
         group(QStringLiteral("Time"), M::NoKind, {2}, QStringLiteral("s"))},
        "Selected values: 2; Mass: 1.000 g");
    row("same name in two units",
        {group(QStringLiteral("Length"), M::NoKind, {1}, QStringLiteral("px")), lengths({2})},
        "Selected values: 2; Length: 1.000 px");
    row("same values", {lengths({20000, 20000})},
        "n = 2, mean 2.000 cm, SD 0.000 cm, min 2.000 cm, max 2.000 cm");
    row("values that hardly differ", {lengths({20000, 20001})},
        "n = 2, mean 2.000 cm, SD 0.0000500 cm, min 2.000 cm, max 2.000 cm");
    row("smallest and largest far apart", {lengths({0.4, 20, 3000})},
        "n = 3, mean 1.007 mm, SD 1.409 mm, min 0.000400 mm, max 3.000 mm");
    row("both signs", {lengths({-3000, 3000})},
        "n = 2, mean 0.000 mm, SD 3.000 mm, min -3.000 mm, max 3.000 mm");
    row("areas", {group(QStringLiteral("Area"), M::Area, {4e6, 9e6})},
        "n = 2, mean 6.500 mm², SD 2.500 mm², min 4.000 mm², max 9.000 mm²");
    row("no number", {lengths({nan, nan})}, "");
    row("some numbers", {lengths({nan, 10, 20})},
        "n = 2, mean 15.000 μm, SD 5.000 μm, min 10.000 μm, max 20.000 μm");
}

void KvDeskSelectionStatisticsTest::texts()
{
    QFETCH(QVector<Group>, groups);
    QFETCH(QString, text);
    KvDeskSelectionStatistics statistics;
    for (const Group &group : qAsConst(groups))
        statistics.add(group);
    QCOMPARE(statistics.text(), text);
    QCOMPARE(statistics.details().isEmpty(), text.isEmpty());
}

void KvDeskSelectionStatisticsTest::followsTheSettings()
{
    setSetting(QStringLiteral("LengthUnit"), QStringLiteral("mm"));
    setSetting(QStringLiteral("MeasurementLabelsSignDigits"), 3U);
    KvDeskSelectionStatistics statistics;
    statistics.add(lengths({1000, 3000}));
    QCOMPARE(statistics.text(), QStringLiteral("n = 2, mean 2.00 mm, SD 1.00 mm, min 1.00 mm, max 3.00 mm"));
}

void KvDeskSelectionStatisticsTest::details()
{
    KvDeskSelectionStatistics statistics;
    statistics.add(lengths({1, 2}));
    QCOMPARE(statistics.details(),
             QString::fromUtf8("Selected values: 2\nMean: 1.50000000 μm\nStandard deviation: 0.500000000 μm\n"
                               "Smallest: 1.00000000 μm\nLargest: 2.00000000 μm"));
    QVERIFY(!statistics.isMixed());
}

void KvDeskSelectionStatisticsTest::unitsFollowNumbersFromRightToLeft()
{
    const RightToLeft program;
    KvDeskSelectionStatistics statistics;
    statistics.add(lengths({10}));
    QCOMPARE(statistics.text(), RightToLeft::isolated(QStringLiteral("10.000 \u03bcm")));
}

void KvDeskSelectionStatisticsTest::detailsOfAMixture()
{
    KvDeskSelectionStatistics statistics;
    statistics.add(lengths({1}));
    statistics.add(group(QStringLiteral("Area"), ZtGsManipulator::Area, {5, 7}));
    QVERIFY(statistics.isMixed());
    QCOMPARE(statistics.count(), 3);
    QCOMPARE(statistics.numbers().count(), 1);
    QCOMPARE(statistics.details(),
             QString::fromUtf8("Selected values: 3\nLength: 1.000 μm\n"
                               "Area: n = 2, mean 6.000 μm², SD 1.000 μm², min 5.000 μm², max 7.000 μm²"));
}

STATREPORT_TEST_MAIN(KvDeskSelectionStatisticsTest)
#include "KvDeskSelectionStatisticsTest.moc"
