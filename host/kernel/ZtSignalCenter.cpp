// SPDX-License-Identifier: MIT
#include "kernel/ZtSignalCenter.h"

#include "kernel/ZtKernelObjectData.h"

ZtSignalCenter::ZtSignalCenter()
{
    // Under the name that the signals spell, so that spies and queued connections know it.
    qRegisterMetaType<const ZtKernelObjectData *>("const ZtKernelObjectData*");
}

ZtSignalCenter *ZtSignalCenter::getInstance()
{
    static ZtSignalCenter instance;
    return &instance;
}
