// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskRunningStatistics.h"

#include <QCoreApplication>
#include <QString>
#include <QStringList>
#include <QVector>

/**
 * What the selected values have in common, and how that reads in the status bar.
 *
 * Values that all measure the same are summed up together, those of a mixture by their names; all figures of
 * a sum are in one unit.
 */
class KvDeskSelectionStatistics
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskSelectionStatistics)
public:
    /** Values of one name. */
    struct Group
    {
        QString valueName;
        int kind = 0; ///< ZtGsManipulator::MeasureKind
        QString unit; ///< of values without a kind
        KvDeskRunningStatistics numbers;
    };

    /** Adds values of one name, in base units; the first ones lead a mixture. */
    void add(const Group &group);

    int count() const; ///< of all values
    bool isMixed() const;
    /** Of all values; of a mixture those that have the name of the first. */
    KvDeskRunningStatistics numbers() const;

    /** numbers() in one line, of a mixture behind the count of all values; empty without values. */
    QString text() const;
    /** Several lines: more digits, or a line for each name of a mixture. */
    QString details() const;

private:
    QVector<Group> sums() const;
    QString countText() const;
    QString line(const Group &sum) const;
    QStringList lines() const;
    QStringList preciseFigures() const;

    QVector<Group> m_groups;
};
