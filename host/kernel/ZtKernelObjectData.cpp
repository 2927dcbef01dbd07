// SPDX-License-Identifier: MIT
#include "kernel/ZtKernelObjectData.h"

ZtKernelObjectData::~ZtKernelObjectData() = default;
