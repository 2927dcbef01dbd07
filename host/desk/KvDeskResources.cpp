// SPDX-License-Identifier: MIT
#include "KvDeskResources.h"

#include <QDir>

// The macro declares a function and so has to stand outside of namespaces.
static void initialize()
{
    Q_INIT_RESOURCE(desk);
}

void KvDeskResources::ensure()
{
    initialize();
}
