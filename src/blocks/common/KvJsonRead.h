// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>

/** Reads members of a block's "config" object; a member that is missing or of another type keeps the current
 * value. */
namespace KvJsonRead {

inline int readInt(const QJsonObject &object, const QString &key, int current)
{
    // The current value as default: QJsonValue answers with it for another type and for numbers that are not
    // whole.
    return object.value(key).toInt(current);
}

inline bool readBool(const QJsonObject &object, const QString &key, bool current)
{
    return object.value(key).toBool(current);
}

inline QString readString(const QJsonObject &object, const QString &key, const QString &current)
{
    return object.value(key).toString(current);
}

} // namespace KvJsonRead
