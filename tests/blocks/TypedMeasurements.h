// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "data/MeasuredHost.h"

/** A host with values of any kind, under the data adapter and the engine. */
class TypedMeasurements
{
public:
    TypedMeasurements() { KvStatisticsEngine::instance().setKernelData(&m_kernelData); }
    ~TypedMeasurements()
    {
        // The engine lives on; the next test finds it empty.
        KvStatisticsEngine::instance().setKernelData(nullptr);
        KvStatisticsEngine::instance().slotMeasurementsListUpdated();
    }
    Q_DISABLE_COPY(TypedMeasurements)

    KvReportKernelData *kernelData() { return &m_kernelData; }

    /** Measures a value on as many new objects as there are \a values; reported at once. */
    void add(const QString &typeName, const QString &valueName, const QVector<QVariant> &values,
             int measureKind = ZtGsManipulator::Length)
    {
        const int type = FirstType + m_typeCount++;
        m_host.addType(type, typeName, {valueName})->kinds.insert(valueName, measureKind);
        for (const QVariant &value : values)
            m_host.addObject(type, {value}, QStringList{QStringLiteral("shown by the host")});
        m_kernelData.slotDelayedMeasurementsUpdate();
    }

private:
    static constexpr int FirstType = 70100;

    MeasuredHost m_host;
    KvReportKernelData m_kernelData;
    int m_typeCount = 0;
};
