// SPDX-License-Identifier: MIT
#include "measuring/ZtUvcCameraSource.h"

#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtVideoSurface.h"

#include <QCamera>
#include <QCameraExposure>
#include <QCameraInfo>

#include <algorithm>

namespace {

constexpr double millisecondsPerSecond = 1e3;

} // namespace

ZtUvcCameraSource::ZtUvcCameraSource(const ZtFrameSourceInfo &info)
    : m_info(info)
    , m_surface(std::make_unique<ZtVideoSurface>())
{}

ZtUvcCameraSource::~ZtUvcCameraSource()
{
    closeMailbox();
    ZtUvcCameraSource::endCapture();
}

QVector<ZtFrameSourceInfo> ZtUvcCameraSource::devices()
{
    QVector<ZtFrameSourceInfo> found;
    const QList<QCameraInfo> cameras = QCameraInfo::availableCameras();
    for (const QCameraInfo &camera : cameras)
        found.append({ZtFrameSourceInfo::UvcCamera, camera.deviceName(), camera.description()});
    return found;
}

bool ZtUvcCameraSource::isConnected() const
{
    return devices().contains(m_info);
}

void ZtUvcCameraSource::beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox)
{
    // Without this, the multimedia system would take another camera.
    if (!isConnected()) {
        lose(tr("%1 is not connected").arg(ZtLeftToRight::isolated(m_info.title)));
        return;
    }
    m_surface->setMailbox(mailbox);
    m_camera = std::make_unique<QCamera>(m_info.id.toLocal8Bit());
    connectSignals();
    m_camera->setViewfinder(m_surface.get());
    m_camera->start();
}

void ZtUvcCameraSource::connectSignals()
{
    // Queued, as the camera is deleted in answer to some of them.
    connect(m_camera.get(), SIGNAL(errorOccurred(QCamera::Error)), this,
                                   SLOT(slotError()), Qt::QueuedConnection);
    connect(m_camera.get(), SIGNAL(statusChanged(QCamera::Status)), this,
                                   SLOT(slotStatusChanged()), Qt::QueuedConnection);
    connect(m_camera->exposure(), SIGNAL(shutterSpeedChanged(qreal)), this, SIGNAL(signalExposureChanged()));
}

void ZtUvcCameraSource::endCapture()
{
    m_surface->setMailbox(nullptr);
    if (!m_camera)
        return;
    m_camera->disconnect(this);
    m_camera->exposure()->disconnect(this);
    m_camera.reset();
}

void ZtUvcCameraSource::slotError()
{
    if (m_camera && m_camera->error() != QCamera::NoError)
        lose(tr("%1 is disconnected or in use (%2)")
                 .arg(ZtLeftToRight::isolated(m_info.title), m_camera->errorString()));
}

void ZtUvcCameraSource::slotStatusChanged()
{
    // Only now the camera says which exposures it has.
    if (m_camera && m_camera->status() == QCamera::ActiveStatus)
        emit signalExposureChanged();
}

std::optional<ZtExposureRange> ZtUvcCameraSource::exposureRange() const
{
    if (!m_camera || !m_camera->exposure()->isAvailable())
        return std::nullopt;
    const QList<qreal> seconds = m_camera->exposure()->supportedShutterSpeeds();
    if (seconds.isEmpty())
        return std::nullopt;
    const auto range = std::minmax_element(seconds.begin(), seconds.end());
    return ZtExposureRange{*range.first * millisecondsPerSecond, *range.second * millisecondsPerSecond};
}

double ZtUvcCameraSource::exposure() const
{
    return m_camera ? qMax(0.0, m_camera->exposure()->shutterSpeed() * millisecondsPerSecond) : 0.0;
}

void ZtUvcCameraSource::setExposure(double milliseconds)
{
    const std::optional<ZtExposureRange> range = exposureRange();
    if (range)
        m_camera->exposure()->setManualShutterSpeed(qBound(range->minimum, milliseconds, range->maximum) /
                                                    millisecondsPerSecond);
}
