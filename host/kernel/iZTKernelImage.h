// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/FrameData.h"
#include "kernel/ZtKernelGlobal.h"

#include <QObject>

/** The kernel's image: where finished frames come from. The application installs its own in ZtKernelData. */
class ZT_KERNEL_EXPORT iZTKernelImage : public QObject
{
    Q_OBJECT
public:
    explicit iZTKernelImage(QObject *parent = nullptr); ///< no frame of its own
    ~iZTKernelImage() override;

    /**
     * Asks for the current frame. It is delivered through signalImageCompleted(), at once or later; where
     * there is no image, nothing is emitted.
     */
    virtual void requestImage() = 0;

signals:
    /**
     * A frame is finished. Receivers that used it set \a aHandled. Connect directly: the flag is a
     * reference.
     */
    void signalImageCompleted(FrameData aFrameData, bool &aHandled);
};
