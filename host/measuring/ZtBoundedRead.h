// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QIODevice>

/**
 * Reads up to \a count bytes. Pipes and devices state no size beforehand and deliver in any portions, so they
 * are read until nothing comes any more.
 */
inline QByteArray ztReadAtMost(QIODevice *device, qint64 count)
{
    constexpr qint64 portion = 1024 * 1024;
    QByteArray bytes;
    while (bytes.size() < count) {
        const QByteArray more = device->read(qMin(portion, count - bytes.size()));
        if (more.isEmpty())
            break;
        bytes += more;
    }
    return bytes;
}
