// SPDX-License-Identifier: MIT
#include "KvDeskObjectChanges.h"

#include "kernel/ZtAppSettings.h"
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
    connect(&m_timer, SIGNAL(timeout()), this, SIGNAL(signalChanged()));
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotSchedule()));
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotSchedule()));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotSchedule()));
    connect(center, SIGNAL(signalLengthUnitChanged()), this, SLOT(slotSchedule()));
    connect(center, SIGNAL(signalAngleUnitChanged()), this, SLOT(slotSchedule()));
    const ZtAppSettings *const settings = ZtAppSettings::getInstance();
    connect(settings, SIGNAL(signalValuesModified(QStringList,QList<QVariant>)), this,
                             SLOT(slotValuesModified(QStringList,QList<QVariant>)));
    connect(settings, SIGNAL(signalProfileChanged()), this, SLOT(slotSchedule()));
}

void KvDeskObjectChanges::flush()
{
    if (!m_timer.isActive())
        return;
    m_timer.stop();
    emit signalChanged();
}

void KvDeskObjectChanges::slotValuesModified(QStringList aKeys, QList<QVariant> aVals)
{
    Q_UNUSED(aVals)
    // Units have signals of their own.
    if (aKeys.contains(QLatin1String("MeasurementLabelsSignDigits")))
        slotSchedule();
}

void KvDeskObjectChanges::slotSchedule()
{
    if (!m_timer.isActive())
        m_timer.start();
}
