// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvMeasuredValue.h"
#include "data/TableManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectDataDescr.h"

#include <memory>

/** Fills the kernel with made-up types and objects for one test, and takes them away again at its end. */
class MeasuredHost
{
public:
    MeasuredHost() = default;
    ~MeasuredHost()
    {
        const ZtKernelData::SignalBlocker blocker;
        for (const int type : qAsConst(m_types))
            ZtKernelData::getInstance()->unregisterType(type);
        ZtKernelData::getInstance()->setKernelImage(nullptr);
    }
    Q_DISABLE_COPY(MeasuredHost)

    TableManipulator *addType(int type, const QString &name, const QStringList &valueNames)
    {
        auto manipulator = std::make_unique<TableManipulator>(type, name, valueNames);
        TableManipulator *const added = manipulator.get();
        m_types.append(type);
        ZtKernelData::getInstance()->registerType(type, std::move(manipulator),
                                                  std::make_unique<ZtKernelObjectDataDescr>(type, name));
        return added;
    }

    /** Adds an object whose host texts are its values with " u" behind them. */
    int addObject(int type, const QVector<QVariant> &values, int id = 0)
    {
        QStringList texts;
        for (const QVariant &value : values)
            texts.append(value.toString() + QStringLiteral(" u"));
        return addObject(type, values, texts, id);
    }
    int addObject(int type, const QVector<QVariant> &values, const QStringList &texts, int id = 0)
    {
        return ZtKernelData::getInstance()->addObject(type, std::make_unique<TableObject>(values, texts), id);
    }

private:
    QVector<int> m_types;
};

/** Records of the given values, as many as there are; everything but the value is the same in all. */
inline QVector<KvMeasuredValue> recordsOf(const QVector<QVariant> &values, int measureKind = 1)
{
    QVector<KvMeasuredValue> records;
    for (const QVariant &value : values) {
        KvMeasuredValue record;
        record.objectId = records.size() + 1;
        record.valueName = QStringLiteral("Length");
        record.value = value;
        record.measureKind = measureKind;
        records.append(record);
    }
    return records;
}

inline QVector<KvMeasuredValue> recordsOf(const QVector<double> &values)
{
    QVector<QVariant> variants;
    for (const double value : values)
        variants.append(value);
    return recordsOf(variants);
}
