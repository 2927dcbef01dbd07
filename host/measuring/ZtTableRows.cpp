// SPDX-License-Identifier: MIT
#include "measuring/ZtTableRows.h"

ZtTableRows::~ZtTableRows() = default;
