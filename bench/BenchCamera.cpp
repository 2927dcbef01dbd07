// SPDX-License-Identifier: MIT
#include "BenchCamera.h"

#include "ThreadTime.h"
#include "measuring/ZtFrameMailbox.h"
#include "measuring/ZtFramePool.h"
#include "measuring/ZtRawFrame.h"
#include "measuring/ZtWorkerThread.h"

#include <QDeadlineTimer>

#include <atomic>

struct BenchCamera::Shared
{
    ZtRawFormat format;
    int interval = 40; ///< milliseconds
    std::atomic<const uchar *> newest{nullptr};
    std::atomic<qint64> frames{0};
    std::atomic<double> seconds{0.0};

    void run(ZtFrameMailbox *mailbox)
    {
        ZtRawFrame raw;
        raw.format = format;
        raw.width = width;
        raw.height = height;
        raw.bytesPerLine = static_cast<qint64>(width) * format.bytesPerPixel();
        raw.size = raw.bytesPerLine * height;
        QByteArray buffer(static_cast<int>(raw.size), 'x');
        raw.data = reinterpret_cast<const uchar *>(buffer.constData());
        ZtFramePool pool;
        QDeadlineTimer due(interval, Qt::PreciseTimer);
        while (!mailbox->waitForClose(static_cast<int>(due.remainingTime()))) {
            due.setRemainingTime(interval, Qt::PreciseTimer);
            const double start = ThreadTime::seconds();
            const QImage frame = raw.toImage(&pool);
            seconds = seconds + ThreadTime::seconds() - start;
            ++frames;
            newest = frame.constBits();
            mailbox->put(frame);
        }
    }
};

BenchCamera::BenchCamera(const ZtRawFormat &format, double framesPerSecond)
    : m_shared(std::make_shared<Shared>())
{
    m_shared->format = format;
    m_shared->interval = static_cast<int>(1000.0 / framesPerSecond);
}

BenchCamera::~BenchCamera()
{
    closeMailbox();
    BenchCamera::endCapture();
}

const uchar *BenchCamera::newestPixels() const
{
    return m_shared->newest;
}

double BenchCamera::workerSecondsPerFrame() const
{
    return m_shared->frames > 0 ? m_shared->seconds / static_cast<double>(m_shared->frames) : 0.0;
}

void BenchCamera::beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox)
{
    m_thread = ZtWorkerThread::begin([shared = m_shared, mailbox]() { shared->run(mailbox.get()); });
}

void BenchCamera::endCapture()
{
    ZtWorkerThread::retire(std::move(m_thread));
}
