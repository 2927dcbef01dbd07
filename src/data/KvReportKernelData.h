// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvMeasuredValue.h"
#include "kernel/FrameData.h"

#include <QList>
#include <QObject>
#include <QPixmap>
#include <QPointer>
#include <QSharedPointer>
#include <QStringList>

class QTimer;
class ZtGsManipulator;
class ZtKernelData;
class ZtKernelObjectData;
class ZtKernelObjectDataDescr;
class iZTKernelImage;

/**
 * The plug-in's only access to the host's measurements and camera image.
 *
 * Flattens the host's measured objects into a list of records, in the order of object type id, object id and
 * the manipulator's value names, and keeps the list current while it is active. All on the GUI thread.
 */
class KvReportKernelData : public QObject
{
    Q_OBJECT
public:
    explicit KvReportKernelData(QObject *parent = nullptr);
    ~KvReportKernelData() override;

    /**
     * Reference-counted switch of live tracking: every view of live data calls it with true when it starts
     * and with false when it ends. The records and pictures are kept while inactive. A surplus false is
     * ignored.
     */
    void setActive(bool active);
    bool isActive() const { return m_activations > 0; }

    /** The current records; shares its storage with the adapter until the next rebuild. */
    QVector<KvMeasuredValue> measuredValues() const { return m_values; }

    QPixmap cameraImage() const { return m_cameraImage; }
    /** The camera image with the measurement objects drawn on it; made only while it is wanted. */
    QPixmap cameraImageWithData() const { return m_cameraImageWithData; }
    /**
     * Reference-counted: whoever wants the image with measurements calls it with true, and with false when it
     * no longer does. A surplus false is ignored.
     */
    void setCameraImageWithDataWanted(bool wanted);
    bool isCameraImageWithDataWanted() const { return m_withDataWishes > 0; }

    /** The last read "MeasurementLabelsSignDigits"; 0 (automatic) until the first activation. */
    uint signDigits() const { return m_signDigits; }

    /** Delay in ms to which a refresh request is throttled, before it is tripled; 10..500. */
    qint64 refreshDelay() const { return m_refreshDelay; }

    /** Class of the value \a valueName of an object type, 0 where the table has none for it. */
    static int valueClass(int objectType, const QStringList &valueNames, const QString &valueName);

    /** The delay that follows a rebuild of \a elapsed ms, from the delay in force. */
    static qint64 adaptedDelay(qint64 delay, qint64 elapsed);

signals:
    void signalMeasuredValuesChanged();
    void signalCameraImageChanged();
    void signalCameraImageWithDataChanged();

public slots:
    void slotDelayedPrepareCameraImage();
    void slotDelayedMeasurementsUpdate();
    void slotObjectCreated(int aType, int aIndex, const ZtKernelObjectData *aObject);
    void slotObjectChanged(int aType, int aIndex, const ZtKernelObjectData *aObject);
    void slotObjectRemoved(int aType, int aIndex);
    void slotSettingsModified(QStringList aKeys, QList<QVariant> aVals);
    void slotProfileChanged();
    void slotLengthUnitChanged();
    void slotAngleUnitChanged();
    void slotImageFragmentReady(FrameData aFrameData, bool &aHandled);

private:
    void connectHost();
    void disconnectHost();
    /** Receives the frames of the kernel's image, while active; the host may install another at any time. */
    void connectImage();
    void disconnectImage();
    void startCameraTimer();
    void stopCameraTimer();
    bool readSignDigits();
    void scheduleRefresh();
    void scheduleRefreshForType(int type);
    bool isMeasurementType(const ZtGsManipulator *manipulator) const;
    void rebuildRecords();
    /** Fills the records of a type from index \a count on; returns the index behind them. */
    int fillTypeRecords(int type, int count);
    /** Fills the records of one object from \a records on, which has room for all its values; returns their
     * number. */
    int fillObjectRecords(const ZtGsManipulator &manipulator, const QStringList &names,
                          const QVector<int> &classes, int id, const ZtKernelObjectData *object,
                          KvMeasuredValue *records) const;
    void requestCameraImage();
    bool hasCameraReceivers() const;

    ZtKernelData *m_kernelData;
    QVector<KvMeasuredValue> m_values;
    uint m_signDigits = 0;
    int m_activations = 0;
    QSharedPointer<QTimer> m_cameraTimer;
    QSharedPointer<QTimer> m_refreshTimer;
    QPixmap m_cameraImage;
    QPixmap m_cameraImageWithData;
    qint64 m_refreshDelay = 10;
    int m_withDataWishes = 0;
    QPointer<iZTKernelImage> m_connectedImage; ///< the one whose frames are received while active
};
