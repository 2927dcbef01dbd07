// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuredObjectData.h"

/** An object of an imported type; its numbers stay in the type's rows. */
class ZT_MEASURING_EXPORT ZtImportedObjectData : public ZtMeasuredObjectData
{
public:
    /** \a row is a row of the type's ZtImportedType. */
    explicit ZtImportedObjectData(int row)
        : m_row(row)
    {}

    int row() const { return m_row; }

private:
    int m_row;
};
