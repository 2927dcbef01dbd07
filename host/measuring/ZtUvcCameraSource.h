// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameSourceInfo.h"
#include "measuring/ZtLiveFrameSource.h"

#include <QVector>

#include <memory>

class QCamera;
class ZtVideoSurface;

/** A camera that the system knows, such as a USB microscope camera or a webcam, through Qt Multimedia. */
class ZT_MEASURING_EXPORT ZtUvcCameraSource : public ZtLiveFrameSource
{
    Q_OBJECT
public:
    explicit ZtUvcCameraSource(const ZtFrameSourceInfo &info);
    ~ZtUvcCameraSource() override;

    /** The cameras that are connected. GUI thread only. */
    static QVector<ZtFrameSourceInfo> devices();

    QString displayName() const override { return m_info.title; }
    std::optional<ZtExposureRange> exposureRange() const override;
    double exposure() const override;
    void setExposure(double milliseconds) override;

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) override;
    void endCapture() override;

private slots:
    void slotError();
    void slotStatusChanged();

private:
    void connectSignals();
    bool isConnected() const;

    ZtFrameSourceInfo m_info;
    std::unique_ptr<ZtVideoSurface> m_surface;
    std::unique_ptr<QCamera> m_camera; ///< null while not running
};
