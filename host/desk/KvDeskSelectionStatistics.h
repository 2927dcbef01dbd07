// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskRunningStatistics.h"

#include <QCoreApplication>
#include <QString>
#include <QVector>

/**
 * What the selected values have in common, and how that reads in the status bar.
 *
 * Values that all measure the same are summed up together, all figures in one unit. Of a mixture only the
 * number of values is told.
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
    /** The values that are summed up: all of them, or none of a mixture. */
    KvDeskRunningStatistics numbers() const;

    /** One line; empty without values. */
    QString text() const;
    /** Several lines with more digits. */
    QString details() const;

private:
    QString countText() const;

    QVector<Group> m_groups;
};
