// SPDX-License-Identifier: MIT
#include "resources/KvReportResources.h"

#include <QDir>

// The macro declares a function and so has to stand outside of namespaces.
static void initialize()
{
    Q_INIT_RESOURCE(statreport);
}

void KvReportResources::ensure()
{
    initialize();
}
