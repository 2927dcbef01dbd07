// SPDX-License-Identifier: MIT
#include "measuring/ZtAravisSource.h"

#include "measuring/ZtAravisCapture.h"
#include "measuring/ZtAravisControl.h"
#include "measuring/ZtFrameMailbox.h"
#include "measuring/ZtWorkerThread.h"

#include <QMutex>
#include <QMutexLocker>

// GLib has a member of this name.
#undef signals
#include <arv.h>

namespace {

QString titleOf(unsigned int device)
{
    const QString title = QString::fromUtf8(arv_get_device_vendor(device)) + QLatin1Char(' ') +
                          QString::fromUtf8(arv_get_device_model(device));
    const QString serial = QString::fromUtf8(arv_get_device_serial_nbr(device));
    return serial.isEmpty() ? title.trimmed() : QStringLiteral("%1 (%2)").arg(title.trimmed(), serial);
}

} // namespace

ZtAravisSource::ZtAravisSource(const ZtFrameSourceInfo &info)
    : m_info(info)
    , m_control(std::make_shared<ZtAravisControl>())
{}

ZtAravisSource::~ZtAravisSource()
{
    closeMailbox();
    ZtAravisSource::endCapture();
}

QVector<ZtFrameSourceInfo> ZtAravisSource::devices()
{
    // The library has one list for all threads: nobody may look anew while it is read.
    static QMutex listing;
    const QMutexLocker lock(&listing);
    arv_update_device_list();
    QVector<ZtFrameSourceInfo> found;
    for (unsigned int i = 0; i < arv_get_n_devices(); ++i)
        found.append({ZtFrameSourceInfo::GenicamCamera, QString::fromUtf8(arv_get_device_id(i)), titleOf(i)});
    return found;
}

void ZtAravisSource::enableFakeCamera()
{
    arv_enable_interface("Fake");
}

std::optional<ZtExposureRange> ZtAravisSource::exposureRange() const
{
    return m_control->facts().exposureRange;
}

double ZtAravisSource::exposure() const
{
    return m_control->facts().exposure;
}

void ZtAravisSource::setExposure(double milliseconds)
{
    m_control->wishExposure(milliseconds);
}

double ZtAravisSource::framesPerSecond() const
{
    return m_control->facts().framesPerSecond;
}

void ZtAravisSource::setFramesPerSecond(double framesPerSecond)
{
    m_control->wishFramesPerSecond(framesPerSecond);
}

void ZtAravisSource::simulateUnplugging()
{
    m_control->wishUnplugging();
}

bool ZtAravisSource::event(QEvent *event)
{
    if (event->type() != ZtFrameMailbox::noticeType())
        return ZtLiveFrameSource::event(event);
    emit signalExposureChanged();
    return true;
}

void ZtAravisSource::beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox)
{
    m_thread = ZtWorkerThread::begin([capture = ZtAravisCapture(m_info.id, m_info.title, m_control,
                                                                mailbox)]() mutable { capture.run(); });
}

void ZtAravisSource::endCapture()
{
    ZtWorkerThread::retire(std::move(m_thread));
}
