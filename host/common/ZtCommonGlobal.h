// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

#ifdef ZT_COMMON_LIBRARY
#define ZT_COMMON_EXPORT Q_DECL_EXPORT
#else
#define ZT_COMMON_EXPORT Q_DECL_IMPORT
#endif
