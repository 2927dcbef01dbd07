// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QList>
#include <QTransform>

class ZtImage;

/** Image operations of the application. */
class ZT_KERNEL_EXPORT ZtImageTools
{
public:
    static ZtImageTools *getInstance(); ///< made at the first call

    /**
     * Draws the objects of ZtKernelData onto \a image, as the application shows them. On large pictures lines
     * and texts are wider, so that they can still be seen when the picture is shown or printed as a whole.
     * \param transform from scene coordinates to the image's pixels
     * \param types     the object types to draw; empty means all
     */
    void drawEditorObjectsOnImage(ZtImage *image, const QTransform &transform,
                                  const QList<int> &types = QList<int>()) const;

private:
    ZtImageTools() = default;
};
