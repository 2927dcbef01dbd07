// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsGroupedChartNodeCfg.h"
#include "data/KvStatisticsEngine.h"

/** Measured values that a chart shows as one: a box, a line. Never empty. */
struct KvChartValueGroup
{
    QString name;         ///< of the value; by object with the object's type before it
    KvValueGroup records; ///< in measurement order, none of them from a counter

    /**
     * The groups of all measured values in the order of their names, without the counted objects: those
     * belong to the counters' chart. Nothing for a grouping that is neither by measurement nor by object.
     */
    static QVector<KvChartValueGroup> collect(const KvStatisticsEngine &engine,
                                              KvStatisticsGroupedChartNodeCfg::GroupBy groupBy);

    /** Measure kind of the first record, which counts for all. */
    int measureKind() const { return records.first().measureKind; }
    /** The name with the text of a unit code behind it. */
    QString title(int unit) const;
};
