// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>

struct ZtSession;

/** Makes the JSON of a session. */
class ZtSessionWriter
{
public:
    /** \a path is the file to write: the image's path is stored relative to its folder. */
    static QByteArray toJson(const ZtSession &session, const QString &path);
};
