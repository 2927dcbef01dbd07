// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "data/MeasuredHost.h"
#include "support/MetaMethods.h"

#include <QElapsedTimer>
#include <QRandomGenerator>

#include <algorithm>
#include <cmath>
#include <ctime>
#include <limits>
#include <memory>

namespace {

const double notANumber = std::numeric_limits<double>::quiet_NaN();
const double infinity = std::numeric_limits<double>::infinity();

/// Object ids of a group's records.
QVector<int> idsOf(const KvValueGroup &group)
{
    QVector<int> ids;
    for (const KvMeasuredValue &record : group)
        ids.append(record.objectId);
    return ids;
}

bool isClose(double actual, double expected)
{
    return std::abs(actual - expected) <= 1e-9 * std::max(1.0, std::abs(expected));
}

QByteArray compared(double actual, double expected)
{
    return QByteArray::number(actual, 'g', 17) + " instead of " + QByteArray::number(expected, 'g', 17);
}

// Sepal lengths of the iris flowers that E. Anderson measured, in mm.
const QVector<double> setosa{51, 49, 47, 46, 50, 54, 46, 50, 44, 49, 54, 48, 48, 43, 58, 57, 54,
                             51, 57, 51, 54, 51, 46, 51, 48, 50, 50, 52, 52, 47, 48, 54, 52, 55,
                             49, 50, 55, 49, 44, 51, 50, 45, 44, 50, 51, 48, 51, 46, 53, 50};
const QVector<double> versicolor{70, 64, 69, 55, 65, 57, 63, 49, 66, 52, 50, 59, 60, 61, 56, 67, 56,
                                 58, 62, 56, 59, 61, 63, 61, 64, 66, 68, 67, 60, 57, 55, 55, 58, 60,
                                 54, 60, 67, 63, 56, 55, 55, 61, 58, 50, 56, 57, 57, 62, 51, 57};
const QVector<double> virginica{63, 58, 71, 63, 65, 76, 49, 73, 67, 72, 65, 64, 68, 57, 58, 64, 65,
                                77, 77, 60, 69, 56, 77, 63, 67, 72, 62, 61, 64, 72, 74, 79, 64, 63,
                                61, 77, 63, 64, 60, 69, 67, 69, 58, 68, 67, 67, 63, 65, 62, 59};

} // namespace

class KvStatisticsEngineTest : public StatReportTest
{
    Q_OBJECT

public:
    /// What the engine said while it regrouped, each with the number of value names it had by then.
    QStringList announced;

public slots:
    void slotUpdating() { announced.append(QStringLiteral("updating %1").arg(m_engine.valueNames().size())); }
    void slotUpdated() { announced.append(QStringLiteral("updated %1").arg(m_engine.valueNames().size())); }

private slots:
    void init();
    void cleanup();

    void isOneForAllAndEmptyAtFirst(); // first: the engine keeps what later tests give it
    void signalsAndSlotsKeepTheirOrder();
    void groupsByNameAndType();
    void groupsKeepTheMeasurementOrder();
    void groupNamesArePlainlyOrdered();
    void unknownNamesAreNotInserted();
    void everyChangeRegroupsAll();
    void regroupingIsAnnouncedTwice();
    void manyNamesInChangingOrder();
    void theSourceIsConnectedOnce();
    void aReplacedSourceIsSilent();
    void aSourceMayDie();

    void numericValues_data();
    void numericValues();
    void averages_data();
    void averages();
    void sigmas_data();
    void sigmas();
    void fiveNumbersOfAnEmptyGroup();
    void fiveNumbersByCount_data();
    void fiveNumbersByCount();
    void fiveNumbersOfOddValues();
    void rangeKeepsTheTypes();
    void ranges_data();
    void ranges();
    void regressions_data();
    void regressions();
    void regressionOfEqualXIsNotFinite();
    void niceSteps_data();
    void niceSteps();
    void flowers_data();
    void flowers();
    void regroupingIsLinear();

private:
    KvStatisticsEngine &m_engine = KvStatisticsEngine::instance();
    std::unique_ptr<MeasuredHost> m_host;
    std::unique_ptr<KvReportKernelData> m_data;
};

void KvStatisticsEngineTest::init()
{
    StatReportTest::init();
    announced.clear();
    m_host = std::make_unique<MeasuredHost>();
    m_data = std::make_unique<KvReportKernelData>();
}

void KvStatisticsEngineTest::cleanup()
{
    disconnect(&m_engine, nullptr, this, nullptr);
    m_engine.setKernelData(nullptr);
    m_data.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsEngineTest::isOneForAllAndEmptyAtFirst()
{
    QCOMPARE(&KvStatisticsEngine::instance(), &m_engine);
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length")});
    m_host->addObject(1, {1.0});
    m_data->setActive(true);
    m_engine.setKernelData(m_data.get());
    QCOMPARE(m_engine.kernelData(), m_data.get());
    // Records that were there before are grouped with the next announcement only.
    QVERIFY(m_engine.valueNames().isEmpty());
    QVERIFY(m_engine.byValueName().isEmpty());
    QVERIFY(m_engine.byObjectType().isEmpty());
    QVERIFY(m_engine.objectTypeNames().isEmpty());
    m_data->slotDelayedMeasurementsUpdate();
    QCOMPARE(m_engine.valueNames(), QStringList(QStringLiteral("Length")));
}

void KvStatisticsEngineTest::signalsAndSlotsKeepTheirOrder()
{
    const QMetaObject &meta = KvStatisticsEngine::staticMetaObject;
    QCOMPARE(ownMethods(meta, QMetaMethod::Signal),
             QStringList({QStringLiteral("signalMeasurementsListUpdating()"),
                          QStringLiteral("signalMeasurementsListUpdated()")}));
    QCOMPARE(ownMethods(meta, QMetaMethod::Slot),
             QStringList(QStringLiteral("slotMeasurementsListUpdated()")));
}

void KvStatisticsEngineTest::groupsByNameAndType()
{
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length"), QStringLiteral("Angle")});
    m_host->addType(2, QStringLiteral("Arc"), {QStringLiteral("Length")});
    m_host->addObject(1, {10.0, 45.0});
    m_host->addObject(1, {20.0, 90.0});
    m_host->addObject(2, {30.0});
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);

    QCOMPARE(m_engine.valueNames(), QStringList({QStringLiteral("Angle"), QStringLiteral("Length")}));
    QCOMPARE(KvStatisticsEngine::average(m_engine.values(QStringLiteral("Length"))), 20.0);
    QCOMPARE(m_engine.values(QStringLiteral("Length")).size(), 3);
    QCOMPARE(m_engine.values(QStringLiteral("Angle")).size(), 2);

    QCOMPARE(m_engine.objectTypeNames(), QStringList({QStringLiteral("Arc"), QStringLiteral("Line")}));
    QCOMPARE(m_engine.valueNames(QStringLiteral("Line")),
             QStringList({QStringLiteral("Angle"), QStringLiteral("Length")}));
    QCOMPARE(m_engine.valueNames(QStringLiteral("Arc")), QStringList(QStringLiteral("Length")));
    QCOMPARE(m_engine.values(QStringLiteral("Line"), QStringLiteral("Length")).size(), 2);
    QCOMPARE(m_engine.values(QStringLiteral("Arc"), QStringLiteral("Length")).first().value, QVariant(30.0));
    QCOMPARE(m_engine.byValueName().keys(), m_engine.valueNames());
    QCOMPARE(m_engine.byObjectType().keys(), m_engine.objectTypeNames());

    // A record in a group is a whole record.
    const KvMeasuredValue record = m_engine.values(QStringLiteral("Line"), QStringLiteral("Angle")).at(1);
    QCOMPARE(record.objectType, 1);
    QCOMPARE(record.objectId, 2);
    QCOMPARE(record.objectTypeName, QStringLiteral("Line"));
    QCOMPARE(record.objectName, QStringLiteral("Line 2"));
    QCOMPARE(record.valueText, QStringLiteral("90 u"));
}

void KvStatisticsEngineTest::groupsKeepTheMeasurementOrder()
{
    // One name for both types: its group follows type id, then object id, not the values.
    m_host->addType(2, QStringLiteral("Line"), {QStringLiteral("Length")});
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length")});
    m_host->addObject(2, {1.0}, 7);
    m_host->addObject(2, {9.0}, 5);
    m_host->addObject(1, {5.0}, 30);
    m_host->addObject(1, {3.0}, 20);
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);
    QCOMPARE(idsOf(m_engine.values(QStringLiteral("Length"))), QVector<int>({20, 30, 5, 7}));
    QCOMPARE(idsOf(m_engine.values(QStringLiteral("Line"), QStringLiteral("Length"))),
             QVector<int>({20, 30, 5, 7}));
}

void KvStatisticsEngineTest::groupNamesArePlainlyOrdered()
{
    const QStringList given{QStringLiteral("b"),
                            QStringLiteral("A"),
                            QStringLiteral("a"),
                            QStringLiteral("ä"),
                            QStringLiteral("10"),
                            QStringLiteral("9"),
                            QString()};
    const QStringList ordered{QString(),           QStringLiteral("10"), QStringLiteral("9"),
                              QStringLiteral("A"), QStringLiteral("a"),  QStringLiteral("b"),
                              QStringLiteral("ä")};
    for (int i = 0; i < given.size(); ++i) {
        m_host->addType(i + 1, given.at(i), given);
        m_host->addObject(i + 1, {1.0, 1.0, 1.0, 1.0, 1.0, 1.0, 1.0});
    }
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);
    QCOMPARE(m_engine.valueNames(), ordered);
    QCOMPARE(m_engine.objectTypeNames(), ordered);
    QCOMPARE(m_engine.valueNames(QStringLiteral("a")), ordered);
}

void KvStatisticsEngineTest::unknownNamesAreNotInserted()
{
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length")});
    m_host->addObject(1, {1.0});
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);
    QVERIFY(m_engine.values(QStringLiteral("length")).isEmpty());
    QVERIFY(m_engine.values(QStringLiteral("Line"), QStringLiteral("length")).isEmpty());
    QVERIFY(m_engine.values(QStringLiteral("line"), QStringLiteral("Length")).isEmpty());
    QVERIFY(m_engine.valueNames(QStringLiteral("line")).isEmpty());
    QCOMPARE(&m_engine.values(QStringLiteral("none")), &m_engine.values(QStringLiteral("no one")));
    QCOMPARE(m_engine.valueNames(), QStringList(QStringLiteral("Length")));
    QCOMPARE(m_engine.objectTypeNames(), QStringList(QStringLiteral("Line")));
    QCOMPARE(m_engine.valueNames(QStringLiteral("Line")), QStringList(QStringLiteral("Length")));
}

void KvStatisticsEngineTest::everyChangeRegroupsAll()
{
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length")});
    m_host->addType(2, QStringLiteral("Arc"), {QStringLiteral("Radius")});
    m_host->addObject(1, {1.0});
    m_host->addObject(2, {1.0});
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);
    const QMap<QString, KvValueGroup> held = m_engine.byValueName();
    ZtKernelData::getInstance()->removeObject(1, 1);
    m_data->slotDelayedMeasurementsUpdate();
    QCOMPARE(m_engine.valueNames(), QStringList(QStringLiteral("Radius")));
    QCOMPARE(m_engine.objectTypeNames(), QStringList(QStringLiteral("Arc")));
    QCOMPARE(m_engine.values(QStringLiteral("Radius")).size(), 1); // not 2
    QCOMPARE(held.size(), 2);
    ZtKernelData::getInstance()->removeObject(2, 1);
    m_data->slotDelayedMeasurementsUpdate();
    QVERIFY(m_engine.byValueName().isEmpty());
    QVERIFY(m_engine.byObjectType().isEmpty());
}

void KvStatisticsEngineTest::regroupingIsAnnouncedTwice()
{
    m_data->slotDelayedMeasurementsUpdate();
    m_engine.setKernelData(m_data.get());
    m_data->slotDelayedMeasurementsUpdate();
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length"), QStringLiteral("Width")});
    m_host->addObject(1, {1.0, 2.0});
    QVERIFY(connect(&m_engine, SIGNAL(signalMeasurementsListUpdated()), this, SLOT(slotUpdated())));
    QVERIFY(connect(&m_engine, SIGNAL(signalMeasurementsListUpdating()), this, SLOT(slotUpdating())));
    m_data->slotDelayedMeasurementsUpdate();
    QCOMPARE(announced, QStringList({QStringLiteral("updating 0"), QStringLiteral("updated 2")}));
    announced.clear();
    ZtKernelData::getInstance()->removeObject(1, 1);
    m_data->slotDelayedMeasurementsUpdate();
    QCOMPARE(announced, QStringList({QStringLiteral("updating 2"), QStringLiteral("updated 0")}));
}

// Whatever shortcut finds a record's group has to find the right one.
void KvStatisticsEngineTest::manyNamesInChangingOrder()
{
    QRandomGenerator random(1);
    const QVector<int> counts{3, 12, 16, 17, 40};
    for (int type = 1; type <= counts.size(); ++type) {
        QStringList names;
        QVector<QVariant> values;
        for (int i = 0; i < counts.at(type - 1); ++i) {
            names.append(QStringLiteral("Value %1").arg(i * 7 % 40));
            values.append(i);
        }
        TableManipulator *manipulator = m_host->addType(type, QStringLiteral("Type %1").arg(type % 2), names);
        for (int id = 1; id <= 50; ++id) {
            QStringList shown;
            for (const QString &name : qAsConst(names)) {
                if (random.bounded(3) > 0)
                    shown.append(name);
            }
            manipulator->valueSets.insert(id, shown);
            m_host->addObject(type, values, id);
        }
    }
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);

    QMap<QString, QVector<int>> byName;
    QMap<QString, QMap<QString, QVector<int>>> byType;
    for (const KvMeasuredValue &record : m_data->measuredValues()) {
        byName[record.valueName].append(record.objectId);
        byType[record.objectTypeName][record.valueName].append(record.objectId);
    }
    QCOMPARE(m_engine.valueNames(), byName.keys());
    for (auto it = byName.constBegin(); it != byName.constEnd(); ++it)
        QCOMPARE(idsOf(m_engine.values(it.key())), it.value());
    QCOMPARE(m_engine.objectTypeNames(), byType.keys());
    for (auto type = byType.constBegin(); type != byType.constEnd(); ++type) {
        QCOMPARE(m_engine.valueNames(type.key()), type->keys());
        for (auto it = type->constBegin(); it != type->constEnd(); ++it)
            QCOMPARE(idsOf(m_engine.values(type.key(), it.key())), it.value());
    }
}

void KvStatisticsEngineTest::theSourceIsConnectedOnce()
{
    QSignalSpy spy(&m_engine, SIGNAL(signalMeasurementsListUpdated()));
    m_engine.setKernelData(m_data.get());
    m_engine.setKernelData(m_data.get());
    QCOMPARE(spy.count(), 0);
    m_data->slotDelayedMeasurementsUpdate();
    QCOMPARE(spy.count(), 1);
}

void KvStatisticsEngineTest::aReplacedSourceIsSilent()
{
    KvReportKernelData other;
    QSignalSpy spy(&m_engine, SIGNAL(signalMeasurementsListUpdated()));
    m_engine.setKernelData(m_data.get());
    m_engine.setKernelData(&other);
    QCOMPARE(m_engine.kernelData(), &other);
    m_data->slotDelayedMeasurementsUpdate();
    QCOMPARE(spy.count(), 0);
    other.slotDelayedMeasurementsUpdate();
    QCOMPARE(spy.count(), 1);
    m_engine.setKernelData(nullptr);
    other.slotDelayedMeasurementsUpdate();
    QCOMPARE(spy.count(), 1);
}

void KvStatisticsEngineTest::aSourceMayDie()
{
    m_host->addType(1, QStringLiteral("Line"), {QStringLiteral("Length")});
    m_host->addObject(1, {1.0});
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);
    m_data.reset();
    QVERIFY(m_engine.kernelData() == nullptr);
    QCOMPARE(m_engine.valueNames(), QStringList(QStringLiteral("Length")));
    m_engine.slotMeasurementsListUpdated();
    QVERIFY(m_engine.valueNames().isEmpty());
}

void KvStatisticsEngineTest::numericValues_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::addColumn<double>("number");
    QTest::newRow("double") << QVariant(12.5) << 12.5;
    QTest::newRow("float") << QVariant(12.5f) << 12.5;
    QTest::newRow("int") << QVariant(-3) << -3.0;
    QTest::newRow("uint") << QVariant(4000000000u) << 4e9;
    QTest::newRow("qlonglong") << QVariant(Q_INT64_C(-5000000000)) << -5e9;
    QTest::newRow("qulonglong") << QVariant(Q_UINT64_C(5000000000)) << 5e9;
    QTest::newRow("short") << QVariant::fromValue<short>(-7) << -7.0;
    QTest::newRow("ushort") << QVariant::fromValue<ushort>(7) << 7.0;
    QTest::newRow("a text that is a number") << QVariant(QStringLiteral("12.5")) << 0.0;
    QTest::newRow("text") << QVariant(QStringLiteral("wide")) << 0.0;
    QTest::newRow("bool") << QVariant(true) << 0.0;
    QTest::newRow("bytes") << QVariant(QByteArray("3")) << 0.0;
    QTest::newRow("nothing") << QVariant() << 0.0;
}

void KvStatisticsEngineTest::numericValues()
{
    QFETCH(QVariant, value);
    QFETCH(double, number);
    QCOMPARE(KvStatisticsEngine::numericValue(value), number);
}

void KvStatisticsEngineTest::averages_data()
{
    QTest::addColumn<KvValueGroup>("group");
    QTest::addColumn<double>("average");
    const double largest = std::numeric_limits<double>::max();
    QTest::newRow("none") << KvValueGroup() << 0.0;
    QTest::newRow("one") << recordsOf(QVector<double>{7.25}) << 7.25;
    QTest::newRow("four") << recordsOf(QVector<double>{1, 2, 3, 6}) << 3.0;
    QTest::newRow("negative") << recordsOf(QVector<double>{-4, 2}) << -1.0;
    QTest::newRow("a text counts 0") << recordsOf(QVector<QVariant>{QStringLiteral("12.5"), 4}) << 2.0;
    QTest::newRow("a bool counts 0") << recordsOf(QVector<QVariant>{true, 4.0}) << 2.0;
    // Each term is divided first, else the sum would be infinite.
    QTest::newRow("very large") << recordsOf(QVector<double>{largest, largest}) << largest;
}

void KvStatisticsEngineTest::averages()
{
    QFETCH(KvValueGroup, group);
    QFETCH(double, average);
    QCOMPARE(KvStatisticsEngine::average(group), average);
}

void KvStatisticsEngineTest::sigmas_data()
{
    QTest::addColumn<KvValueGroup>("group");
    QTest::addColumn<double>("mean");
    QTest::addColumn<double>("sigma");
    QTest::newRow("none") << KvValueGroup() << 0.0 << 0.0;
    QTest::newRow("none, about 5") << KvValueGroup() << 5.0 << 0.0;
    QTest::newRow("one") << recordsOf(QVector<double>{7.25}) << 7.25 << 0.0;
    QTest::newRow("all equal") << recordsOf(QVector<double>{3, 3, 3}) << 3.0 << 0.0;
    // The squared deviations add up to 32: with divisor 8 it is 2, with 7 it would be 2.138.
    QTest::newRow("population") << recordsOf(QVector<double>{2, 4, 4, 4, 5, 5, 7, 9}) << 5.0 << 2.0;
    QTest::newRow("about the given mean") << recordsOf(QVector<double>{4, 4}) << 1.0 << 3.0;
    QTest::newRow("a text counts 0") << recordsOf(QVector<QVariant>{QStringLiteral("4"), 4}) << 2.0 << 2.0;
    QTest::newRow("far from 0") << recordsOf(QVector<double>{1e9 + 4, 1e9 + 7, 1e9 + 13, 1e9 + 16})
                                << 1e9 + 10 << std::sqrt(22.5);
}

void KvStatisticsEngineTest::sigmas()
{
    QFETCH(KvValueGroup, group);
    QFETCH(double, mean);
    QFETCH(double, sigma);
    const double actual = KvStatisticsEngine::sigma(mean, group);
    QVERIFY2(isClose(actual, sigma), compared(actual, sigma));
}

void KvStatisticsEngineTest::fiveNumbersOfAnEmptyGroup()
{
    double min = 1.0;
    double q1 = 2.0;
    double median = 3.0;
    double q3 = 4.0;
    double max = 5.0;
    QVERIFY(!KvStatisticsEngine::fiveNumbers(KvValueGroup(), min, q1, median, q3, max));
    QCOMPARE((QVector<double>{min, q1, median, q3, max}), (QVector<double>{1, 2, 3, 4, 5}));
}

void KvStatisticsEngineTest::fiveNumbersByCount_data()
{
    QTest::addColumn<int>("count");
    QTest::addColumn<QVector<double>>("expected");
    // Of the values 1 to n.
    QTest::newRow("1") << 1 << QVector<double>{1, 1, 1, 1, 1};
    QTest::newRow("2") << 2 << QVector<double>{1, 2, 2, 2, 2};
    QTest::newRow("3") << 3 << QVector<double>{1, 2, 2, 3, 3};
    QTest::newRow("4") << 4 << QVector<double>{1, 2, 3, 4, 4}; // the lower quartile is not the median
    QTest::newRow("5") << 5 << QVector<double>{1, 3, 3, 5, 5};
    QTest::newRow("6") << 6 << QVector<double>{1, 3, 4, 6, 6};
    QTest::newRow("7") << 7 << QVector<double>{1, 3, 4, 7, 7};
    QTest::newRow("8") << 8 << QVector<double>{1, 4, 5, 8, 8};
    QTest::newRow("9") << 9 << QVector<double>{1, 4, 5, 8, 9};
    QTest::newRow("100") << 100 << QVector<double>{1, 27, 51, 77, 100};
}

void KvStatisticsEngineTest::fiveNumbersByCount()
{
    QFETCH(int, count);
    QFETCH(QVector<double>, expected);
    QVector<double> values;
    for (int i = 1; i <= count; ++i)
        values.append(i);
    std::reverse(values.begin(), values.begin() + count / 2); // not sorted when they come
    double min = notANumber;
    double q1 = notANumber;
    double median = notANumber;
    double q3 = notANumber;
    double max = notANumber;
    const KvValueGroup group = recordsOf(values);
    QVERIFY(KvStatisticsEngine::fiveNumbers(group, min, q1, median, q3, max));
    QCOMPARE((QVector<double>{min, q1, median, q3, max}), expected);
    QCOMPARE(group.first().value.toDouble(), values.first()); // the group itself stays as it is
}

void KvStatisticsEngineTest::fiveNumbersOfOddValues()
{
    double min = 0.0;
    double q1 = 0.0;
    double median = 0.0;
    double q3 = 0.0;
    double max = 0.0;
    // A text counts 0, so it lies between the others.
    const KvValueGroup texts = recordsOf(QVector<QVariant>{5.0, QStringLiteral("9"), -5.0});
    QVERIFY(KvStatisticsEngine::fiveNumbers(texts, min, q1, median, q3, max));
    QCOMPARE((QVector<double>{min, q1, median, q3, max}), (QVector<double>{-5, 0, 0, 5, 5}));

    // Values that are no numbers come before all others.
    QVector<double> values;
    for (int i = 0; i < 100; ++i)
        values.append(i % 3 == 0 ? notANumber : i);
    QVERIFY(KvStatisticsEngine::fiveNumbers(recordsOf(values), min, q1, median, q3, max));
    QVERIFY(std::isnan(min));
    QCOMPARE(max, 98.0);
    QVERIFY(KvStatisticsEngine::fiveNumbers(recordsOf(QVector<double>{2.0, infinity, -infinity}), min, q1,
                                            median, q3, max));
    QCOMPARE(min, -infinity);
    QCOMPARE(median, 2.0);
    QCOMPARE(max, infinity);
}

void KvStatisticsEngineTest::rangeKeepsTheTypes()
{
    const QPair<QVariant, QVariant> mixed = KvStatisticsEngine::range(recordsOf(QVector<QVariant>{3, 0.5}));
    QCOMPARE(mixed.first.userType(), int(QMetaType::Double));
    QCOMPARE(mixed.first.toDouble(), 0.5);
    QCOMPARE(mixed.second.userType(), int(QMetaType::Int));
    QCOMPARE(mixed.second.toInt(), 3);
    // Of equal ones the first stays.
    const QPair<QVariant, QVariant> equal = KvStatisticsEngine::range(recordsOf(QVector<QVariant>{3, 3.0}));
    QCOMPARE(equal.first.userType(), int(QMetaType::Int));
    QCOMPARE(equal.second.userType(), int(QMetaType::Int));
}

void KvStatisticsEngineTest::ranges_data()
{
    QTest::addColumn<KvValueGroup>("group");
    QTest::addColumn<QVariant>("min");
    QTest::addColumn<QVariant>("max");
    QTest::newRow("one") << recordsOf(QVector<double>{4.5}) << QVariant(4.5) << QVariant(4.5);
    QTest::newRow("ascending") << recordsOf(QVector<double>{1, 2, 3}) << QVariant(1.0) << QVariant(3.0);
    QTest::newRow("descending") << recordsOf(QVector<double>{3, 2, 1}) << QVariant(1.0) << QVariant(3.0);
    QTest::newRow("in between") << recordsOf(QVector<double>{2, -7, 30, 3}) << QVariant(-7.0)
                                << QVariant(30.0);
    QTest::newRow("whole numbers") << recordsOf(QVector<QVariant>{10, 9, 11}) << QVariant(9) << QVariant(11);
}

void KvStatisticsEngineTest::ranges()
{
    QFETCH(KvValueGroup, group);
    QFETCH(QVariant, min);
    QFETCH(QVariant, max);
    const QPair<QVariant, QVariant> range = KvStatisticsEngine::range(group);
    QCOMPARE(range.first, min);
    QCOMPARE(range.second, max);
    QCOMPARE(range.first.userType(), min.userType());
    QCOMPARE(range.second.userType(), max.userType());
}

void KvStatisticsEngineTest::regressions_data()
{
    QTest::addColumn<QVector<QPointF>>("points");
    QTest::addColumn<double>("slope");
    QTest::addColumn<double>("intercept");
    QTest::newRow("none") << QVector<QPointF>() << 0.0 << 0.0;
    QTest::newRow("one") << QVector<QPointF>{{3, 8}} << 0.0 << 0.0;
    QTest::newRow("two") << QVector<QPointF>{{1, 5}, {3, 1}} << -2.0 << 7.0;
    QTest::newRow("on a line") << QVector<QPointF>{{0, 1}, {1, 3}, {2, 5}} << 2.0 << 1.0;
    QTest::newRow("flat") << QVector<QPointF>{{0, 4}, {1, 4}, {2, 4}} << 0.0 << 4.0;
    // Means 2 and 5/3; products add up to 1, squares to 2.
    QTest::newRow("scattered") << QVector<QPointF>{{1, 1}, {2, 2}, {3, 2}} << 0.5 << 2.0 / 3.0;
    // Means 7/3 and 3; products add up to 22 - 21 = 1, squares to 21 - 49/3 = 14/3.
    QTest::newRow("uneven steps") << QVector<QPointF>{{1, 4}, {2, 1}, {4, 4}} << 3.0 / 14.0 << 2.5;
}

void KvStatisticsEngineTest::regressions()
{
    QFETCH(QVector<QPointF>, points);
    QFETCH(double, slope);
    QFETCH(double, intercept);
    const QPair<double, double> line = KvStatisticsEngine::regression(points);
    QVERIFY2(isClose(line.first, slope), compared(line.first, slope));
    QVERIFY2(isClose(line.second, intercept), compared(line.second, intercept));
}

void KvStatisticsEngineTest::regressionOfEqualXIsNotFinite()
{
    QVERIFY(!std::isfinite(KvStatisticsEngine::regression({{2, 1}, {2, 5}}).first));
    QVERIFY(!std::isfinite(KvStatisticsEngine::regression({{2, 1}, {2, 5}}).second));
    QVERIFY(!std::isfinite(KvStatisticsEngine::regression({{2, 1}, {2, 1}}).first));
}

void KvStatisticsEngineTest::niceSteps_data()
{
    QTest::addColumn<double>("low");
    QTest::addColumn<double>("high");
    QTest::addColumn<int>("step");
    QTest::newRow("1") << 1.0 << 10.0 << 1;
    QTest::newRow("1 exactly") << 1.0 << 1.0 << 1;
    QTest::newRow("2") << 1.5 << 3.0 << 2;
    QTest::newRow("5") << 2.5 << 9.0 << 5;
    QTest::newRow("5 exactly") << 5.0 << 5.0 << 5;
    QTest::newRow("10") << 5.5 << 20.0 << 10;
    QTest::newRow("no 20") << 11.0 << 24.0 << 0;
    QTest::newRow("25") << 11.0 << 30.0 << 25;
    QTest::newRow("50") << 26.0 << 60.0 << 50;
    QTest::newRow("100") << 51.0 << 100.0 << 100;
    QTest::newRow("250") << 101.0 << 300.0 << 250;
    QTest::newRow("500") << 251.0 << 900.0 << 500;
    QTest::newRow("1000") << 501.0 << 1200.0 << 1000;
    QTest::newRow("250000") << 100001.0 << 499999.0 << 250000;
    QTest::newRow("none between 2 and 5") << 2.1 << 4.9 << 0;
    QTest::newRow("none between 50 and 100") << 51.0 << 99.0 << 0;
    QTest::newRow("from below 1") << 0.5 << 12.5 << 1;
    QTest::newRow("from far below 1") << 1e-300 << 7.0 << 1;
    QTest::newRow("none below 1") << 0.1 << 0.9 << 0;
    QTest::newRow("from 0") << 0.0 << 5.0 << 0;
    QTest::newRow("from below 0") << -5.0 << 5.0 << 0;
    QTest::newRow("nothing at all") << 0.0 << 0.0 << 0;
    QTest::newRow("no number") << notANumber << 5.0 << 0;
    QTest::newRow("beyond whole numbers") << 3e9 << 9e9 << 0;
}

void KvStatisticsEngineTest::niceSteps()
{
    QFETCH(double, low);
    QFETCH(double, high);
    QFETCH(int, step);
    QElapsedTimer stopwatch;
    stopwatch.start();
    QCOMPARE(KvStatisticsEngine::niceStep(low, high), step);
    QVERIFY(stopwatch.elapsed() < 1000); // no search through two thousand million decades
}

void KvStatisticsEngineTest::flowers_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<double>("mean");
    QTest::addColumn<double>("sampleSigma"); // as the literature prints it, divisor 49
    QTest::addColumn<QVector<double>>("five");
    QTest::newRow("setosa") << QStringLiteral("setosa") << 5.006 << 0.3524896872134513
                            << QVector<double>{4.3, 4.8, 5.0, 5.2, 5.8};
    QTest::newRow("versicolor") << QStringLiteral("versicolor") << 5.936 << 0.5161711470638634
                                << QVector<double>{4.9, 5.6, 5.9, 6.3, 7.0};
    QTest::newRow("virginica") << QStringLiteral("virginica") << 6.588 << 0.6358795932744321
                               << QVector<double>{4.9, 6.3, 6.5, 7.1, 7.9};
}

void KvStatisticsEngineTest::flowers()
{
    QFETCH(QString, type);
    QFETCH(double, mean);
    QFETCH(double, sampleSigma);
    QFETCH(QVector<double>, five);
    const QString length = QStringLiteral("Sepal length");
    const QVector<QPair<QString, QVector<double>>> table{{QStringLiteral("setosa"), setosa},
                                                         {QStringLiteral("versicolor"), versicolor},
                                                         {QStringLiteral("virginica"), virginica}};
    int typeId = 0;
    for (const auto &[name, values] : table) {
        m_host->addType(++typeId, name, {length});
        for (const double value : values)
            m_host->addObject(typeId, {value * 1000.0}); // micrometres
    }
    m_engine.setKernelData(m_data.get());
    m_data->setActive(true);

    QCOMPARE(m_engine.values(length).size(), 150);
    const KvValueGroup &group = m_engine.values(type, length);
    QCOMPARE(group.size(), 50);
    const double average = KvStatisticsEngine::average(group);
    QVERIFY2(isClose(average, mean * 10000.0), compared(average, mean * 10000.0));
    const double sigma = KvStatisticsEngine::sigma(average, group);
    const double expected = sampleSigma * 10000.0 * std::sqrt(49.0 / 50.0);
    QVERIFY2(isClose(sigma, expected), compared(sigma, expected));

    double min = 0.0;
    double q1 = 0.0;
    double median = 0.0;
    double q3 = 0.0;
    double max = 0.0;
    QVERIFY(KvStatisticsEngine::fiveNumbers(group, min, q1, median, q3, max));
    const QVector<double> actual{min, q1, median, q3, max};
    for (int i = 0; i < five.size(); ++i)
        QVERIFY2(isClose(actual.at(i), five.at(i) * 10000.0), compared(actual.at(i), five.at(i) * 10000.0));
}

void KvStatisticsEngineTest::regroupingIsLinear()
{
    const QStringList names{QStringLiteral("Length"), QStringLiteral("Width"), QStringLiteral("Area"),
                            QStringLiteral("Angle")};
    for (int type = 1; type <= 5; ++type)
        m_host->addType(type, QStringLiteral("Type %1").arg(type), names);
    const auto fill = [this](int from, int to) {
        const QStringList texts{QStringLiteral("1"), QStringLiteral("2"), QStringLiteral("3"),
                                QStringLiteral("4")};
        for (int type = 1; type <= 5; ++type) {
            for (int id = from; id <= to; ++id)
                m_host->addObject(type, {1.0, 2.0, 3.0, 4.0}, texts, id);
        }
        m_data->slotDelayedMeasurementsUpdate();
    };
    // Processor time, so that other programs on the machine do not count.
    const auto bestOfFive = [this]() {
        std::clock_t best = std::numeric_limits<std::clock_t>::max();
        for (int i = 0; i < 5; ++i) {
            const std::clock_t start = std::clock();
            m_engine.slotMeasurementsListUpdated();
            best = std::min(best, std::clock() - start);
        }
        return best;
    };
    m_engine.setKernelData(m_data.get());
    fill(1, 500);
    const std::clock_t few = bestOfFive();
    QCOMPARE(m_engine.values(QStringLiteral("Area")).size(), 2500);
    fill(501, 5000);
    const std::clock_t many = bestOfFive();
    QCOMPARE(m_engine.values(QStringLiteral("Area")).size(), 25000);
    QCOMPARE(m_engine.values(QStringLiteral("Type 3"), QStringLiteral("Area")).size(), 5000);
    // Ten times as many: anything quadratic would take a hundred times as long.
    QVERIFY2(many < 60 * few, qPrintable(QStringLiteral("%1 ticks, then %2").arg(few).arg(many)));
}

STATREPORT_TEST_MAIN(KvStatisticsEngineTest)
#include "KvStatisticsEngineTest.moc"
