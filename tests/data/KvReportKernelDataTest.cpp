// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "data/KvReportKernelData.h"
#include "data/MeasuredHost.h"
#include "host/FakeManipulator.h"
#include "image/ZtImage.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtSignalCenter.h"
#include "kernel/iZTKernelImage.h"
#include "support/MetaMethods.h"

#include <QElapsedTimer>
#include <QPixmap>
#include <QThread>

#include <algorithm>
#include <ctime>
#include <limits>
#include <memory>

namespace {

constexpr int lineType = 66651;
constexpr int circleType = 66655;
constexpr int textType = 500; // no measurement

void setDigits(uint digits)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), digits);
    ZtAppSettings::endGroup();
}

/// Type id, object id and value name of each record.
QStringList summaryOf(const QVector<KvMeasuredValue> &records)
{
    QStringList result;
    for (const KvMeasuredValue &record : records)
        result.append(
            QStringLiteral("%1/%2 %3").arg(record.objectType).arg(record.objectId).arg(record.valueName));
    return result;
}

/// Delivers a green picture of 40 x 30 at once.
class FakeImage : public iZTKernelImage
{
public:
    FakeImage()
    {
        QImage picture(40, 30, QImage::Format_RGB32);
        picture.fill(Qt::green);
        frame.image = QSharedPointer<ZtImage>::create(picture);
    }

    void requestImage() override
    {
        ++requests;
        deliver();
    }
    void deliver()
    {
        handled = false;
        emit signalImageCompleted(frame, handled);
    }

    FrameData frame;
    int requests = 0;
    bool handled = false;
};

/// A consumer that takes its time, or that asks for another refresh out of the announcement.
class Consumer : public QObject
{
    Q_OBJECT
public:
    explicit Consumer(KvReportKernelData *source)
        : m_source(source)
    {
        connect(source, SIGNAL(signalMeasuredValuesChanged()), this, SLOT(slotValuesChanged()));
    }

    ulong delayMs = 0;
    int refreshesToAsk = 0;

private slots:
    void slotValuesChanged()
    {
        QThread::msleep(delayMs);
        if (refreshesToAsk-- > 0)
            m_source->slotLengthUnitChanged();
    }

private:
    KvReportKernelData *m_source;
};

QColor colorAt(const QPixmap &pixmap, int x, int y)
{
    return pixmap.toImage().pixelColor(x, y);
}

} // namespace

class KvReportKernelDataTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void startsEmpty();
    void signalsAndSlotsKeepTheirOrder();
    void typesAreKnownByName();

    void recordsHoldWhatTheHostSays();
    void recordsComeInMeasurementOrder();
    void anEmptyHostIsAnnounced();
    void otherTypesContributeNothing();
    void aTypeWithoutHalfItsRegistrationContributesNothing_data();
    void aTypeWithoutHalfItsRegistrationContributesNothing();
    void valuesWithoutTextAreLeftOut();
    void valuesThatAreNotShownAreLeftOut();
    void anUnknownKindIsZeroForEveryValue();
    void recordsCarryTheirValueClass();
    void valueClasses_data();
    void valueClasses();

    void delayFollowsTheHost_data();
    void delayFollowsTheHost();
    void slowConsumersRaiseTheDelay();
    void requestsWaitForThreeDelays();
    void storageIsKept();
    void handedOutRecordsDoNotChange();
    void rebuiltRecordsKeepNothing();

    void hostSignalsRefresh_data();
    void hostSignalsRefresh();
    void otherTypesDoNotRefresh();
    void aBurstIsOneRefresh();
    void endlessRequestsDoNotPutTheRefreshOff();
    void editsArriveInTheRecords();
    void refreshesMayAskForAnother();
    void aPendingRefreshOutlivesTheDeactivation();
    void aPendingRefreshDiesWithTheAdapter();

    void digitsAreReadAtActivation();
    void changedDigitsRefresh();
    void otherSettingsDoNotMatter();
    void profilesMayChangeTheDigits();

    void activationsAreCounted();
    void surplusDeactivationsAreIgnored();
    void dataStaysWhileInactive();
    void onlyTheFirstActivationRebuilds();

    void activationFetchesThePicture();
    void picturesAreRequestedForListenersOnly_data();
    void picturesAreRequestedForListenersOnly();
    void theCameraTimerServesListeners();
    void theCameraTimerIsIdleWithoutListeners();
    void framesAreHandledAndReleased();
    void framesWithoutAPictureChangeNothing_data();
    void framesWithoutAPictureChangeNothing();
    void measurementsAreDrawnWhenWanted();
    void wishesForMeasurementsAreCounted();
    void aReplacedImageIsLetGo();
    void anImageInstalledLateIsFollowed();
    void anImageIsFollowedWithoutListeners();
    void noImageIsFollowedWhileInactive();

    void rebuildIsLinear();

private:
    /// Lines 1 and 2 with two lengths each.
    void addLines();

    std::unique_ptr<MeasuredHost> m_host;
    ZtKernelData *m_kernel = ZtKernelData::getInstance();
};

void KvReportKernelDataTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<MeasuredHost>();
}

void KvReportKernelDataTest::cleanup()
{
    m_host.reset();
    ZtAppSettings::getInstance()->setCurrentProfile(QString());
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvReportKernelDataTest::addLines()
{
    m_host->addType(lineType, QStringLiteral("Line"), {QStringLiteral("Length"), QStringLiteral("Width")});
    m_host->addObject(lineType, {10.0, 1.0});
    m_host->addObject(lineType, {20.0, 2.0});
}

void KvReportKernelDataTest::startsEmpty()
{
    addLines();
    setDigits(4);
    const KvReportKernelData data;
    QVERIFY(data.measuredValues().isEmpty());
    QVERIFY(!data.isActive());
    QCOMPARE(data.signDigits(), 0u); // read with the first activation only
    QCOMPARE(data.refreshDelay(), qint64(10));
    QVERIFY(data.cameraImage().isNull());
    QVERIFY(data.cameraImageWithData().isNull());
    QVERIFY(!data.isCameraImageWithDataWanted());
}

void KvReportKernelDataTest::signalsAndSlotsKeepTheirOrder()
{
    const QMetaObject &meta = KvReportKernelData::staticMetaObject;
    QCOMPARE(ownMethods(meta, QMetaMethod::Signal),
             QStringList({QStringLiteral("signalMeasuredValuesChanged()"),
                          QStringLiteral("signalCameraImageChanged()"),
                          QStringLiteral("signalCameraImageWithDataChanged()")}));
    QCOMPARE(ownMethods(meta, QMetaMethod::Slot),
             QStringList({QStringLiteral("slotDelayedPrepareCameraImage()"),
                          QStringLiteral("slotDelayedMeasurementsUpdate()"),
                          QStringLiteral("slotObjectCreated(int,int,const ZtKernelObjectData*)"),
                          QStringLiteral("slotObjectChanged(int,int,const ZtKernelObjectData*)"),
                          QStringLiteral("slotObjectRemoved(int,int)"),
                          QStringLiteral("slotSettingsModified(QStringList,QVariantList)"),
                          QStringLiteral("slotProfileChanged()"), QStringLiteral("slotLengthUnitChanged()"),
                          QStringLiteral("slotAngleUnitChanged()"),
                          QStringLiteral("slotImageFragmentReady(FrameData,bool&)")}));
}

void KvReportKernelDataTest::typesAreKnownByName()
{
    const KvReportKernelData data;
    QVERIFY(QMetaType::type("FrameData") != QMetaType::UnknownType);
    QVERIFY(QMetaType::type("QVector<KvMeasuredValue>") != QMetaType::UnknownType);
}

void KvReportKernelDataTest::recordsHoldWhatTheHostSays()
{
    TableManipulator *type = m_host->addType(66656, QStringLiteral("Polygon %1"),
                                             {QStringLiteral("Area"), QStringLiteral("Corners")});
    type->kinds = {{QStringLiteral("Area"), 2}, {QStringLiteral("Corners"), 4}};
    m_host->addObject(66656, {12.5, 7}, {QStringLiteral("12.5 µm²"), QStringLiteral("7 pieces")}, 9);
    type->setObjectName(9, QStringLiteral("The biggest"));

    KvReportKernelData data;
    data.setActive(true);
    const QVector<KvMeasuredValue> records = data.measuredValues();
    QCOMPARE(records.size(), 2);
    const KvMeasuredValue &area = records.at(0);
    QCOMPARE(area.objectType, 66656);
    QCOMPARE(area.valueClass, 5);
    QCOMPARE(area.objectId, 9);
    QCOMPARE(area.objectTypeName, QStringLiteral("Polygon 9"));
    QCOMPARE(area.objectName, QStringLiteral("The biggest"));
    QCOMPARE(area.valueName, QStringLiteral("Area"));
    QCOMPARE(area.value, QVariant(12.5));
    QCOMPARE(area.measureKind, 2);
    QCOMPARE(area.valueText, QStringLiteral("12.5 µm²"));
    const KvMeasuredValue &corners = records.at(1);
    QCOMPARE(corners.objectType, 66656);
    QCOMPARE(corners.valueClass, 6);
    QCOMPARE(corners.objectId, 9);
    QCOMPARE(corners.objectTypeName, QStringLiteral("Polygon 9"));
    QCOMPARE(corners.objectName, QStringLiteral("The biggest"));
    QCOMPARE(corners.valueName, QStringLiteral("Corners"));
    QCOMPARE(corners.value.userType(), int(QMetaType::Int)); // the host's type is kept
    QCOMPARE(corners.value.toInt(), 7);
    QCOMPARE(corners.measureKind, 4);
    QCOMPARE(corners.valueText, QStringLiteral("7 pieces"));
}

void KvReportKernelDataTest::recordsComeInMeasurementOrder()
{
    // Value names neither in alphabetical order nor objects in that of their creation.
    m_host->addType(70, QStringLiteral("A"), {QStringLiteral("z"), QStringLiteral("a")});
    m_host->addType(8, QStringLiteral("B"), {QStringLiteral("m")});
    m_host->addObject(70, {1.0, 2.0}, 11);
    m_host->addObject(8, {5.0}, 1);
    m_host->addObject(70, {3.0, 4.0}, 2);
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(summaryOf(data.measuredValues()),
             QStringList({QStringLiteral("8/1 m"), QStringLiteral("70/2 z"), QStringLiteral("70/2 a"),
                          QStringLiteral("70/11 z"), QStringLiteral("70/11 a")}));
}

void KvReportKernelDataTest::anEmptyHostIsAnnounced()
{
    KvReportKernelData data;
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    data.setActive(true);
    QCOMPARE(spy.count(), 1);
    QVERIFY(data.measuredValues().isEmpty());
}

void KvReportKernelDataTest::otherTypesContributeNothing()
{
    addLines();
    TableManipulator *text = m_host->addType(textType, QStringLiteral("Text"), {QStringLiteral("Length")});
    text->flags = ~ZtGsManipulator::MeasurementFlag;
    m_host->addObject(textType, {5.0});
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(data.measuredValues().size(), 4);

    text->flags = 0x200;
    data.slotDelayedMeasurementsUpdate();
    QCOMPARE(data.measuredValues().size(), 5);
}

void KvReportKernelDataTest::aTypeWithoutHalfItsRegistrationContributesNothing_data()
{
    QTest::addColumn<bool>("manipulator");
    QTest::addColumn<bool>("descriptor");
    QTest::addColumn<int>("records");
    QTest::newRow("both") << true << true << 3;
    QTest::newRow("no descriptor") << true << false << 2;
    QTest::newRow("no manipulator") << false << true << 2;
    QTest::newRow("neither") << false << false << 2;
}

void KvReportKernelDataTest::aTypeWithoutHalfItsRegistrationContributesNothing()
{
    QFETCH(bool, manipulator);
    QFETCH(bool, descriptor);
    QFETCH(int, records);
    m_host->addType(1, QStringLiteral("First"), {QStringLiteral("Length")});
    m_host->addType(2, QStringLiteral("Second"), {QStringLiteral("Length")});
    m_host->addType(3, QStringLiteral("Third"), {QStringLiteral("Length")});
    m_kernel->registerType(
        2,
        manipulator ? std::make_unique<TableManipulator>(2, QStringLiteral("Second"),
                                                         QStringList(QStringLiteral("Length")))
                    : nullptr,
        descriptor ? std::make_unique<ZtKernelObjectDataDescr>(2, QStringLiteral("Second")) : nullptr);
    for (const int type : {1, 2, 3})
        m_host->addObject(type, {1.0});
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(data.measuredValues().size(), records);
}

void KvReportKernelDataTest::valuesWithoutTextAreLeftOut()
{
    m_host->addType(5, QStringLiteral("Arc"),
                    {QStringLiteral("Radius"), QStringLiteral("Angle"), QStringLiteral("Chord")});
    m_host->addObject(5, {1.0, 2.0, 3.0}, {QStringLiteral("1 µm"), QString(), QStringLiteral("3 µm")}, 1);
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(summaryOf(data.measuredValues()),
             QStringList({QStringLiteral("5/1 Radius"), QStringLiteral("5/1 Chord")}));
}

void KvReportKernelDataTest::valuesThatAreNotShownAreLeftOut()
{
    TableManipulator *type =
        m_host->addType(5, QStringLiteral("Arc"),
                        {QStringLiteral("Radius"), QStringLiteral("Angle"), QStringLiteral("Chord")});
    type->hiddenNames = QStringList(QStringLiteral("Angle"));
    type->valueSets.insert(2, {QStringLiteral("Angle"), QStringLiteral("Chord")});
    m_host->addObject(5, {1.0, 2.0, 3.0}, 1);
    m_host->addObject(5, {1.0, 2.0, 3.0}, 2);
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(summaryOf(data.measuredValues()),
             QStringList(
                 {QStringLiteral("5/1 Radius"), QStringLiteral("5/1 Chord"), QStringLiteral("5/2 Chord")}));
}

void KvReportKernelDataTest::anUnknownKindIsZeroForEveryValue()
{
    TableManipulator *type =
        m_host->addType(5, QStringLiteral("Arc"), {QStringLiteral("Angle"), QStringLiteral("Mark")});
    type->kinds = {{QStringLiteral("Angle"), 3}, {QStringLiteral("Mark"), 0}};
    m_host->addObject(5, {1.0, 2.0});
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(data.measuredValues().at(0).measureKind, 3);
    QCOMPARE(data.measuredValues().at(1).measureKind, 0); // not that of the value before
}

void KvReportKernelDataTest::recordsCarryTheirValueClass()
{
    m_host->addType(circleType, QStringLiteral("Circle"),
                    {QStringLiteral("Radius"), QStringLiteral("Circumference"), QStringLiteral("Area")});
    m_host->addType(77, QStringLiteral("Other"), {QStringLiteral("Radius")});
    m_host->addObject(circleType, {1.0, 2.0, 3.0});
    m_host->addObject(77, {1.0});
    KvReportKernelData data;
    data.setActive(true);
    QVector<int> classes;
    for (const KvMeasuredValue &record : data.measuredValues())
        classes.append(record.valueClass);
    QCOMPARE(classes, QVector<int>({0, 8, 7, 0})); // type 77 comes first
}

void KvReportKernelDataTest::valueClasses_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QStringList>("names");
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("valueClass");

    const QStringList three{QStringLiteral("first"), QStringLiteral("second"), QStringLiteral("third")};
    const QVector<QPair<int, QVector<int>>> table{
        {66651, {3, 4}}, {66653, {7}}, {66655, {8, 7}}, {66656, {5, 6}},
        {66658, {7}},    {66659, {7}}, {66741, {1, 2}}, {66755, {7}},
    };
    for (const auto &[type, classes] : table) {
        for (int i = 0; i < three.size(); ++i)
            QTest::addRow("%d, value %d", type, i + 1) << type << three << three.at(i) << classes.value(i, 0);
    }
    QTest::newRow("unknown name") << 66651 << three << QStringLiteral("fourth") << 0;
    QTest::newRow("name in another case") << 66651 << three << QStringLiteral("First") << 0;
    QTest::newRow("no names") << 66651 << QStringList() << QStringLiteral("first") << 0;
    QTest::newRow("a type between two of the table") << 66654 << three << three.at(0) << 0;
    QTest::newRow("a type before the table") << 66650 << three << three.at(0) << 0;
    QTest::newRow("a type behind the table") << 66756 << three << three.at(0) << 0;
    QTest::newRow("a name twice has its first place")
        << 66655 << QStringList({three.at(0), three.at(0)}) << three.at(0) << 8;
}

void KvReportKernelDataTest::valueClasses()
{
    QFETCH(int, type);
    QFETCH(QStringList, names);
    QFETCH(QString, name);
    QFETCH(int, valueClass);
    QCOMPARE(KvReportKernelData::valueClass(type, names, name), valueClass);
}

void KvReportKernelDataTest::delayFollowsTheHost_data()
{
    QTest::addColumn<int>("delay");
    QTest::addColumn<int>("elapsed");
    QTest::addColumn<int>("adapted");
    QTest::newRow("nothing to do") << 10 << 0 << 10;
    QTest::newRow("as long as the delay") << 10 << 10 << 10;
    QTest::newRow("a little longer") << 10 << 11 << 11;
    QTest::newRow("very long") << 10 << 800 << 500;
    QTest::newRow("as long as the limit") << 499 << 500 << 500;
    QTest::newRow("longer than the limit") << 500 << 501 << 500;
    QTest::newRow("short again") << 500 << 3 << 10; // 6 is below the least delay
    QTest::newRow("a little shorter") << 500 << 300 << 500;
    QTest::newRow("just half") << 500 << 250 << 500;
    QTest::newRow("less than half") << 500 << 249 << 498;
    QTest::newRow("to the least") << 12 << 5 << 10;
}

void KvReportKernelDataTest::delayFollowsTheHost()
{
    QFETCH(int, delay);
    QFETCH(int, elapsed);
    QFETCH(int, adapted);
    QCOMPARE(KvReportKernelData::adaptedDelay(delay, elapsed), qint64(adapted));
}

void KvReportKernelDataTest::slowConsumersRaiseTheDelay()
{
    KvReportKernelData data;
    Consumer consumer(&data);
    consumer.delayMs = 60;
    data.setActive(true);
    const qint64 raised = data.refreshDelay();
    QVERIFY2(raised >= 60 && raised <= 500, qPrintable(QString::number(raised)));

    consumer.delayMs = 600;
    data.slotDelayedMeasurementsUpdate();
    QCOMPARE(data.refreshDelay(), qint64(500));

    consumer.delayMs = 0;
    data.slotDelayedMeasurementsUpdate();
    QVERIFY2(data.refreshDelay() < 500, qPrintable(QString::number(data.refreshDelay())));
}

void KvReportKernelDataTest::requestsWaitForThreeDelays()
{
    KvReportKernelData data;
    Consumer consumer(&data);
    consumer.delayMs = 50;
    data.setActive(true);
    const qint64 wait = 3 * data.refreshDelay();
    QVERIFY(wait >= 150);

    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    QElapsedTimer stopwatch;
    stopwatch.start();
    data.slotLengthUnitChanged();
    QVERIFY(spy.wait(5000));
    // Qt's coarse timers may be early by a twentieth; the consumer's time is not part of the wait.
    QVERIFY2(stopwatch.elapsed() - 50 >= wait * 9 / 10, qPrintable(QString::number(stopwatch.elapsed())));
}

void KvReportKernelDataTest::storageIsKept()
{
    addLines();
    for (int id = 3; id <= 200; ++id)
        m_host->addObject(lineType, {1.0, 2.0}, id);
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(data.measuredValues().size(), 400);
    const int capacity = data.measuredValues().capacity();
    const KvMeasuredValue *storage = data.measuredValues().constData();
    for (int i = 0; i < 2; ++i) {
        data.slotDelayedMeasurementsUpdate();
        QCOMPARE(data.measuredValues().capacity(), capacity);
        QCOMPARE(data.measuredValues().constData(), storage);
    }
    for (int id = 2; id <= 200; ++id)
        m_kernel->removeObject(lineType, id);
    data.slotDelayedMeasurementsUpdate();
    QCOMPARE(data.measuredValues().size(), 2);
    QCOMPARE(data.measuredValues().capacity(), capacity);
    QCOMPARE(data.measuredValues().constData(), storage);
}

void KvReportKernelDataTest::handedOutRecordsDoNotChange()
{
    addLines();
    for (int id = 3; id <= 2000; ++id)
        m_host->addObject(lineType, {1.0, 2.0}, id);
    KvReportKernelData data;
    data.setActive(true);
    const QVector<KvMeasuredValue> before = data.measuredValues();
    const int capacity = before.capacity();
    m_kernel->removeObject(lineType, 1);
    for (int id = 3; id <= 2000; ++id)
        m_kernel->removeObject(lineType, id);
    data.slotDelayedMeasurementsUpdate();
    QCOMPARE(before.size(), 4000);
    QCOMPARE(before.at(0).objectId, 1);
    QCOMPARE(before.at(0).value, QVariant(10.0));
    QCOMPARE(data.measuredValues().size(), 2);
    QCOMPARE(data.measuredValues().at(0).objectId, 2);
    QCOMPARE(data.measuredValues().capacity(), capacity); // room as before, though not the same
    QVERIFY(data.measuredValues().constData() != before.constData());
}

// Records are written anew with every rebuild: nothing of what stood in their place before may be left in
// them.
void KvReportKernelDataTest::rebuiltRecordsKeepNothing()
{
    TableManipulator *arc =
        m_host->addType(66655, QStringLiteral("Arc"), {QStringLiteral("Angle"), QStringLiteral("Mark")});
    arc->kinds = {{QStringLiteral("Angle"), 3}, {QStringLiteral("Mark"), 0}};
    m_host->addType(70000, QStringLiteral("Dot"), {QStringLiteral("Height"), QStringLiteral("Number")})
        ->defaultKind = 0;
    m_host->addObject(66655, {45.0, QStringLiteral("x")}, 3);
    m_host->addObject(70000, {1.5, 7}, {QString(), QStringLiteral("seven")}, 9);
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(summaryOf(data.measuredValues()),
             QStringList({QStringLiteral("66655/3 Angle"), QStringLiteral("66655/3 Mark"),
                          QStringLiteral("70000/9 Number")}));
    QCOMPARE(data.measuredValues().at(2).objectName, QStringLiteral("Dot 9"));
    QCOMPARE(data.measuredValues().at(2).objectTypeName, QStringLiteral("Dot"));

    // The number moves up to the angle's place.
    m_kernel->removeObject(66655, 3);
    data.slotDelayedMeasurementsUpdate();
    QCOMPARE(data.measuredValues().size(), 1);
    const KvMeasuredValue number = data.measuredValues().first();
    QCOMPARE(number.objectType, 70000);
    QCOMPARE(number.valueClass, 0);
    QCOMPARE(number.objectId, 9);
    QCOMPARE(number.objectTypeName, QStringLiteral("Dot"));
    QCOMPARE(number.objectName, QStringLiteral("Dot 9"));
    QCOMPARE(number.valueName, QStringLiteral("Number"));
    QCOMPARE(number.value, QVariant(7));
    QCOMPARE(number.measureKind, 0);
    QCOMPARE(number.valueText, QStringLiteral("seven"));
}

void KvReportKernelDataTest::hostSignalsRefresh_data()
{
    QTest::addColumn<int>("signal");
    QTest::newRow("created") << 0;
    QTest::newRow("changed") << 1;
    QTest::newRow("removed") << 2;
    QTest::newRow("length unit") << 3;
    QTest::newRow("angle unit") << 4;
}

void KvReportKernelDataTest::hostSignalsRefresh()
{
    QFETCH(int, signal);
    addLines();
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    ZtSignalCenter *center = ZtSignalCenter::getInstance();
    switch (signal) {
    case 0:
        emit center->signalObjectCreated(lineType, 1, nullptr);
        break;
    case 1:
        emit center->signalObjectChanged(lineType, 1, nullptr);
        break;
    case 2:
        emit center->signalObjectRemoved(lineType, 1);
        break;
    case 3:
        emit center->signalLengthUnitChanged();
        break;
    case 4:
        emit center->signalAngleUnitChanged();
        break;
    }
    QCOMPARE(spy.count(), 0); // not at once
    QVERIFY(spy.wait(5000));
    QCOMPARE(spy.count(), 1);
}

void KvReportKernelDataTest::otherTypesDoNotRefresh()
{
    m_host->addType(textType, QStringLiteral("Text"), {QStringLiteral("Length")})->flags = 0x1FF;
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    m_host->addObject(textType, {5.0}, 1);
    m_kernel->notifyObjectChanged(textType, 1);
    m_kernel->removeObject(textType, 1);
    emit ZtSignalCenter::getInstance()->signalObjectChanged(9999, 1, nullptr); // a type nobody knows
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
}

void KvReportKernelDataTest::aBurstIsOneRefresh()
{
    addLines();
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    for (int i = 0; i < 10; ++i)
        m_kernel->notifyObjectChanged(lineType, 1);
    QVERIFY(spy.wait(5000));
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
    QCOMPARE(spy.count(), 1);

    // The next burst is another one.
    m_kernel->notifyObjectChanged(lineType, 1);
    QVERIFY(spy.wait(5000));
    QCOMPARE(spy.count(), 2);
}

// While the user drags an object the host reports changes without a pause.
void KvReportKernelDataTest::endlessRequestsDoNotPutTheRefreshOff()
{
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    QElapsedTimer stopwatch;
    stopwatch.start();
    while (spy.isEmpty() && stopwatch.elapsed() < 2000) {
        data.slotLengthUnitChanged();
        QTest::qWait(2);
    }
    QCOMPARE(spy.count(), 1);
}

void KvReportKernelDataTest::editsArriveInTheRecords()
{
    addLines();
    KvReportKernelData data;
    data.setActive(true);
    m_host->addObject(lineType, {30.0, 3.0});
    QTRY_COMPARE_WITH_TIMEOUT(data.measuredValues().size(), 6, 5000);
    m_kernel->removeObject(lineType, 2);
    QTRY_COMPARE_WITH_TIMEOUT(data.measuredValues().size(), 4, 5000);
    static_cast<TableObject *>(m_kernel->object(lineType, 3))->values[0] = 31.0;
    QCOMPARE(data.measuredValues().at(2).value, QVariant(30.0));
    m_kernel->notifyObjectChanged(lineType, 3);
    QTRY_COMPARE_WITH_TIMEOUT(data.measuredValues().at(2).value, QVariant(31.0), 5000);
}

void KvReportKernelDataTest::refreshesMayAskForAnother()
{
    KvReportKernelData data;
    data.setActive(true);
    Consumer consumer(&data);
    consumer.refreshesToAsk = 2;
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    data.slotAngleUnitChanged();
    QTRY_COMPARE_WITH_TIMEOUT(spy.count(), 3, 5000);
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
}

void KvReportKernelDataTest::aPendingRefreshOutlivesTheDeactivation()
{
    addLines();
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    m_kernel->notifyObjectChanged(lineType, 1);
    data.setActive(false);
    QVERIFY(spy.wait(5000));
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
    QCOMPARE(spy.count(), 1);
}

void KvReportKernelDataTest::aPendingRefreshDiesWithTheAdapter()
{
    addLines();
    int announced = 0;
    {
        KvReportKernelData data;
        data.setActive(true);
        connect(&data, &KvReportKernelData::signalMeasuredValuesChanged, this,
                [&announced]() { ++announced; });
        m_kernel->notifyObjectChanged(lineType, 1);
    }
    m_kernel->notifyObjectChanged(lineType, 1);
    QTest::qWait(100);
    QCOMPARE(announced, 0);
}

void KvReportKernelDataTest::digitsAreReadAtActivation()
{
    setDigits(4);
    KvReportKernelData data;
    data.setActive(true);
    QCOMPARE(data.signDigits(), 4u);
}

void KvReportKernelDataTest::changedDigitsRefresh()
{
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    setDigits(3);
    QCOMPARE(data.signDigits(), 3u);
    QVERIFY(spy.wait(5000));
    // A key of that name elsewhere: what was read is what is known already.
    ZtAppSettings::beginGroup(QStringLiteral("Elsewhere"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), 7);
    ZtAppSettings::endGroup();
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
    QCOMPARE(data.signDigits(), 3u);
}

void KvReportKernelDataTest::otherSettingsDoNotMatter()
{
    KvReportKernelData data;
    setDigits(5);
    data.slotSettingsModified({QStringLiteral("measurementlabelssigndigits"), QStringLiteral("Other")}, {});
    QCOMPARE(data.signDigits(), 0u);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
    // The value comes from the settings, not from the announcement.
    data.slotSettingsModified({QStringLiteral("Other"), QStringLiteral("MeasurementLabelsSignDigits")},
                              {1, 9});
    QCOMPARE(data.signDigits(), 5u);
    QVERIFY(spy.wait(5000));
}

void KvReportKernelDataTest::profilesMayChangeTheDigits()
{
    setDigits(2);
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    ZtAppSettings::getInstance()->setCurrentProfile(QStringLiteral("Night"));
    QCOMPARE(data.signDigits(), 0u);
    QVERIFY(spy.wait(5000));
    // Another profile with the same digits changes nothing.
    ZtAppSettings::getInstance()->setCurrentProfile(QStringLiteral("Noon"));
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
}

void KvReportKernelDataTest::activationsAreCounted()
{
    addLines();
    KvReportKernelData data;
    data.setActive(true);
    data.setActive(true);
    data.setActive(false);
    QVERIFY(data.isActive());
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    m_kernel->notifyObjectChanged(lineType, 1);
    QVERIFY(spy.wait(5000));
    QCOMPARE(spy.count(), 1);

    data.setActive(false);
    QVERIFY(!data.isActive());
    m_kernel->notifyObjectChanged(lineType, 1);
    emit ZtSignalCenter::getInstance()->signalLengthUnitChanged();
    setDigits(3);
    ZtAppSettings::getInstance()->setCurrentProfile(QStringLiteral("Night"));
    QVERIFY(!spy.wait(static_cast<int>(10 * data.refreshDelay())));
    QCOMPARE(data.signDigits(), 0u);
}

void KvReportKernelDataTest::surplusDeactivationsAreIgnored()
{
    addLines();
    KvReportKernelData data;
    data.setActive(false);
    data.setActive(true);
    QVERIFY(data.isActive());
    QCOMPARE(data.measuredValues().size(), 4);
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    m_kernel->notifyObjectChanged(lineType, 1);
    QVERIFY(spy.wait(5000));
    // One connection each, so that one change stays one refresh.
    QCOMPARE(spy.count(), 1);
}

void KvReportKernelDataTest::dataStaysWhileInactive()
{
    addLines();
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setCameraImageWithDataWanted(true);
    data.setActive(true);
    data.setActive(false);
    m_kernel->removeObject(lineType, 1);
    QCOMPARE(data.measuredValues().size(), 4);
    QCOMPARE(data.cameraImage().size(), QSize(40, 30));
    QCOMPARE(data.cameraImageWithData().size(), QSize(40, 30));
    // The next activation brings them up to date.
    data.setActive(true);
    QCOMPARE(data.measuredValues().size(), 2);
}

void KvReportKernelDataTest::onlyTheFirstActivationRebuilds()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    QSignalSpy spy(&data, SIGNAL(signalMeasuredValuesChanged()));
    data.setActive(true);
    data.setActive(true);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(image.requests, 1);
}

void KvReportKernelDataTest::activationFetchesThePicture()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setActive(true); // with nobody listening: a print takes the picture before the next frame
    QCOMPARE(image.requests, 1);
    QVERIFY(image.handled);
    QCOMPARE(data.cameraImage().size(), QSize(40, 30));
    QCOMPARE(colorAt(data.cameraImage(), 20, 20), QColor(Qt::green));
    QVERIFY(data.cameraImageWithData().isNull());
}

void KvReportKernelDataTest::picturesAreRequestedForListenersOnly_data()
{
    QTest::addColumn<QByteArray>("signal");
    QTest::addColumn<int>("requests");
    QTest::newRow("nobody") << QByteArray() << 0;
    QTest::newRow("records") << QByteArray(SIGNAL(signalMeasuredValuesChanged())) << 0;
    QTest::newRow("picture") << QByteArray(SIGNAL(signalCameraImageChanged())) << 1;
    QTest::newRow("picture with measurements") << QByteArray(SIGNAL(signalCameraImageWithDataChanged())) << 1;
}

void KvReportKernelDataTest::picturesAreRequestedForListenersOnly()
{
    QFETCH(QByteArray, signal);
    QFETCH(int, requests);
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    std::unique_ptr<QSignalSpy> listener;
    if (!signal.isEmpty())
        listener = std::make_unique<QSignalSpy>(&data, signal.constData());
    data.slotDelayedPrepareCameraImage();
    QCOMPARE(image.requests, requests);
    listener.reset();
    data.slotDelayedPrepareCameraImage();
    QCOMPARE(image.requests, requests); // nobody any more
    m_kernel->setKernelImage(nullptr);
    QSignalSpy again(&data, SIGNAL(signalCameraImageChanged()));
    data.slotDelayedPrepareCameraImage(); // no picture to ask for
    QCOMPARE(again.count(), 0);
}

void KvReportKernelDataTest::theCameraTimerServesListeners()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    QSignalSpy frames(&data, SIGNAL(signalCameraImageChanged()));
    data.setActive(true);
    QCOMPARE(frames.count(), 1);
    QElapsedTimer stopwatch;
    stopwatch.start();
    QVERIFY(frames.wait(5000));
    QVERIFY(frames.wait(5000)); // it repeats
    // Two intervals of 250 ms; coarse timers may be early.
    QVERIFY2(stopwatch.elapsed() >= 400, qPrintable(QString::number(stopwatch.elapsed())));
    QCOMPARE(image.requests, 3);

    data.setActive(false);
    QVERIFY(!frames.wait(600));
    QCOMPARE(image.requests, 3);
    data.setActive(true);
    QCOMPARE(image.requests, 4);
    QVERIFY(frames.wait(5000)); // and runs again, once each time
    QCOMPARE(image.requests, 5);
}

void KvReportKernelDataTest::theCameraTimerIsIdleWithoutListeners()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setActive(true);
    QTest::qWait(600); // two intervals and more
    QCOMPARE(image.requests, 1);
}

void KvReportKernelDataTest::framesAreHandledAndReleased()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setActive(true);
    QSignalSpy plain(&data, SIGNAL(signalCameraImageChanged()));
    QSignalSpy withData(&data, SIGNAL(signalCameraImageWithDataChanged()));
    QImage red(8, 6, QImage::Format_RGB32);
    red.fill(Qt::red);
    image.frame.image = QSharedPointer<ZtImage>::create(red);
    const QWeakPointer<ZtImage> watched = image.frame.image;
    image.deliver();
    QVERIFY(image.handled);
    QCOMPARE(plain.count(), 1);
    QCOMPARE(withData.count(), 0);
    QCOMPARE(data.cameraImage().size(), QSize(8, 6));
    QCOMPARE(colorAt(data.cameraImage(), 0, 0), QColor(Qt::red));
    image.frame.image.reset();
    QVERIFY(watched.isNull());
}

void KvReportKernelDataTest::framesWithoutAPictureChangeNothing_data()
{
    QTest::addColumn<bool>("emptyPicture");
    QTest::newRow("none") << false;
    QTest::newRow("empty") << true;
}

void KvReportKernelDataTest::framesWithoutAPictureChangeNothing()
{
    QFETCH(bool, emptyPicture);
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setCameraImageWithDataWanted(true);
    data.setActive(true);
    QSignalSpy plain(&data, SIGNAL(signalCameraImageChanged()));
    QSignalSpy withData(&data, SIGNAL(signalCameraImageWithDataChanged()));
    image.frame.image = emptyPicture ? QSharedPointer<ZtImage>::create() : QSharedPointer<ZtImage>();
    image.deliver();
    QVERIFY(image.handled);
    QCOMPARE(plain.count(), 0);
    QCOMPARE(withData.count(), 0);
    QCOMPARE(data.cameraImage().size(), QSize(40, 30));
    QCOMPARE(data.cameraImageWithData().size(), QSize(40, 30));
}

void KvReportKernelDataTest::measurementsAreDrawnWhenWanted()
{
    constexpr int squareType = 3;
    m_host->addType(squareType, QString(), QStringList());
    m_kernel->registerType(squareType, std::make_unique<FakeManipulator>(squareType, Qt::red), nullptr);
    m_kernel->addObject(squareType, std::make_unique<ZtKernelObjectData>(), 4);

    FakeImage image;
    image.frame.scale = 2.0;
    image.frame.rect = QRect(3, 5, 40, 30);
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setCameraImageWithDataWanted(true);
    QVERIFY(data.isCameraImageWithDataWanted());
    QStringList announced;
    connect(&data, &KvReportKernelData::signalCameraImageChanged, this,
            [&]() { announced.append(QStringLiteral("plain")); });
    connect(&data, &KvReportKernelData::signalCameraImageWithDataChanged, this,
            [&]() { announced.append(QStringLiteral("with data")); });
    data.setActive(true);
    QCOMPARE(announced, QStringList({QStringLiteral("plain"), QStringLiteral("with data")}));

    // The square from (4, 4) to (8, 8): doubled, then moved by (-3, -5), from (5, 3) to (13, 11).
    const QPixmap drawn = data.cameraImageWithData();
    QCOMPARE(drawn.size(), QSize(40, 30));
    QCOMPARE(colorAt(drawn, 5, 3), QColor(Qt::red));
    QCOMPARE(colorAt(drawn, 12, 10), QColor(Qt::red));
    QCOMPARE(colorAt(drawn, 4, 3), QColor(Qt::green));
    QCOMPARE(colorAt(drawn, 5, 2), QColor(Qt::green));
    QCOMPARE(colorAt(drawn, 13, 10), QColor(Qt::green));
    QCOMPARE(colorAt(drawn, 12, 11), QColor(Qt::green));
    QCOMPARE(colorAt(data.cameraImage(), 5, 3), QColor(Qt::green));

    data.setCameraImageWithDataWanted(false);
    image.deliver();
    QCOMPARE(announced.size(), 3);
    QCOMPARE(announced.last(), QStringLiteral("plain"));
}

void KvReportKernelDataTest::aReplacedImageIsLetGo()
{
    FakeImage first;
    FakeImage second;
    m_kernel->setKernelImage(&first);
    KvReportKernelData data;
    data.setActive(true);
    m_kernel->setKernelImage(&second);
    data.setActive(false);
    first.deliver();
    QVERIFY(!first.handled);

    data.setActive(true);
    QVERIFY(second.handled);
    m_kernel->setKernelImage(nullptr);
    data.setActive(false);
    second.deliver();
    QVERIFY(!second.handled);

    // An image may also die while it is in use.
    auto dying = std::make_unique<FakeImage>();
    m_kernel->setKernelImage(dying.get());
    data.setActive(true);
    m_kernel->setKernelImage(nullptr);
    dying.reset();
    data.setActive(false);
    QVERIFY(!data.isActive());
}

void KvReportKernelDataTest::wishesForMeasurementsAreCounted()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    data.setCameraImageWithDataWanted(false); // one too many
    data.setCameraImageWithDataWanted(true);
    QVERIFY(data.isCameraImageWithDataWanted());
    data.setCameraImageWithDataWanted(true);
    data.setCameraImageWithDataWanted(false);
    QVERIFY(data.isCameraImageWithDataWanted());
    data.setActive(true);
    QVERIFY(!data.cameraImageWithData().isNull());
    data.setCameraImageWithDataWanted(false);
    QVERIFY(!data.isCameraImageWithDataWanted());
    QSignalSpy withData(&data, SIGNAL(signalCameraImageWithDataChanged()));
    image.deliver();
    QCOMPARE(withData.count(), 0);
}

void KvReportKernelDataTest::anImageInstalledLateIsFollowed()
{
    FakeImage first;
    FakeImage second;
    KvReportKernelData data;
    QSignalSpy frames(&data, SIGNAL(signalCameraImageChanged()));
    data.setActive(true);
    QCOMPARE(frames.count(), 0);
    m_kernel->setKernelImage(&first);
    data.slotDelayedPrepareCameraImage();
    QCOMPARE(frames.count(), 1);
    data.slotDelayedPrepareCameraImage(); // connected once
    QCOMPARE(frames.count(), 2);

    m_kernel->setKernelImage(&second);
    QVERIFY(frames.wait(5000)); // the timer finds it
    QVERIFY(second.handled);
    first.deliver();
    QVERIFY(!first.handled);
    m_kernel->setKernelImage(nullptr);
    data.slotDelayedPrepareCameraImage();
    second.deliver();
    QVERIFY(!second.handled);
}

void KvReportKernelDataTest::anImageIsFollowedWithoutListeners()
{
    FakeImage image;
    KvReportKernelData data;
    data.setActive(true);
    m_kernel->setKernelImage(&image);
    data.slotDelayedPrepareCameraImage();
    QCOMPARE(image.requests, 0);
    image.deliver(); // a frame of its own accord
    QVERIFY(image.handled);
    QVERIFY(!data.cameraImage().isNull());
}

void KvReportKernelDataTest::noImageIsFollowedWhileInactive()
{
    FakeImage image;
    m_kernel->setKernelImage(&image);
    KvReportKernelData data;
    const QSignalSpy frames(&data, SIGNAL(signalCameraImageChanged()));
    data.slotDelayedPrepareCameraImage();
    QCOMPARE(image.requests, 1);
    QVERIFY(!image.handled);
    data.setActive(true);
    data.setActive(false);
    data.slotDelayedPrepareCameraImage();
    QVERIFY(!image.handled);
    QCOMPARE(frames.count(), 1); // that of the activation
}

void KvReportKernelDataTest::rebuildIsLinear()
{
    const QStringList names{QStringLiteral("Length"), QStringLiteral("Width"), QStringLiteral("Area"),
                            QStringLiteral("Angle")};
    for (int type = 1; type <= 5; ++type)
        m_host->addType(type, QStringLiteral("Type %1").arg(type), names);
    KvReportKernelData data;
    const auto fill = [this](int from, int to) {
        const QStringList texts{QStringLiteral("1"), QStringLiteral("2"), QStringLiteral("3"),
                                QStringLiteral("4")};
        for (int type = 1; type <= 5; ++type) {
            for (int id = from; id <= to; ++id)
                m_host->addObject(type, {1.0, 2.0, 3.0, 4.0}, texts, id);
        }
    };
    // Processor time, so that other programs on the machine do not count.
    const auto bestOfFive = [&data]() {
        std::clock_t best = std::numeric_limits<std::clock_t>::max();
        for (int i = 0; i < 5; ++i) {
            const std::clock_t start = std::clock();
            data.slotDelayedMeasurementsUpdate();
            best = std::min(best, std::clock() - start);
        }
        return best;
    };
    fill(1, 500);
    const std::clock_t few = bestOfFive();
    QCOMPARE(data.measuredValues().size(), 10000);
    fill(501, 5000);
    const std::clock_t many = bestOfFive();
    QCOMPARE(data.measuredValues().size(), 100000);
    // Ten times as many: anything quadratic would take a hundred times as long.
    QVERIFY2(many < 60 * few, qPrintable(QStringLiteral("%1 ticks, then %2").arg(few).arg(many)));
}

STATREPORT_TEST_MAIN(KvReportKernelDataTest)
#include "KvReportKernelDataTest.moc"
