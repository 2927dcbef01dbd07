// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"

#include <QMap>
#include <QVector>

#include <algorithm>
#include <memory>

/** One value of a made-up object. */
struct ChartValue
{
    QString name;
    QVariant value; ///< in base units
    int kind = 1;   ///< measure kind: 1 length, 2 area, 3 angle, 4 count, 5 percentage
};

/** One measured object of a made-up host. */
struct ChartObject
{
    int type = 0;
    QString typeName;
    QString name;
    QVector<ChartValue> values;
};

/**
 * A host with objects of several types, counters among them, under the data adapter and the engine.
 *
 * Objects are numbered from 1 within their type.
 */
class ChartMeasurements
{
public:
    static constexpr int Line = 66653;
    static constexpr int Rectangle = 66651;
    static constexpr int Counter = 66741;
    static constexpr int Circle = 66755;

    ChartMeasurements() { KvStatisticsEngine::instance().setKernelData(&m_kernelData); }
    ~ChartMeasurements()
    {
        clearHost();
        m_kernelData.slotDelayedMeasurementsUpdate(); // leaves nothing in the engine, which lives on
        KvStatisticsEngine::instance().setKernelData(nullptr);
    }
    ChartMeasurements(const ChartMeasurements &) = delete;
    ChartMeasurements &operator=(const ChartMeasurements &) = delete;

    KvReportKernelData *kernelData() { return &m_kernelData; }

    /** Measures \a objects instead of what was there and lets the adapter report them at once. */
    void setObjects(const QVector<ChartObject> &objects)
    {
        setHostObjects(objects);
        m_kernelData.slotDelayedMeasurementsUpdate();
    }

    /** Measures \a objects instead of what was there; the adapter does not know of them yet. */
    void setHostObjects(const QVector<ChartObject> &objects)
    {
        clearHost();
        QMap<int, QVector<ChartObject>> types;
        for (const ChartObject &object : objects)
            types[object.type].append(object);
        const ZtKernelData::SignalBlocker blocker;
        for (auto it = types.cbegin(); it != types.cend(); ++it)
            addType(it.key(), it.value());
    }

    /** A line with a length in micrometres. */
    static ChartObject line(const QString &name, const QVariant &length)
    {
        return {Line, QStringLiteral("Line"), name, {{QStringLiteral("length"), length, 1}}};
    }
    /** A circle with a diameter in micrometres. */
    static ChartObject circle(const QString &name, const QVariant &diameter)
    {
        return {Circle, QStringLiteral("Circle"), name, {{QStringLiteral("diameter"), diameter, 1}}};
    }
    /** A counter with its count and its share of all counts, in this order as the host has them. */
    static ChartObject counter(const QString &name, const QVariant &count)
    {
        return {Counter,
                QStringLiteral("Counter"),
                name,
                {{QStringLiteral("count"), count, 4}, {QStringLiteral("share"), 50.0, 5}}};
    }

private:
    class Object : public ZtKernelObjectData
    {
    public:
        explicit Object(int index)
            : m_index(index)
        {}
        int index() const { return m_index; }

    private:
        int m_index;
    };

    class Manipulator : public ZtGsManipulator
    {
    public:
        Manipulator(int type, const QVector<ChartObject> &objects)
            : m_type(type)
            , m_objects(objects)
        {
            QStringList names;
            for (int i = 0; i < objects.size(); ++i) {
                for (const ChartValue &value : objects.at(i).values) {
                    if (!names.contains(value.name))
                        names.append(value.name);
                }
                setObjectName(i + 1, objects.at(i).name);
            }
            setValueNames(names);
        }

        int objectTypeId() const override { return m_type; }
        int typeFlags(int reserved) const override { return reserved | MeasurementFlag; }
        QString objectTypeName(int id) const override { return m_objects.at(id - 1).typeName; }
        bool isValueShown(const QString &, const QStringList &) const override { return true; }
        QVariant value(const QString &name, const ZtKernelObjectData *object, int &kind) const override
        {
            const ChartValue *found = find(name, object);
            kind = found ? found->kind : 0;
            return found ? found->value : QVariant();
        }
        QString valueText(const QString &name, const ZtKernelObjectData *object) const override
        {
            const ChartValue *found = find(name, object);
            return found ? QStringLiteral("text") : QString();
        }
        QStringList valueSet(int) const override { return getValueNames(); }

    private:
        const ChartValue *find(const QString &name, const ZtKernelObjectData *object) const
        {
            const QVector<ChartValue> &values =
                m_objects.at(static_cast<const Object *>(object)->index()).values;
            const auto found = std::find_if(values.begin(), values.end(),
                                            [&name](const ChartValue &value) { return value.name == name; });
            return found == values.end() ? nullptr : found;
        }

        int m_type;
        QVector<ChartObject> m_objects;
    };

    void addType(int type, const QVector<ChartObject> &objects)
    {
        ZtKernelData *kernel = ZtKernelData::getInstance();
        kernel->registerType(type, std::make_unique<Manipulator>(type, objects),
                             std::make_unique<ZtKernelObjectDataDescr>(type, objects.first().typeName));
        for (int i = 0; i < objects.size(); ++i)
            kernel->addObject(type, std::make_unique<Object>(i), i + 1);
        m_types.append(type);
    }

    void clearHost()
    {
        const ZtKernelData::SignalBlocker blocker;
        for (const int type : qAsConst(m_types))
            ZtKernelData::getInstance()->unregisterType(type);
        m_types.clear();
    }

    KvReportKernelData m_kernelData;
    QVector<int> m_types;
};
