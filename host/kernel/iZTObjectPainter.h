// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QList>

class QPainter;

/** Draws the objects of ZtKernelData as the application's own view does. The application installs its own in
 * ZtKernelData, where objects cannot be drawn one by one, for example as their labels make room for each
 * other. */
class ZT_KERNEL_EXPORT iZTObjectPainter
{
public:
    iZTObjectPainter() = default;
    virtual ~iZTObjectPainter();

    /**
     * \param painter carries the transform from scene coordinates (image pixels) to its device
     * \param types   the object types to draw; empty means all
     */
    virtual void drawObjects(QPainter *painter, const QList<int> &types) const = 0;

private:
    Q_DISABLE_COPY(iZTObjectPainter)
};
