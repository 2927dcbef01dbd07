// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QHash>
#include <QString>
#include <QStringList>
#include <QVariant>
#include <QVector>

class QPainter;
class ZtKernelObjectData;

/**
 * What the application knows about one object type: its names, the values it measures and their texts.
 *
 * One manipulator serves all objects of its type. The order of the virtual operations is part of the binary
 * contract with plug-ins; new ones are added at the end.
 */
class ZT_KERNEL_EXPORT ZtGsManipulator
{
public:
    /** Set in typeFlags() for types whose objects are measurements. */
    static constexpr int MeasurementFlag = 0x200;

    /** What a value measures. Any other number means that the value has no unit known to the statistics. */
    enum MeasureKind { NoKind = 0, Length = 1, Area = 2, Angle = 3, Count = 4, Percentage = 5 };

    virtual ~ZtGsManipulator();

    virtual int objectTypeId() const = 0; ///< the id it is registered under
    /** Flags of the type. \a reserved is 0. */
    virtual int typeFlags(int reserved) const = 0;
    /** Display name of the type, translated. \a id allows names that differ per object. */
    virtual QString objectTypeName(int id) const = 0;
    /**
     * Whether the user wants to see the value \a valueName; \a valueSet comes from valueSet() of the object.
     */
    virtual bool isValueShown(const QString &valueName, const QStringList &valueSet) const = 0;
    /**
     * The value in base units (micrometres, square micrometres, degrees); sets \a measureKind (MeasureKind).
     */
    virtual QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                           int &measureKind) const = 0;
    /** The value as the host shows it, unit included; empty when the object has no such value. */
    virtual QString valueText(const QString &valueName, const ZtKernelObjectData *object) const = 0;
    /** The names of the values that are shown for object \a id. */
    virtual QStringList valueSet(int id) const = 0;
    /**
     * Draws the object in scene coordinates (image pixels). The painter carries the transform to its device.
     */
    virtual void draw(QPainter *painter, int id, const ZtKernelObjectData *object) const;

    /** The names of the values that objects of this type measure, in their fixed order. */
    QStringList getValueNames() const { return m_valueNames; }

    /** Display name of object \a id: the name given to it, else the type's name, a blank and the id. */
    QString getObjectName(int id) const;
    /** Gives object \a id a name of its own; an empty \a name takes it away. */
    void setObjectName(int id, const QString &name);
    void clearObjectNames() { m_objectNames.clear(); } ///< all back to the type's name and the id

protected:
    ZtGsManipulator() = default;
    explicit ZtGsManipulator(const QStringList &valueNames);                         ///< in their fixed order
    void setValueNames(const QStringList &valueNames) { m_valueNames = valueNames; } ///< see getValueNames()

private:
    Q_DISABLE_COPY(ZtGsManipulator)

    QString numberedName(int id) const;

    QStringList m_valueNames;
    QHash<int, QString> m_objectNames;
    mutable QVector<QString> m_numberedNames; ///< by id; made when asked for, checked against the type's name
};
