// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameSourceInfo.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QObject>
#include <QVector>

#include <memory>

class ZtWorkerThread;

/** Looks for cameras without keeping anybody waiting. */
class ZT_MEASURING_EXPORT ZtFrameSourceScan : public QObject
{
    Q_OBJECT
public:
    explicit ZtFrameSourceScan(QObject *parent = nullptr);
    ~ZtFrameSourceScan() override;

    /** Begins to look; nothing while it is looking already. */
    void start();
    bool isRunning() const { return m_thread != nullptr; }

    /** The cameras that the last scan found. */
    const QVector<ZtFrameSourceInfo> &sources() const { return m_sources; }

signals:
    void signalFinished(); ///< sources() is up to date

private slots:
    void slotFinished();

private:
    QVector<ZtFrameSourceInfo> m_sources;
    std::shared_ptr<QVector<ZtFrameSourceInfo>> m_found; ///< belongs to the thread until it ends
    std::unique_ptr<ZtWorkerThread> m_thread;
};
