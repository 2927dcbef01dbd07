// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameSourceInfo.h"
#include "measuring/ZtLiveFrameSource.h"

#include <QVector>

#include <memory>

class ZtAravisControl;
class ZtWorkerThread;

/**
 * An industrial camera on USB or Ethernet (GenICam), through Aravis.
 *
 * All talking to the camera is done by a thread of its own, as every answer of a network camera can take
 * long. So a camera that cannot be opened is first running and then lost. The camera is free for others while
 * the source is not running.
 */
class ZT_MEASURING_EXPORT ZtAravisSource : public ZtLiveFrameSource
{
    Q_OBJECT
public:
    /** Device that enableFakeCamera() makes appear. */
    static constexpr const char *fakeCameraId = "Fake_1";

    explicit ZtAravisSource(const ZtFrameSourceInfo &info);
    ~ZtAravisSource() override;

    /** The cameras that are connected. Asking the network takes a second; may be called from any thread. */
    static QVector<ZtFrameSourceInfo> devices();
    /** Makes a camera appear that needs no hardware and shows a moving pattern, until the program ends. */
    static void enableFakeCamera();

    QString displayName() const override { return m_info.title; }
    std::optional<ZtExposureRange> exposureRange() const override;
    double exposure() const override;
    void setExposure(double milliseconds) override;

    /** How many frames per second the camera is to take; 0 when unknown. What comes is in frameRate(). */
    double framesPerSecond() const;
    /** Wishes for another speed; the camera takes the nearest one. Without effect on cameras that have no
     * choice. */
    void setFramesPerSecond(double framesPerSecond);

    /** Makes the camera vanish as if its cable was pulled; for tests. */
    void simulateUnplugging();

    bool event(QEvent *event) override;

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) override;
    void endCapture() override;

private:
    ZtFrameSourceInfo m_info;
    std::shared_ptr<ZtAravisControl> m_control; ///< shared with the thread
    std::unique_ptr<ZtWorkerThread> m_thread;
};
