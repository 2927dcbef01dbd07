// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelObjectData.h"

#include <QHash>
#include <QStringList>
#include <QVariant>
#include <QVector>

/** An object that carries its measured values, and the host's texts for them, by the position of the value
 * name. */
class TableObject : public ZtKernelObjectData
{
public:
    TableObject(const QVector<QVariant> &objectValues, const QStringList &objectTexts)
        : values(objectValues)
        , texts(objectTexts)
    {}

    QVector<QVariant> values;
    QStringList texts;
};

/** Manipulator of a made-up type whose objects are rows of a table. What the host could answer is set from
 * outside. */
class TableManipulator : public ZtGsManipulator
{
public:
    TableManipulator(int type, const QString &typeName, const QStringList &valueNames)
        : ZtGsManipulator(valueNames)
        , flags(MeasurementFlag)
        , m_type(type)
        , m_typeName(typeName)
    {}

    int flags;
    int defaultKind = Length;
    QHash<QString, int> kinds;         ///< measure kinds of single values
    QStringList hiddenNames;           ///< values that no object shows
    QHash<int, QStringList> valueSets; ///< values that single objects show; all of them otherwise

    int objectTypeId() const override { return m_type; }
    int typeFlags(int reserved) const override { return reserved == 0 ? flags : 0; }
    QString objectTypeName(int id) const override
    {
        // "%1" in the name makes it differ from object to object.
        return m_typeName.contains(QLatin1String("%1")) ? m_typeName.arg(id) : m_typeName;
    }
    bool isValueShown(const QString &valueName, const QStringList &valueSet) const override
    {
        return valueSet.contains(valueName) && !hiddenNames.contains(valueName);
    }
    QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                   int &measureKind) const override
    {
        const int kind = kinds.value(valueName, defaultKind);
        if (kind != NoKind) // a host that knows no kind leaves the argument alone
            measureKind = kind;
        return static_cast<const TableObject *>(object)->values.value(getValueNames().indexOf(valueName));
    }
    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override
    {
        return static_cast<const TableObject *>(object)->texts.value(getValueNames().indexOf(valueName));
    }
    QStringList valueSet(int id) const override { return valueSets.value(id, getValueNames()); }

private:
    int m_type;
    QString m_typeName;
};
