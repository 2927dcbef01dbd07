// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameMailbox.h"
#include "measuring/ZtFramePool.h"
#include "measuring/ZtLiveFrameSource.h"
#include "measuring/ZtRawFormat.h"
#include "measuring/ZtRawFrame.h"
#include "measuring/ZtWorkerThread.h"

#include <QDeadlineTimer>

#include <memory>

/** A camera that delivers a moving pattern from a thread of its own, at an even pace and for as long as one
 * wants. */
class SteadyCamera : public ZtLiveFrameSource
{
public:
    static constexpr int width = 1280;
    static constexpr int height = 960;
    static constexpr int interval = 40; ///< milliseconds

    ~SteadyCamera() override
    {
        closeMailbox();
        SteadyCamera::endCapture();
    }

    QString displayName() const override { return QStringLiteral("Steady camera"); }

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) override
    {
        m_thread = ZtWorkerThread::begin([mailbox]() { deliver(mailbox.get()); });
    }
    void endCapture() override { ZtWorkerThread::retire(std::move(m_thread)); }

private:
    static void deliver(ZtFrameMailbox *mailbox)
    {
        ZtRawFrame raw;
        raw.width = width;
        raw.height = height;
        raw.bytesPerLine = width;
        raw.size = static_cast<qint64>(width) * height;
        QByteArray buffer(static_cast<int>(raw.size), '\0');
        ZtFramePool pool;
        QDeadlineTimer due(interval, Qt::PreciseTimer);
        for (int count = 0; !mailbox->waitForClose(static_cast<int>(due.remainingTime())); ++count) {
            due.setRemainingTime(interval, Qt::PreciseTimer);
            for (int y = 0; y < height; ++y)
                std::fill_n(buffer.data() + y * width, width, static_cast<char>((y + count) / 4));
            raw.data = reinterpret_cast<const uchar *>(buffer.constData());
            mailbox->put(raw.toImage(&pool));
        }
    }

    std::unique_ptr<ZtWorkerThread> m_thread;
};
