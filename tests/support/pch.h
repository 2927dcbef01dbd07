// SPDX-License-Identifier: MIT
#pragma once

#include <QtTest>
#include <QtWidgets>
