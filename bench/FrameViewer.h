// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskImageFrame.h"
#include "kernel/FrameData.h"

#include <QObject>

class iZTKernelImage;

/** Receives frames as a view does and, where wanted, draws them fitted into a window of 1600 x 1000 pixels.
 */
class FrameViewer : public QObject
{
    Q_OBJECT
public:
    FrameViewer(iZTKernelImage *image, bool isDrawing);

    int frameCount() const { return m_frames; }
    const QImage &image() const { return m_shown.image(); }
    const QImage &canvas() const { return m_canvas; }

private slots:
    void slotImageCompleted(FrameData aFrameData, bool &aHandled);

private:
    KvDeskImageFrame m_shown;
    QImage m_canvas;
    bool m_isDrawing;
    int m_frames = 0;
};
