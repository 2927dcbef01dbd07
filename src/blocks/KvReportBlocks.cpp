// SPDX-License-Identifier: MIT
#include "blocks/KvReportBlocks.h"

#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeFactory.h"
#include "blocks/textdocument/KvTextDocumentNodeFactory.h"
#include "templates/KvBlockRegistry.h"

void registerReportBlocks(KvBlockRegistry &registry)
{
    registry.registerFactory(std::make_unique<KvTextDocumentNodeFactory>());
    registry.registerFactory(std::make_unique<KvStatisticsMeasurementsTableNodeFactory>());
}
