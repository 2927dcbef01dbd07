// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChart.h"
#include "charts/KvChartView.h"
#include "charts/common/KvStatisticsChartWidget.h"
#include "charts/common/KvStatisticsGroupedChartNodeCfg.h"
#include "charts/counterpie/KvStatisticsCounterPieNodeFactory.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeFactory.h"
#include "charts/trend/KvStatisticsTrendNodeFactory.h"

#include <QtTest>

#include <memory>

/** The three chart blocks by the names of their types, for tests of what they have in common. */
namespace ChartBlocks {

inline std::unique_ptr<KvBaseEditorNodeFactory> factory(const QString &name)
{
    if (name == QLatin1String("Counters"))
        return std::make_unique<KvStatisticsCounterPieNodeFactory>();
    if (name == QLatin1String("MinMedMaxBox"))
        return std::make_unique<KvStatisticsMinMedMaxBoxNodeFactory>();
    return std::make_unique<KvStatisticsTrendNodeFactory>();
}

inline QStringList names()
{
    return {QStringLiteral("MinMedMaxBox"), QStringLiteral("Trend"), QStringLiteral("Counters")};
}

/** The column "block" with a row for each of them. */
inline void addBlockRows()
{
    QTest::addColumn<QString>("block");
    for (const QString &name : names())
        QTest::newRow(qPrintable(name)) << name;
}

inline std::unique_ptr<KvStatisticsChartNodeCfg> makeConfig(const QString &name, KvTemplateContext *context)
{
    return std::unique_ptr<KvStatisticsChartNodeCfg>(
        qobject_cast<KvStatisticsChartNodeCfg *>(factory(name)->createConfig(context)));
}

inline std::unique_ptr<KvStatisticsChartWidget> makeWidget(const QString &name, KvBaseEditorNodeCfg *cfg,
                                                           QWidget *parent = nullptr)
{
    return std::unique_ptr<KvStatisticsChartWidget>(
        dynamic_cast<KvStatisticsChartWidget *>(factory(name)->createDisplayWidget(parent, cfg)));
}

inline bool isGrouped(const QString &name)
{
    return name != QLatin1String("Counters");
}

inline KvStatisticsGroupedChartNodeCfg *grouped(KvStatisticsChartNodeCfg *cfg)
{
    return qobject_cast<KvStatisticsGroupedChartNodeCfg *>(cfg);
}

} // namespace ChartBlocks
