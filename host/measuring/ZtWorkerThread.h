// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QThread>

#include <functional>
#include <memory>

/**
 * A thread for one piece of work that may take long to notice that it should end: reading from a network
 * folder, talking to a camera that is gone. Nobody waits for it but the end of the application.
 */
class ZT_MEASURING_EXPORT ZtWorkerThread : public QThread
{
    Q_OBJECT
public:
    /** A thread for \a work, which must not use anything that may die before it ends; not started. */
    static std::unique_ptr<ZtWorkerThread> create(std::function<void()> work);
    /** The same, started. */
    static std::unique_ptr<ZtWorkerThread> begin(std::function<void()> work);

    /** Lets go of the thread: it is deleted when its work ends, or after waiting for that when the
     * application ends. */
    static void retire(std::unique_ptr<ZtWorkerThread> thread);

    /** Waits for the work to end. */
    ~ZtWorkerThread() override;

protected:
    void run() override { m_work(); }

private:
    explicit ZtWorkerThread(std::function<void()> work);

    std::function<void()> m_work;
};
