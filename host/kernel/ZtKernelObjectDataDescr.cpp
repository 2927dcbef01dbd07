// SPDX-License-Identifier: MIT
#include "kernel/ZtKernelObjectDataDescr.h"

ZtKernelObjectDataDescr::ZtKernelObjectDataDescr(int type, const QString &key)
    : m_type(type)
    , m_key(key)
{}

ZtKernelObjectDataDescr::~ZtKernelObjectDataDescr() = default;
