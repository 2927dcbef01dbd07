// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

#ifdef ZT_IMAGE_LIBRARY
#define ZT_IMAGE_EXPORT Q_DECL_EXPORT
#else
#define ZT_IMAGE_EXPORT Q_DECL_IMPORT
#endif
