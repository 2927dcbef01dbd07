// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractVideoSurface>

#include <memory>

class ZtFrameMailbox;

/** Where Qt Multimedia draws the frames of a video or a camera: into a mailbox. */
class ZtVideoSurface : public QAbstractVideoSurface
{
    Q_OBJECT
public:
    explicit ZtVideoSurface(QObject *parent = nullptr);

    /** Frames go here from now on; nowhere with null. */
    void setMailbox(const std::shared_ptr<ZtFrameMailbox> &mailbox) { m_mailbox = mailbox; }

    /** Formats that screens draw without converting them; the multimedia system converts all others, in
     * threads of its own. */
    QList<QVideoFrame::PixelFormat>
    supportedPixelFormats(QAbstractVideoBuffer::HandleType type) const override;

    bool present(const QVideoFrame &frame) override;

    /** A picture that shares the pixels of a frame and keeps them alive; null for a frame that cannot be
     * read. */
    static QImage toImage(const QVideoFrame &frame, bool isBottomUp);

private:
    std::shared_ptr<ZtFrameMailbox> m_mailbox;
};
