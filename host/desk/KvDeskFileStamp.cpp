// SPDX-License-Identifier: MIT
#include "KvDeskFileStamp.h"

#include <QFileInfo>

KvDeskFileStamp KvDeskFileStamp::of(const QString &path)
{
    const QFileInfo info(path);
    return info.isFile() ? KvDeskFileStamp{info.size(), info.lastModified().toUTC()} : KvDeskFileStamp();
}
