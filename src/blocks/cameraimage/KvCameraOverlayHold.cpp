// SPDX-License-Identifier: MIT
#include "blocks/cameraimage/KvCameraOverlayHold.h"

#include "data/KvReportKernelData.h"

KvCameraOverlayHold::KvCameraOverlayHold(KvReportKernelData *kernelData)
    : m_kernelData(kernelData)
{}

KvCameraOverlayHold::~KvCameraOverlayHold()
{
    setHeld(false);
}

void KvCameraOverlayHold::setHeld(bool held)
{
    if (held == m_isHeld)
        return;
    m_isHeld = held;
    if (m_kernelData)
        m_kernelData->setCameraImageWithDataWanted(held);
}
