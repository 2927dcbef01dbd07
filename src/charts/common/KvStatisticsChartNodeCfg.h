// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvStatisticsThemedNodeCfg.h"

/** Base of the configurations of all charts: adds where the chart stands on the page. */
class KvStatisticsChartNodeCfg : public KvStatisticsThemedNodeCfg
{
    Q_OBJECT
public:
    explicit KvStatisticsChartNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    bool toJson(QJsonObject &config) const override;
    /**
     * False unless "alignment" and "widthPercent" are there; the theme is read even then, nothing else is.
     * One that is there with another type keeps its current value.
     */
    bool fromJson(const QJsonObject &config) override;

    Qt::Alignment alignment() const { return m_alignment; }
    void setAlignment(Qt::Alignment alignment) { m_alignment = alignment; }
    /** Width of the chart in percent of the width between the page's margins; what a file said is kept. */
    int widthPercent() const { return m_widthPercent; }
    void setWidthPercent(int percent) { m_widthPercent = percent; }

private:
    /// Only the centre carries the vertical flag; files hold it so.
    Qt::Alignment m_alignment = Qt::AlignHCenter | Qt::AlignVCenter;
    int m_widthPercent = 75;
};
