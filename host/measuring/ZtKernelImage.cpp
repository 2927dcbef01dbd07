// SPDX-License-Identifier: MIT
#include "measuring/ZtKernelImage.h"

#include "measuring/ZtFrameSource.h"

ZtKernelImage::ZtKernelImage(QObject *parent)
    : iZTKernelImage(parent)
{}

void ZtKernelImage::setSource(ZtFrameSource *source)
{
    if (source == m_source)
        return;
    if (m_source)
        m_source->disconnect(this);
    m_source = source;
    if (source)
        connect(source, SIGNAL(signalFrameReady()), this, SLOT(slotFrameReady()));
}

void ZtKernelImage::requestImage()
{
    const QImage image = m_source ? m_source->frame() : QImage();
    if (image.isNull())
        return;
    FrameData frame;
    frame.image = QSharedPointer<ZtImage>::create(image);
    frame.rect = image.rect();
    bool handled = false;
    emit signalImageCompleted(frame, handled);
}

void ZtKernelImage::slotFrameReady()
{
    requestImage();
}
