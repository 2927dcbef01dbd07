// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameMailbox.h"
#include "measuring/ZtLiveFrameSource.h"

/** A camera that takes its frames from the test. */
class FakeLiveSource : public ZtLiveFrameSource
{
public:
    explicit FakeLiveSource(int watchdogInterval = 0)
        : ZtLiveFrameSource(watchdogInterval)
    {}
    ~FakeLiveSource() override { closeMailbox(); }

    QString displayName() const override { return QStringLiteral("Fake"); }
    using ZtLiveFrameSource::lose;

    static QImage picture(const QColor &color)
    {
        QImage image(7, 5, QImage::Format_RGB32);
        image.fill(color);
        return image;
    }

    std::shared_ptr<ZtFrameMailbox> mailbox; ///< of the newest run
    int begun = 0;
    int ended = 0;
    bool isAbsent = false; ///< cannot be started

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &newMailbox) override
    {
        ++begun;
        mailbox = newMailbox;
        if (isAbsent)
            lose(QStringLiteral("absent"));
    }
    void endCapture() override { ++ended; }
};
