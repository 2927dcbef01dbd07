// SPDX-License-Identifier: MIT
#pragma once

#include "charts/common/KvStatisticsChartNodeCfg.h"

/** Base of the configurations of charts that show groups of measured values: adds how they are grouped. */
class KvStatisticsGroupedChartNodeCfg : public KvStatisticsChartNodeCfg
{
    Q_OBJECT
public:
    /** The numbers are stored in files. */
    enum GroupBy : int {
        ByMeasurement = 0, ///< by the name of the value
        ByObject = 1       ///< by the type of the object, then by the name of the value
    };
    Q_ENUM(GroupBy)

    explicit KvStatisticsGroupedChartNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    bool toJson(QJsonObject &config) const override;
    /** As the base, and "groupBy" is required, too. */
    bool fromJson(const QJsonObject &config) override;

    GroupBy groupBy() const { return m_groupBy; }
    void setGroupBy(GroupBy groupBy) { m_groupBy = groupBy; }

private:
    GroupBy m_groupBy = ByObject; ///< a number that a file gave is kept, whatever it is
};
