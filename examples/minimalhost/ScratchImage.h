// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelData.h"
#include "kernel/iZTKernelImage.h"

#include <QImage>

/** The image that was measured: one plain frame, delivered to whoever asks. */
class ScratchImage : public iZTKernelImage
{
public:
    ScratchImage() { ZtKernelData::getInstance()->setKernelImage(this); }
    ~ScratchImage() override { ZtKernelData::getInstance()->setKernelImage(nullptr); }

    void requestImage() override
    {
        QImage picture(400, 300, QImage::Format_RGB32);
        picture.fill(Qt::darkGray);
        FrameData frame;
        frame.image = QSharedPointer<ZtImage>::create(picture);
        frame.rect = picture.rect();
        bool isHandled = false;
        emit signalImageCompleted(frame, isHandled);
    }
};
