// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

#ifdef ZT_KERNEL_LIBRARY
#define ZT_KERNEL_EXPORT Q_DECL_EXPORT
#else
#define ZT_KERNEL_EXPORT Q_DECL_IMPORT
#endif
