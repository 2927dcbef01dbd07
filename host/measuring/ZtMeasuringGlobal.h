// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

#ifdef ZT_MEASURING_LIBRARY
#define ZT_MEASURING_EXPORT Q_DECL_EXPORT
#else
#define ZT_MEASURING_EXPORT Q_DECL_IMPORT
#endif
