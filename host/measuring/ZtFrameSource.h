// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtExposureRange.h"
#include "measuring/ZtFrameRateMeter.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QElapsedTimer>
#include <QImage>
#include <QObject>

#include <optional>

/**
 * Where pictures come from: an image file, a folder, a video, a camera.
 *
 * Sources live in the GUI thread and emit there, whatever threads they work with. A frame that was handed on
 * never changes: the next one is another picture.
 */
class ZT_MEASURING_EXPORT ZtFrameSource : public QObject
{
    Q_OBJECT
public:
    enum State {
        Stopped, ///< delivers nothing; start() begins
        Running, ///< delivers, or is about to
        Lost     ///< stopped delivering by itself; start() tries again
    };
    Q_ENUM(State)

    explicit ZtFrameSource(QObject *parent = nullptr);
    ~ZtFrameSource() override;

    /** The newest frame; null as long as there is none. It stays when the source is stopped or lost. */
    virtual QImage frame() const = 0;

    /** What the user calls this source, such as a file name. */
    virtual QString displayName() const = 0;

    /** Whether frames follow one another, so that there is something to start, to stop and to freeze. */
    virtual bool isLive() const { return false; }
    virtual State state() const { return Stopped; }

    /** Begins to deliver, or connects anew after a loss; returns at once. Nothing while running. */
    virtual void start() {}
    /** Ends delivering; returns at once. The last frame stays. */
    virtual void stop() {}

    /** The exposure times to choose from; none where the source has no exposure, or not yet. */
    virtual std::optional<ZtExposureRange> exposureRange() const { return std::nullopt; }
    /** Milliseconds; 0 where the source has no exposure. */
    virtual double exposure() const { return 0.0; }
    /** Wishes for an exposure in milliseconds; the camera takes the nearest one, see signalExposureChanged().
     */
    virtual void setExposure(double milliseconds) { Q_UNUSED(milliseconds) }

    /** Frames per second that were announced over the last second; 0 when there were fewer than two. */
    double frameRate() const;

    /** How many frames came and were never announced, because a newer one came first. */
    virtual quint64 droppedFrames() const { return 0; }

signals:
    void signalFrameReady();         ///< frame() is a new one
    void signalStateChanged();       ///< state() is another one
    void signalExposureChanged();    ///< exposure() or exposureRange() is another one
    void signalFault(QString aText); ///< something the user should know, one sentence without a full stop

private slots:
    void slotCountFrame();

private:
    QElapsedTimer m_clock;
    ZtFrameRateMeter m_meter;
};
