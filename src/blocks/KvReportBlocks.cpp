// SPDX-License-Identifier: MIT
#include "blocks/KvReportBlocks.h"

#include "blocks/cameraimage/KvCameraImageNodeFactory.h"
#include "blocks/image/KvImageNodeFactory.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeFactory.h"
#include "blocks/statisticstable/KvStatisticsStatsTableNodeFactory.h"
#include "blocks/textdocument/KvTextDocumentNodeFactory.h"
#include "charts/counterpie/KvStatisticsCounterPieNodeFactory.h"
#include "charts/minmedmaxbox/KvStatisticsMinMedMaxBoxNodeFactory.h"
#include "charts/trend/KvStatisticsTrendNodeFactory.h"
#include "templates/KvBlockRegistry.h"

#include <QCoreApplication>

void registerReportBlocks(KvBlockRegistry &registry)
{
    registry.registerFactory(std::make_unique<KvImageNodeFactory>());
    registry.registerFactory(std::make_unique<KvCameraImageNodeFactory>());
    registry.registerFactory(std::make_unique<KvTextDocumentNodeFactory>());
    registry.registerFactory(std::make_unique<KvStatisticsMeasurementsTableNodeFactory>());

    const KvBlockGroup statistics{QCoreApplication::translate("KvBaseEditorNodeFactory", "Statistics"),
                                  QStringLiteral("Icons/ToolIconStats.svg")};
    registry.registerFactory(std::make_unique<KvStatisticsStatsTableNodeFactory>(), statistics);
    registry.registerFactory(std::make_unique<KvStatisticsMinMedMaxBoxNodeFactory>(), statistics);
    registry.registerFactory(std::make_unique<KvStatisticsTrendNodeFactory>(), statistics);
    registry.registerFactory(std::make_unique<KvStatisticsCounterPieNodeFactory>(), statistics);
}
