// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtProgress.h"

#include <QByteArray>
#include <QIODevice>

/**
 * Reads up to \a count bytes. Pipes and devices state no size beforehand and deliver in any portions, so they
 * are read until nothing comes any more. Ends early when it is not wanted any more.
 */
inline QByteArray ztReadAtMost(QIODevice *device, qint64 count, ZtProgress *progress = nullptr)
{
    constexpr qint64 portion = 1024 * 1024;
    QByteArray bytes;
    if (!device->isSequential())
        bytes.reserve(static_cast<int>(qBound<qint64>(0, device->size() - device->pos(), count)));
    while (bytes.size() < count && !ZtProgress::isCancelled(progress)) {
        const int size = bytes.size();
        const qint64 wanted = qMin(portion, count - size);
        bytes.resize(size + static_cast<int>(wanted));
        const qint64 more = device->read(bytes.data() + size, wanted);
        bytes.resize(size + static_cast<int>(qMax<qint64>(0, more)));
        if (more <= 0)
            break;
        if (progress && device->size() > 0)
            progress->setDone(static_cast<double>(bytes.size()) / static_cast<double>(device->size()));
    }
    return bytes;
}
