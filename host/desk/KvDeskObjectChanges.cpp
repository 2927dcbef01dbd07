// SPDX-License-Identifier: MIT
#include "KvDeskObjectChanges.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"

KvDeskObjectChanges::KvDeskObjectChanges(QObject *parent)
    : QObject(parent)
{
    m_timer.setSingleShot(true);
    m_timer.setInterval(intervalMs);
    connectSignals();
}

void KvDeskObjectChanges::connectSignals()
{
    connect(&m_timer, SIGNAL(timeout()), this, SLOT(slotAnnounce()));
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectTouched(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectTouched(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotObjectRemoved(int,int)));
    connect(center, SIGNAL(signalLengthUnitChanged()), this, SLOT(slotReadingChanged()));
    connect(center, SIGNAL(signalAngleUnitChanged()), this, SLOT(slotReadingChanged()));
    const ZtAppSettings *const settings = ZtAppSettings::getInstance();
    connect(settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)), this,
                             SLOT(slotValuesModified(QStringList,QList<QVariant>)));
    connect(settings, SIGNAL(signalProfileChanged()), this, SLOT(slotReadingChanged()));
}

void KvDeskObjectChanges::flush()
{
    if (m_timer.isActive())
        slotAnnounce();
}

void KvDeskObjectChanges::slotAnnounce()
{
    m_timer.stop();
    // Changes that receivers make belong to the next announcement.
    m_announced = m_pending;
    m_pending = Batch();
    emit signalChanged();
    m_announced = Batch();
}

void KvDeskObjectChanges::slotObjectTouched(int aType, int aId, const ZtKernelObjectData *aObject)
{
    Q_UNUSED(aObject)
    m_pending.objects.insert({aType, aId});
    schedule();
}

void KvDeskObjectChanges::slotObjectRemoved(int aType, int aId)
{
    m_pending.objects.insert({aType, aId});
    if (!ZtKernelData::getInstance()->objects().contains(aType))
        m_pending.emptiedTypes.insert(aType);
    schedule();
}

void KvDeskObjectChanges::slotReadingChanged()
{
    m_pending.isReadingChanged = true;
    schedule();
}

void KvDeskObjectChanges::slotValuesModified(QStringList aKeys, QList<QVariant> aVals)
{
    Q_UNUSED(aVals)
    // Units have signals of their own.
    if (aKeys.contains(QLatin1String("MeasurementLabelsSignDigits")))
        slotReadingChanged();
}

void KvDeskObjectChanges::schedule()
{
    if (!m_timer.isActive())
        m_timer.start();
}
