// SPDX-License-Identifier: MIT
#include "measuring/ZtAravisCapture.h"

#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtAravisControl.h"
#include "measuring/ZtAravisSource.h"
#include "measuring/ZtFrameMailbox.h"
#include "measuring/ZtFramePool.h"
#include "measuring/ZtRawFrame.h"

#include <QMutexLocker>

#include <atomic>

// GLib has a member of this name.
#undef signals
#include <arv.h>

namespace {

constexpr int bufferCount = 4;          ///< one being filled, others waiting for this thread
constexpr guint64 patience = 50 * 1000; ///< microseconds between looks at wishes and closing
constexpr double microsecondsPerMillisecond = 1e3;

struct Unref
{
    void operator()(gpointer object) const { g_object_unref(object); }
};
template <typename T>
using ObjectPointer = std::unique_ptr<T, Unref>;

/// Takes the error of one call.
class Error
{
public:
    Error() = default;
    ~Error() { g_clear_error(&m_error); }
    Error(const Error &) = delete;
    Error &operator=(const Error &) = delete;

    GError **operator&() // NOLINT(google-runtime-operator): an out parameter and nothing else
    {
        g_clear_error(&m_error);
        return &m_error;
    }
    bool isSet() const { return m_error != nullptr; }
    QString text() const { return m_error ? QString::fromUtf8(m_error->message) : QString(); }

private:
    GError *m_error = nullptr;
};

void noteLoss(ArvDevice *, gpointer lost)
{
    *static_cast<std::atomic_bool *>(lost) = true;
}

bool isShown(ArvCamera *camera)
{
    Error error;
    const ArvPixelFormat format = arv_camera_get_pixel_format(camera, &error);
    return !error.isSet() && ZtRawFormat::fromGenicam(format);
}

// Cameras may come with a packed format: then the first that can be shown is chosen.
void chooseFormat(ArvCamera *camera)
{
    if (isShown(camera))
        return;
    guint count = 0;
    Error error;
    const std::unique_ptr<gint64, decltype(&g_free)> formats(
        arv_camera_dup_available_pixel_formats(camera, &count, &error), g_free);
    for (guint i = 0; formats && i < count; ++i) {
        const auto format = static_cast<ArvPixelFormat>(formats.get()[i]);
        if (!ZtRawFormat::fromGenicam(format))
            continue;
        arv_camera_set_pixel_format(camera, format, &error);
        return;
    }
}

/// One opened camera that streams.
class Session
{
public:
    Session(ZtAravisControl *control, ZtFrameMailbox *mailbox)
        : m_control(control)
        , m_mailbox(mailbox)
    {}

    ~Session()
    {
        if (!m_camera)
            return;
        g_signal_handlers_disconnect_by_data(arv_camera_get_device(m_camera.get()), &m_isLost);
        // A camera that is gone would only answer with time-outs.
        if (m_stream && !m_isLost)
            arv_camera_stop_acquisition(m_camera.get(), nullptr);
        m_stream.reset();
    }

    // Empty when the camera streams, else why it does not.
    QString open(const QString &deviceId)
    {
        Error error;
        m_camera.reset(arv_camera_new(deviceId.toUtf8().constData(), &error));
        if (!m_camera)
            return error.text();
        g_signal_connect(arv_camera_get_device(m_camera.get()), "control-lost", G_CALLBACK(noteLoss),
                         &m_isLost);
        chooseFormat(m_camera.get());
        readFacts();
        m_stream.reset(arv_camera_create_stream(m_camera.get(), nullptr, nullptr, &error));
        if (!m_stream || !pushBuffers())
            return error.text();
        arv_camera_set_acquisition_mode(m_camera.get(), ARV_ACQUISITION_MODE_CONTINUOUS, &error);
        arv_camera_start_acquisition(m_camera.get(), &error);
        return error.text();
    }

    // Empty when the mailbox was closed, else why the camera cannot go on.
    QString stream(const QString &title)
    {
        while (!m_mailbox->isClosed()) {
            grantWishes();
            if (m_isLost)
                return ZtAravisSource::tr("%1 is disconnected; its last picture stays")
                    .arg(ZtLeftToRight::isolated(title));
            if (!passFrameOn())
                return ZtAravisSource::tr("%1 delivers pictures of a kind that cannot be shown")
                    .arg(ZtLeftToRight::isolated(title));
        }
        return QString();
    }

private:
    bool pushBuffers()
    {
        const guint size = arv_camera_get_payload(m_camera.get(), nullptr);
        for (int i = 0; size > 0 && i < bufferCount; ++i)
            arv_stream_push_buffer(m_stream.get(), arv_buffer_new_allocate(size));
        return size > 0;
    }

    void readFacts()
    {
        ZtAravisControl::Facts facts;
        ArvCamera *const camera = m_camera.get();
        if (arv_camera_is_exposure_time_available(camera, nullptr)) {
            ZtExposureRange range;
            arv_camera_get_exposure_time_bounds(camera, &range.minimum, &range.maximum, nullptr);
            range.minimum /= microsecondsPerMillisecond;
            range.maximum /= microsecondsPerMillisecond;
            facts.exposureRange = range;
            facts.exposure = arv_camera_get_exposure_time(camera, nullptr) / microsecondsPerMillisecond;
        }
        if (arv_camera_is_frame_rate_available(camera, nullptr))
            facts.framesPerSecond = arv_camera_get_frame_rate(camera, nullptr);
        if (m_control->setFacts(facts))
            m_mailbox->notify();
    }

    void grantWishes()
    {
        const ZtAravisControl::Wishes wishes = m_control->takeWishes();
        if (wishes.exposure)
            grantExposure(*wishes.exposure);
        if (wishes.framesPerSecond)
            grantFrameRate(*wishes.framesPerSecond);
        if (wishes.exposure || wishes.framesPerSecond)
            readFacts();
        if (wishes.unplugging)
            g_signal_emit_by_name(arv_camera_get_device(m_camera.get()), "control-lost");
    }

    void grantExposure(double milliseconds)
    {
        const std::optional<ZtExposureRange> range = m_control->facts().exposureRange;
        if (!range)
            return;
        // The camera would go on choosing by itself. Most have no such choice, and say so by an error.
        if (arv_camera_is_exposure_auto_available(m_camera.get(), nullptr))
            arv_camera_set_exposure_time_auto(m_camera.get(), ARV_AUTO_OFF, nullptr);
        const double granted = qBound(range->minimum, milliseconds, range->maximum);
        Error error;
        arv_camera_set_exposure_time(m_camera.get(), granted * microsecondsPerMillisecond, &error);
        reportRefusal(error);
    }

    void grantFrameRate(double framesPerSecond)
    {
        double slowest = 0.0;
        double fastest = 0.0;
        arv_camera_get_frame_rate_bounds(m_camera.get(), &slowest, &fastest, nullptr);
        if (fastest <= 0.0)
            return;
        Error error;
        arv_camera_set_frame_rate(m_camera.get(), qBound(slowest, framesPerSecond, fastest), &error);
        reportRefusal(error);
    }

    void reportRefusal(const Error &error)
    {
        if (error.isSet())
            m_mailbox->report(
                ZtAravisSource::tr("The camera does not take the setting (%1)").arg(error.text()));
    }

    // False when the camera's pictures are of no use.
    bool passFrameOn()
    {
        ArvBuffer *const buffer = arv_stream_timeout_pop_buffer(m_stream.get(), patience);
        if (!buffer)
            return true;
        bool isUseful = true;
        // Broken frames of a busy network are nothing to talk about.
        if (arv_buffer_get_status(buffer) == ARV_BUFFER_STATUS_SUCCESS) {
            const QImage frame = toImage(buffer);
            isUseful = !frame.isNull();
            if (isUseful)
                m_mailbox->put(frame);
        }
        // The pixels are copied: the camera has its buffer back at once, however long somebody looks at them.
        arv_stream_push_buffer(m_stream.get(), buffer);
        return isUseful;
    }

    QImage toImage(ArvBuffer *buffer)
    {
        const std::optional<ZtRawFormat> format =
            ZtRawFormat::fromGenicam(arv_buffer_get_image_pixel_format(buffer));
        if (!format)
            return QImage();
        size_t size = 0;
        gint padding = 0;
        gint ignored = 0;
        ZtRawFrame frame;
        frame.data = static_cast<const uchar *>(arv_buffer_get_image_data(buffer, &size));
        frame.size = static_cast<qint64>(size);
        frame.width = arv_buffer_get_image_width(buffer);
        frame.height = arv_buffer_get_image_height(buffer);
        arv_buffer_get_image_padding(buffer, &padding, &ignored);
        frame.format = *format;
        frame.bytesPerLine = static_cast<qint64>(frame.width) * format->bytesPerPixel() + padding;
        return frame.toImage(&m_pool);
    }

    ZtAravisControl *m_control;
    ZtFrameMailbox *m_mailbox;
    ZtFramePool m_pool;
    std::atomic_bool m_isLost{false}; ///< set by a thread of Aravis
    ObjectPointer<ArvCamera> m_camera;
    ObjectPointer<ArvStream> m_stream;
};

} // namespace

ZtAravisCapture::ZtAravisCapture(const QString &deviceId, const QString &title,
                                 std::shared_ptr<ZtAravisControl> control,
                                 std::shared_ptr<ZtFrameMailbox> mailbox)
    : m_deviceId(deviceId)
    , m_title(title)
    , m_control(std::move(control))
    , m_mailbox(std::move(mailbox))
{}

void ZtAravisCapture::run()
{
    // An earlier run may still be closing the camera.
    const QMutexLocker lock(m_control->camera());
    if (m_mailbox->isClosed())
        return;
    Session session(m_control.get(), m_mailbox.get());
    QString fault = session.open(m_deviceId);
    if (!fault.isEmpty())
        fault = ZtAravisSource::tr("%1 cannot be opened (%2)").arg(ZtLeftToRight::isolated(m_title), fault);
    else
        fault = session.stream(m_title);
    if (!fault.isEmpty())
        m_mailbox->fail(fault);
}
