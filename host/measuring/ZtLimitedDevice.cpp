// SPDX-License-Identifier: MIT
#include "measuring/ZtLimitedDevice.h"

#include "measuring/ZtProgress.h"

ZtLimitedDevice::ZtLimitedDevice(QIODevice *device, qint64 limit, ZtProgress *progress)
    : m_device(device)
    , m_limit(limit)
    , m_progress(progress)
{
    // Buffered by the other one, if at all.
    open(QIODevice::ReadOnly | QIODevice::Unbuffered);
}

bool ZtLimitedDevice::seek(qint64 position)
{
    return position >= 0 && position <= size() && QIODevice::seek(position);
}

qint64 ZtLimitedDevice::readData(char *data, qint64 count)
{
    const qint64 left = size() - pos();
    m_isExceeded = m_isExceeded || count > left;
    if (left <= 0)
        return 0;
    if (ZtProgress::isCancelled(m_progress) || !m_device->seek(pos()))
        return -1;
    const qint64 read = m_device->read(data, qMin(count, left));
    m_readBytes += qMax<qint64>(0, read);
    if (m_progress)
        m_progress->setDone(static_cast<double>(m_readBytes) / static_cast<double>(m_device->size()));
    return read;
}

qint64 ZtLimitedDevice::writeData(const char *, qint64)
{
    return -1;
}
