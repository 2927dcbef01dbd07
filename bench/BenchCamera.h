// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtLiveFrameSource.h"
#include "measuring/ZtRawFormat.h"

#include <memory>

class ZtWorkerThread;

/** A camera of 12 megapixels that costs nothing but what every camera costs: its buffer becomes a picture. */
class BenchCamera : public ZtLiveFrameSource
{
public:
    static constexpr int width = 4000;
    static constexpr int height = 3000;

    BenchCamera(const ZtRawFormat &format, double framesPerSecond);
    ~BenchCamera() override;

    QString displayName() const override { return QStringLiteral("bench"); }

    /** Address of the pixels of the newest frame as the worker made them. */
    const uchar *newestPixels() const;
    /** Processor seconds that the worker needed for a frame, on average. */
    double workerSecondsPerFrame() const;

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) override;
    void endCapture() override;

private:
    struct Shared;

    std::shared_ptr<Shared> m_shared;
    std::unique_ptr<ZtWorkerThread> m_thread;
};
