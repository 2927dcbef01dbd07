// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <vector>

class ZtMeasuredObjectData;

/** One value that an object has. */
struct ZtMeasuredValue
{
    int position = 0;   ///< in the type's value names
    int kind = 0;       ///< ZtGsManipulator::MeasureKind
    double value = 0.0; ///< in base units
};

/**
 * What the manipulators of this library share: the type id, and which values are shown.
 *
 * All objects of the type are ZtMeasuredObjectData. Reports ask for every value of every object at each
 * change, so names are looked up in a hash, and objects that hide nothing share one list of names.
 */
class ZT_MEASURING_EXPORT ZtMeasuringManipulator : public ZtGsManipulator
{
public:
    int objectTypeId() const override { return m_typeId; }
    bool isValueShown(const QString &valueName, const QStringList &valueSet) const override;
    QStringList valueSet(int id) const override;

    /** Appends the values of an object that are shown, in the order of their names; the same ones that
     * value() gives by their names, for whoever needs those of very many objects. */
    void appendShownValues(const ZtKernelObjectData *object, std::vector<ZtMeasuredValue> *values) const;

    /** Place of a value in getValueNames(), the first one for a name that comes twice; -1 for an unknown
     * name. */
    int position(const QString &valueName) const { return m_positions.value(valueName, -1); }

    /** The name that the user or a table gave an object; empty for the one that it has by itself. */
    QString ownName(int id) const;
    /** The same of a \a name that an object has: empty when it is the type's name, a blank and the id. */
    static QString ownName(const QString &name, const QString &typeName, int id);

    /** Shows or hides a value of one object; announcing the change is up to the caller. */
    void setValueShown(ZtMeasuredObjectData *object, int position, bool shown);
    bool isValueShown(const ZtMeasuredObjectData &object, int position) const;

protected:
    ZtMeasuringManipulator(int typeId, const QStringList &valueNames);
    void setObjectTypeId(int typeId) { m_typeId = typeId; }
    void changeValueNames(const QStringList &valueNames);
    /** Appends all values that the object has, in the order of their names. */
    virtual void appendValues(const ZtMeasuredObjectData &object,
                              std::vector<ZtMeasuredValue> *values) const = 0;

private:
    int m_typeId;
    QHash<QString, int> m_positions;
    bool m_someHidden = false; ///< false as long as no object of the type ever hid a value
};
