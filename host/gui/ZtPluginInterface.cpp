// SPDX-License-Identifier: MIT
#include "gui/ZtPluginInterface.h"

ZtPluginInterface::~ZtPluginInterface() = default;
