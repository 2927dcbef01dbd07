// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QIODevice>

/** The beginning of another device: behind its limit it is as if the other one ended there. */
class ZT_MEASURING_EXPORT ZtLimitedDevice : public QIODevice
{
    Q_OBJECT
public:
    /** Open for reading from the start. \param device open, not sequential; not owned */
    ZtLimitedDevice(QIODevice *device, qint64 limit);

    /** Bytes that can be read. */
    void setLimit(qint64 limit) { m_limit = limit; }

    qint64 size() const override { return qMin(m_limit, m_device->size()); }
    bool isSequential() const override { return false; }
    bool seek(qint64 position) override;

protected:
    qint64 readData(char *data, qint64 count) override;
    qint64 writeData(const char *data, qint64 count) override;

private:
    QIODevice *m_device;
    qint64 m_limit;
};
