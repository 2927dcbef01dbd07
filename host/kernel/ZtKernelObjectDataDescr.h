// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QString>

/** Describes an object type to the kernel: its id and its untranslated key (used in files). */
class ZT_KERNEL_EXPORT ZtKernelObjectDataDescr
{
public:
    ZtKernelObjectDataDescr(int type, const QString &key); ///< see the two getters
    virtual ~ZtKernelObjectDataDescr();

    int objectType() const { return m_type; } ///< the id that the type is registered under
    QString key() const { return m_key; }     ///< untranslated, never changed once files have it

private:
    int m_type;
    QString m_key;
};
