// SPDX-License-Identifier: MIT
#include "measuring/ZtMeasuredObjectData.h"

ZtMeasuredObjectData::~ZtMeasuredObjectData() = default;
