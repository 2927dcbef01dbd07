// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelObjectData.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QVector>

/** Base of the objects of this library: it knows which of its values the user does not want to see. */
class ZT_MEASURING_EXPORT ZtMeasuredObjectData : public ZtKernelObjectData
{
public:
    ~ZtMeasuredObjectData() override;

    /** Positions of the hidden values in the type's value names, in no particular order. */
    const QVector<int> &hiddenValues() const { return m_hidden; }

private:
    // The manipulator keeps track of whether any object of its type hides a value at all.
    friend class ZtMeasuringManipulator;

    QVector<int> m_hidden;
};
