// SPDX-License-Identifier: MIT
#include "kernel/iZTObjectPainter.h"

iZTObjectPainter::~iZTObjectPainter() = default;
