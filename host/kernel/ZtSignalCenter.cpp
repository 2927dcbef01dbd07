// SPDX-License-Identifier: MIT
#include "kernel/ZtSignalCenter.h"

ZtSignalCenter *ZtSignalCenter::getInstance()
{
    static ZtSignalCenter instance;
    return &instance;
}
