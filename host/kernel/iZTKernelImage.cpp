// SPDX-License-Identifier: MIT
#include "kernel/iZTKernelImage.h"

iZTKernelImage::iZTKernelImage(QObject *parent)
    : QObject(parent)
{
    qRegisterMetaType<FrameData>("FrameData");
}

iZTKernelImage::~iZTKernelImage() = default;
