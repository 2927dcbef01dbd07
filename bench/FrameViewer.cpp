// SPDX-License-Identifier: MIT
#include "FrameViewer.h"

#include "kernel/iZTKernelImage.h"

#include <QPainter>

FrameViewer::FrameViewer(iZTKernelImage *image, bool isDrawing)
    : m_canvas(1600, 1000, QImage::Format_RGB32)
    , m_isDrawing(isDrawing)
{
    connect(image, SIGNAL(signalImageCompleted(FrameData,bool&)), this,
                          SLOT(slotImageCompleted(FrameData,bool&)), Qt::DirectConnection);
}

void FrameViewer::slotImageCompleted(FrameData aFrameData, bool &aHandled)
{
    aHandled = true;
    ++m_frames;
    const QImage image = aFrameData.image->getQImage();
    m_shown.set(image, QRectF(image.rect()));
    if (!m_isDrawing)
        return;
    const double scale =
        qMin(1.0 * m_canvas.width() / image.width(), 1.0 * m_canvas.height() / image.height());
    QPainter painter(&m_canvas);
    painter.scale(scale, scale);
    m_shown.draw(&painter, QRectF(image.rect()), scale);
}
