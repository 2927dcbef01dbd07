// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QMetaType>

/**
 * Data of one object on the image; what it holds is known to the manipulator of its type. Owned by
 * ZtKernelData.
 */
class ZT_KERNEL_EXPORT ZtKernelObjectData
{
public:
    ZtKernelObjectData() = default;
    virtual ~ZtKernelObjectData();

    ZtKernelObjectData(const ZtKernelObjectData &) = delete;
    ZtKernelObjectData &operator=(const ZtKernelObjectData &) = delete;
};

Q_DECLARE_METATYPE(const ZtKernelObjectData *)
