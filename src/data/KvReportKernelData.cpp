// SPDX-License-Identifier: MIT
#include "data/KvReportKernelData.h"

#include "image/ZtImage.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtImageTools.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "kernel/iZTKernelImage.h"

#include <QElapsedTimer>
#include <QMap>
#include <QMetaMethod>
#include <QTimer>
#include <QTransform>

namespace {

constexpr int kCameraIntervalMs = 250;
constexpr qint64 kMinDelayMs = 10;
constexpr qint64 kMaxDelayMs = 500;
constexpr int kRoomStep = 1024; // records that the list grows by at least
const char kDigitsKey[] = "MeasurementLabelsSignDigits";

using ValueClassTable = QMap<int, QVector<int>>;

// Value classes of each object type, by the position of the value name in the manipulator's list.
const ValueClassTable &valueClassTable()
{
    static const ValueClassTable table{{66651, {3, 4}}, {66653, {7}}, {66655, {8, 7}}, {66656, {5, 6}},
                                       {66658, {7}},    {66659, {7}}, {66741, {1, 2}}, {66755, {7}}};
    return table;
}

// Names seldom change from one rebuild to the next. Where the very same text is there already, counting its
// users up and down again would take longer than the comparison.
void assignText(QString &target, const QString &text)
{
    const QString &current = target;
    if (current.constData() != text.constData() || current.size() != text.size())
        target = text;
}

// A timer may be replaced inside its own timeout, so it must outlive the call that releases it.
QSharedPointer<QTimer> makeTimer()
{
    return QSharedPointer<QTimer>(new QTimer, [](QTimer *timer) { timer->deleteLater(); });
}

} // namespace

KvReportKernelData::KvReportKernelData(QObject *parent)
    : QObject(parent)
    , m_kernelData(ZtKernelData::getInstance())
{
    qRegisterMetaType<FrameData>("FrameData");
    qRegisterMetaType<QVector<KvMeasuredValue>>("QVector<KvMeasuredValue>");
}

KvReportKernelData::~KvReportKernelData()
{
    // A deferred deletion may come after the application has ended, so running timers must not fire into this
    // object.
    if (m_refreshTimer)
        m_refreshTimer->stop();
    stopCameraTimer();
}

int KvReportKernelData::valueClass(int objectType, const QStringList &valueNames, const QString &valueName)
{
    const auto classes = valueClassTable().constFind(objectType);
    if (classes == valueClassTable().constEnd())
        return 0;
    const int position = valueNames.indexOf(valueName);
    return position >= 0 && position < classes->size() ? classes->at(position) : 0;
}

qint64 KvReportKernelData::adaptedDelay(qint64 delay, qint64 elapsed)
{
    if (elapsed > delay)
        return qMin(elapsed, kMaxDelayMs);
    if (2 * elapsed < delay)
        return qMax(2 * elapsed, kMinDelayMs);
    return delay;
}

void KvReportKernelData::setActive(bool active)
{
    if (!active) {
        // A surplus "false" must not make the count negative: the next "true" would then connect nothing.
        if (m_activations == 0)
            return;
        if (--m_activations == 0) {
            stopCameraTimer();
            disconnectHost();
        }
        return;
    }
    if (m_activations++ > 0)
        return;
    connectHost();
    readSignDigits();
    slotDelayedMeasurementsUpdate();
    // At once, since a print that activates the adapter is over before a later frame could arrive.
    requestCameraImage();
    startCameraTimer();
}

void KvReportKernelData::setCameraImageWithDataWanted(bool wanted)
{
    if (wanted)
        ++m_withDataWishes;
    else if (m_withDataWishes > 0)
        --m_withDataWishes;
}

void KvReportKernelData::connectHost()
{
    ZtSignalCenter *center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)), this,
                           SLOT(slotObjectCreated(int, int, const ZtKernelObjectData *)));
    connect(center, SIGNAL(signalObjectChanged(int, int, const ZtKernelObjectData *)), this,
                           SLOT(slotObjectChanged(int, int, const ZtKernelObjectData *)));
    connect(center, SIGNAL(signalObjectRemoved(int, int)), this, SLOT(slotObjectRemoved(int, int)));
    connect(center, SIGNAL(signalLengthUnitChanged()), this, SLOT(slotLengthUnitChanged()));
    connect(center, SIGNAL(signalAngleUnitChanged()), this, SLOT(slotAngleUnitChanged()));
    ZtAppSettings *settings = ZtAppSettings::getInstance();
    connect(settings, SIGNAL(signalValuesModified(QStringList, QList<QVariant>)), this,
                             SLOT(slotSettingsModified(QStringList, QList<QVariant>)));
    connect(settings, SIGNAL(signalProfileChanged()), this, SLOT(slotProfileChanged()));
    connectImage();
}

void KvReportKernelData::disconnectHost()
{
    disconnect(ZtSignalCenter::getInstance(), nullptr, this, nullptr);
    disconnect(ZtAppSettings::getInstance(), nullptr, this, nullptr);
    disconnectImage();
}

void KvReportKernelData::connectImage()
{
    iZTKernelImage *image = m_kernelData->kernelImage();
    if (!isActive() || image == m_connectedImage)
        return;
    disconnectImage();
    m_connectedImage = image;
    if (!image)
        return;
    // Direct: aHandled is a reference that the host reads when the emission returns.
    connect(image, SIGNAL(signalImageCompleted(FrameData,bool&)), this,
                          SLOT(slotImageFragmentReady(FrameData,bool&)), Qt::DirectConnection);
}

void KvReportKernelData::disconnectImage()
{
    // Not the kernel's image of now: the host may have installed another one in the meantime.
    if (m_connectedImage)
        disconnect(m_connectedImage, nullptr, this, nullptr);
    m_connectedImage.clear();
}

void KvReportKernelData::startCameraTimer()
{
    if (!m_cameraTimer)
        m_cameraTimer = makeTimer();
    if (m_cameraTimer->isActive())
        return;
    m_cameraTimer->setInterval(kCameraIntervalMs);
    connect(m_cameraTimer.data(), SIGNAL(timeout()), this,
                                         SLOT(slotDelayedPrepareCameraImage()), Qt::UniqueConnection);
    m_cameraTimer->start();
}

void KvReportKernelData::stopCameraTimer()
{
    if (m_cameraTimer && m_cameraTimer->isActive())
        m_cameraTimer->stop();
}

bool KvReportKernelData::readSignDigits()
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    const uint digits = ZtAppSettings::value(QLatin1String(kDigitsKey), 0).toUInt();
    ZtAppSettings::endGroup();
    if (digits == m_signDigits)
        return false;
    m_signDigits = digits;
    return true;
}

void KvReportKernelData::scheduleRefresh()
{
    if (m_refreshTimer && m_refreshTimer->isActive())
        return;
    m_refreshTimer = makeTimer();
    m_refreshTimer->setSingleShot(true);
    connect(m_refreshTimer.data(), SIGNAL(timeout()), this, SLOT(slotDelayedMeasurementsUpdate()));
    m_refreshTimer->start(static_cast<int>(3 * m_refreshDelay));
}

bool KvReportKernelData::isMeasurementType(const ZtGsManipulator *manipulator) const
{
    return manipulator && (manipulator->typeFlags(0) & ZtGsManipulator::MeasurementFlag) != 0;
}

void KvReportKernelData::scheduleRefreshForType(int type)
{
    if (isMeasurementType(m_kernelData->getGsManipulator(type)))
        scheduleRefresh();
}

void KvReportKernelData::slotDelayedMeasurementsUpdate()
{
    QElapsedTimer stopwatch;
    stopwatch.start();
    rebuildRecords();
    emit signalMeasuredValuesChanged();
    // The consumers' redraw counts: it is their time, too, that a busy host takes away from the user.
    m_refreshDelay = adaptedDelay(m_refreshDelay, stopwatch.elapsed());
}

void KvReportKernelData::rebuildRecords()
{
    // A list that someone else still holds stays theirs; writing into it would copy every old record first.
    if (!m_values.isDetached())
        m_values.resize(0);
    // Otherwise the old records are written over one by one. That frees their texts just before the new ones
    // are made, which keeps the whole rebuild in the processor's caches.
    int count = 0;
    const QMap<int, ZtObjectMap> &objects = m_kernelData->objects();
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it)
        count = fillTypeRecords(it.key(), count);
    m_values.resize(count);
}

int KvReportKernelData::fillTypeRecords(int type, int count)
{
    const ZtGsManipulator *manipulator = m_kernelData->getGsManipulator(type);
    if (!isMeasurementType(manipulator) || !m_kernelData->getDataDescriptor(type))
        return count;
    const QStringList names = manipulator->getValueNames();
    QVector<int> classes;
    classes.reserve(names.size());
    for (const QString &name : names)
        classes.append(valueClass(manipulator->objectTypeId(), names, name));

    const ZtObjectMap objects = m_kernelData->objects().value(type);
    for (auto object = objects.constBegin(); object != objects.constEnd(); ++object) {
        if (!object.value())
            continue;
        if (count + names.size() > m_values.size())
            m_values.resize(count + names.size() + kRoomStep);
        count += fillObjectRecords(*manipulator, names, classes, object.key(), object.value(),
                                   m_values.data() + count);
    }
    return count;
}

int KvReportKernelData::fillObjectRecords(const ZtGsManipulator &manipulator, const QStringList &names,
                                          const QVector<int> &classes, int id,
                                          const ZtKernelObjectData *object, KvMeasuredValue *records) const
{
    const QStringList shown = manipulator.valueSet(id);
    int count = 0;
    for (int i = 0; i < names.size(); ++i) {
        const QString &name = names.at(i);
        if (!manipulator.isValueShown(name, shown))
            continue;
        QString text = manipulator.valueText(name, object);
        if (text.isEmpty())
            continue;
        KvMeasuredValue &record = records[count];
        record.valueText = std::move(text);
        record.measureKind = 0;
        record.value = manipulator.value(name, object, record.measureKind);
        record.valueClass = classes.at(i);
        assignText(record.valueName, name);
        record.objectType = manipulator.objectTypeId();
        record.objectId = id;
        // The object's own texts are the same for all its values: asked for with the first one recorded.
        if (count == 0) {
            assignText(record.objectName, manipulator.getObjectName(id));
            assignText(record.objectTypeName, manipulator.objectTypeName(id));
        } else {
            assignText(record.objectName, records->objectName);
            assignText(record.objectTypeName, records->objectTypeName);
        }
        ++count;
    }
    return count;
}

void KvReportKernelData::slotObjectCreated(int aType, int aIndex, const ZtKernelObjectData *aObject)
{
    Q_UNUSED(aIndex)
    Q_UNUSED(aObject)
    scheduleRefreshForType(aType);
}

void KvReportKernelData::slotObjectChanged(int aType, int aIndex, const ZtKernelObjectData *aObject)
{
    Q_UNUSED(aIndex)
    Q_UNUSED(aObject)
    scheduleRefreshForType(aType);
}

void KvReportKernelData::slotObjectRemoved(int aType, int aIndex)
{
    Q_UNUSED(aIndex)
    scheduleRefreshForType(aType);
}

void KvReportKernelData::slotSettingsModified(QStringList aKeys, QList<QVariant> aVals)
{
    Q_UNUSED(aVals)
    if (aKeys.contains(QLatin1String(kDigitsKey)) && readSignDigits())
        scheduleRefresh();
}

void KvReportKernelData::slotProfileChanged()
{
    if (readSignDigits())
        scheduleRefresh();
}

void KvReportKernelData::slotLengthUnitChanged()
{
    scheduleRefresh();
}

void KvReportKernelData::slotAngleUnitChanged()
{
    scheduleRefresh();
}

bool KvReportKernelData::hasCameraReceivers() const
{
    return isSignalConnected(QMetaMethod::fromSignal(&KvReportKernelData::signalCameraImageChanged)) ||
           isSignalConnected(QMetaMethod::fromSignal(&KvReportKernelData::signalCameraImageWithDataChanged));
}

void KvReportKernelData::requestCameraImage()
{
    if (iZTKernelImage *image = m_kernelData->kernelImage())
        image->requestImage();
}

void KvReportKernelData::slotDelayedPrepareCameraImage()
{
    connectImage();
    if (hasCameraReceivers())
        requestCameraImage();
}

void KvReportKernelData::slotImageFragmentReady(FrameData aFrameData, bool &aHandled)
{
    if (aFrameData.image && !aFrameData.image->isNull()) {
        m_cameraImage = QPixmap::fromImage(aFrameData.image->getQImage(QRect()));
        emit signalCameraImageChanged();
        if (isCameraImageWithDataWanted()) {
            QTransform toFrame;
            toFrame.translate(-aFrameData.rect.left(), -aFrameData.rect.top());
            toFrame.scale(aFrameData.scale, aFrameData.scale);
            // On a copy: the frame belongs to whoever else receives it.
            ZtImage drawn(aFrameData.image->getQImage(QRect()));
            ZtImageTools::getInstance()->drawEditorObjectsOnImage(&drawn, toFrame, QList<int>());
            m_cameraImageWithData = QPixmap::fromImage(drawn.getQImage(QRect()));
            emit signalCameraImageWithDataChanged();
        }
    }
    aHandled = true;
    aFrameData.image.reset();
}
