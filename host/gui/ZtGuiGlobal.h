// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

#ifdef ZT_GUI_LIBRARY
#define ZT_GUI_EXPORT Q_DECL_EXPORT
#else
#define ZT_GUI_EXPORT Q_DECL_IMPORT
#endif
