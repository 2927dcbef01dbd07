// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QIODevice>

class ZtProgress;

/**
 * The beginning of another device: behind its limit it is as if the other one ended there.
 *
 * It tells how much of it was read; once that is no longer wanted, reading fails.
 */
class ZT_MEASURING_EXPORT ZtLimitedDevice : public QIODevice
{
    Q_OBJECT
public:
    /** Open for reading from the start. \param device open, not sequential; not owned \param progress not
     * owned; may be null */
    ZtLimitedDevice(QIODevice *device, qint64 limit, ZtProgress *progress = nullptr);

    /** Bytes that can be read. */
    void setLimit(qint64 limit) { m_limit = limit; }
    /** Whether more was asked for than there is. */
    bool isExceeded() const { return m_isExceeded; }

    qint64 size() const override { return qMin(m_limit, m_device->size()); }
    bool isSequential() const override { return false; }
    bool seek(qint64 position) override;

protected:
    qint64 readData(char *data, qint64 count) override;
    qint64 writeData(const char *data, qint64 count) override;

private:
    QIODevice *m_device;
    qint64 m_limit;
    ZtProgress *m_progress;
    qint64 m_readBytes = 0; ///< whatever is read twice counts twice
    bool m_isExceeded = false;
};
