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
    while (bytes.size() < count && !ZtProgress::isCancelled(progress)) {
        const QByteArray more = device->read(qMin(portion, count - bytes.size()));
        if (more.isEmpty())
            break;
        bytes += more;
        if (progress && device->size() > 0)
            progress->setDone(static_cast<double>(bytes.size()) / static_cast<double>(device->size()));
    }
    return bytes;
}
