// SPDX-License-Identifier: MIT
#include "measuring/ZtVideoSurface.h"

#include "measuring/ZtFrameMailbox.h"

#include <QVideoSurfaceFormat>

namespace {

void release(void *videoFrame)
{
    auto *const frame = static_cast<QVideoFrame *>(videoFrame);
    frame->unmap();
    delete frame;
}

} // namespace

ZtVideoSurface::ZtVideoSurface(QObject *parent)
    : QAbstractVideoSurface(parent)
{}

QList<QVideoFrame::PixelFormat>
ZtVideoSurface::supportedPixelFormats(QAbstractVideoBuffer::HandleType type) const
{
    if (type != QAbstractVideoBuffer::NoHandle)
        return {};
    return {QVideoFrame::Format_RGB32, QVideoFrame::Format_ARGB32_Premultiplied, QVideoFrame::Format_ARGB32};
}

bool ZtVideoSurface::present(const QVideoFrame &frame)
{
    const QImage image =
        toImage(frame, surfaceFormat().scanLineDirection() == QVideoSurfaceFormat::BottomToTop);
    if (image.isNull()) {
        setError(IncorrectFormatError);
        return false;
    }
    if (m_mailbox)
        m_mailbox->put(image);
    return true;
}

QImage ZtVideoSurface::toImage(const QVideoFrame &frame, bool isBottomUp)
{
    const QImage::Format format = QVideoFrame::imageFormatFromPixelFormat(frame.pixelFormat());
    auto mapped = std::make_unique<QVideoFrame>(frame);
    if (format == QImage::Format_Invalid || !mapped->map(QAbstractVideoBuffer::ReadOnly))
        return QImage();
    const uchar *const bits = mapped->bits();
    const int bytesPerLine = mapped->bytesPerLine();
    // Video is opaque, whatever its fourth byte says.
    const QImage image(bits, frame.width(), frame.height(), bytesPerLine, QImage::Format_RGB32, release,
                       mapped.release());
    return isBottomUp ? image.mirrored() : image;
}
