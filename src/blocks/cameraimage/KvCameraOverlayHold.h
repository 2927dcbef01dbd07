// SPDX-License-Identifier: MIT
#pragma once

#include <QPointer>

class KvReportKernelData;

/**
 * One wish for the camera image with measurements drawn on it. The data adapter makes that image while
 * anybody holds such a wish; this one ends with the object at the latest.
 */
class KvCameraOverlayHold
{
public:
    /** \a kernelData is not owned; may be null, and may die first. */
    explicit KvCameraOverlayHold(KvReportKernelData *kernelData);
    ~KvCameraOverlayHold();
    KvCameraOverlayHold(const KvCameraOverlayHold &) = delete;
    KvCameraOverlayHold &operator=(const KvCameraOverlayHold &) = delete;

    void setHeld(bool held);

private:
    QPointer<KvReportKernelData> m_kernelData;
    bool m_isHeld = false;
};
