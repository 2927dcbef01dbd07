// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QString>

/** Describes an object type to the kernel: its id and its untranslated key (used in files). */
class ZT_KERNEL_EXPORT ZtKernelObjectDataDescr
{
public:
    ZtKernelObjectDataDescr(int type, const QString &key);
    virtual ~ZtKernelObjectDataDescr();

    int objectType() const { return m_type; }
    QString key() const { return m_key; }

private:
    int m_type;
    QString m_key;
};
