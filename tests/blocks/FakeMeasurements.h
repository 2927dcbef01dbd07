// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"

#include <QVector>

#include <memory>

/** One measured value of a made-up host, as a table shows it. */
struct FakeRow
{
    QString objectName;
    QString typeName;
    QString valueName;
    QVariant value;
    QString text;
};

/**
 * A host whose measurements are a list of rows, with the data adapter and the engine on top of it.
 *
 * Every row is an object of its own with one value; the rows are its objects in the order of their ids.
 */
class FakeMeasurements
{
public:
    FakeMeasurements() { KvStatisticsEngine::instance().setKernelData(&m_kernelData); }
    ~FakeMeasurements()
    {
        KvStatisticsEngine::instance().setKernelData(nullptr);
        ZtKernelData::getInstance()->unregisterType(Type);
    }
    FakeMeasurements(const FakeMeasurements &) = delete;
    FakeMeasurements &operator=(const FakeMeasurements &) = delete;

    KvReportKernelData *kernelData() { return &m_kernelData; }

    /** Measures \a rows instead of what was there and lets the adapter report them at once. */
    void setRows(const QVector<FakeRow> &rows)
    {
        ZtKernelData *kernel = ZtKernelData::getInstance();
        const ZtKernelData::SignalBlocker blocker;
        kernel->unregisterType(Type);
        auto manipulator = std::make_unique<Manipulator>(rows);
        kernel->registerType(Type, std::move(manipulator),
                             std::make_unique<ZtKernelObjectDataDescr>(Type, QStringLiteral("fake")));
        for (int i = 0; i < rows.size(); ++i)
            kernel->addObject(Type, std::make_unique<Object>(i), i + 1);
        m_kernelData.slotDelayedMeasurementsUpdate();
    }

    /** \a count rows "Line 0", "Line 1" ... of increasing length. */
    static QVector<FakeRow> lines(int count)
    {
        QVector<FakeRow> rows;
        rows.reserve(count);
        for (int i = 0; i < count; ++i)
            rows.append({QStringLiteral("Line %1").arg(i), QStringLiteral("Line"), QStringLiteral("length"),
                         static_cast<double>(i), QStringLiteral("%1 µm").arg(i)});
        return rows;
    }

private:
    static constexpr int Type = 70001;

    class Object : public ZtKernelObjectData
    {
    public:
        explicit Object(int row)
            : m_row(row)
        {}
        int row() const { return m_row; }

    private:
        int m_row;
    };

    class Manipulator : public ZtGsManipulator
    {
    public:
        explicit Manipulator(const QVector<FakeRow> &rows)
            : m_rows(rows)
        {
            QStringList names;
            for (int i = 0; i < rows.size(); ++i) {
                if (!names.contains(rows.at(i).valueName))
                    names.append(rows.at(i).valueName);
                setObjectName(i + 1, rows.at(i).objectName);
            }
            setValueNames(names);
        }

        int objectTypeId() const override { return Type; }
        int typeFlags(int reserved) const override { return reserved | MeasurementFlag; }
        QString objectTypeName(int id) const override { return m_rows.at(id - 1).typeName; }
        bool isValueShown(const QString &, const QStringList &) const override { return true; }
        QVariant value(const QString &, const ZtKernelObjectData *object, int &measureKind) const override
        {
            measureKind = Length;
            return rowOf(object).value;
        }
        QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override
        {
            const FakeRow &row = rowOf(object);
            return row.valueName == valueName ? row.text : QString();
        }
        QStringList valueSet(int) const override { return getValueNames(); }

    private:
        const FakeRow &rowOf(const ZtKernelObjectData *object) const
        {
            return m_rows.at(static_cast<const Object *>(object)->row());
        }

        QVector<FakeRow> m_rows;
    };

    KvReportKernelData m_kernelData;
};
