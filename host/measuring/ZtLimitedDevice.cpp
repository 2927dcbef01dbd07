// SPDX-License-Identifier: MIT
#include "measuring/ZtLimitedDevice.h"

ZtLimitedDevice::ZtLimitedDevice(QIODevice *device, qint64 limit)
    : m_device(device)
    , m_limit(limit)
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
    if (left <= 0)
        return 0;
    return m_device->seek(pos()) ? m_device->read(data, qMin(count, left)) : -1;
}

qint64 ZtLimitedDevice::writeData(const char *, qint64)
{
    return -1;
}
