// SPDX-License-Identifier: MIT
#pragma once

#include "data/MeasuredHost.h"
#include "host/FakeManipulator.h"
#include "kernel/iZTKernelImage.h"

/**
 * A host with a camera: a green picture, and one measured object that draws a red square of 4 from (1, 1) on
 * it. Takes both away at its end.
 */
class KvCameraImageSource : public iZTKernelImage
{
public:
    explicit KvCameraImageSource(const QSize &size = QSize(40, 30))
    {
        setPicture(size, Qt::green);
        m_host.addType(SquareType, QString(), QStringList());
        ZtKernelData *kernel = ZtKernelData::getInstance();
        kernel->registerType(SquareType, std::make_unique<FakeManipulator>(SquareType, Qt::red), nullptr);
        kernel->addObject(SquareType, std::make_unique<ZtKernelObjectData>(), 1);
        kernel->setKernelImage(this);
    }

    void requestImage() override
    {
        ++m_requests;
        if (!m_isSilent)
            deliver();
    }
    void deliver()
    {
        bool handled = false;
        emit signalImageCompleted(m_frame, handled);
    }

    void setPicture(const QSize &size, const QColor &color)
    {
        QImage picture(size, QImage::Format_RGB32);
        picture.fill(color);
        m_frame.image = QSharedPointer<ZtImage>::create(picture);
        m_frame.rect = picture.rect();
    }
    /** Whether frames only come by deliver(), as those of a slow camera. */
    void setSilent(bool silent) { m_isSilent = silent; }
    int requests() const { return m_requests; }

private:
    static constexpr int SquareType = 70002;

    MeasuredHost m_host;
    FrameData m_frame;
    int m_requests = 0;
    bool m_isSilent = false;
};
