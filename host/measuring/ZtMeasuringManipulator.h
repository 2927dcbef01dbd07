// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtMeasuringGlobal.h"

class ZtMeasuredObjectData;

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

private:
    int m_typeId;
    QHash<QString, int> m_positions;
    bool m_someHidden = false; ///< false as long as no object of the type ever hid a value
};
