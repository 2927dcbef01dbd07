// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtUnit.h"

#include <QHash>
#include <QStringList>

/** Decides on the unit of every value of a table, from what the table and the user say. */
class ZT_MEASURING_EXPORT ZtTableUnits
{
public:
    /** \a assignments as in ZtTableImportOptions::units. */
    explicit ZtTableUnits(const QStringList &assignments);

    /**
     * The unit of a value in a table of any kind.
     * \param stated  the table's own unit, empty when it states none
     * \param heading another name by which the user may mean the value: its column's heading as written
     */
    ZtUnit unitOf(const QString &valueName, const QString &stated, const QString &heading = QString());

    /**
     * The unit of a value in a results table, where the name says what is measured: the user's unit applies
     * to lengths, its square to areas; angles and percentages have theirs anyway.
     */
    ZtUnit resultsUnitOf(const QString &valueName, const QString &stated, const QString &heading = QString());

    /** Value names that the user gave a unit but that were never asked for. */
    QStringList unusedNames() const;

private:
    bool findAssigned(const QString &valueName, ZtUnit *unit);

    ZtUnit m_default;
    QHash<QString, ZtUnit> m_assigned; ///< by value name in lower case
    QStringList m_unused;              ///< as the user wrote them
};
