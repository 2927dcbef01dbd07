// SPDX-License-Identifier: MIT
#include "KvDeskDataFolder.h"

#include <QDir>

QString KvDeskDataFolder::find(const QString &installed, const QString &inSources, const QString &entry,
                               const QString &programFolder)
{
    // "lib/statreport/bin" of an installation and "build/<preset>/bin" of the sources are equally deep.
    const QString root = programFolder + QStringLiteral("/../../../");
    for (const QString &place : {QStringLiteral("share/") + installed, inSources}) {
        const QDir folder(root + place);
        if (folder.exists(entry))
            return QDir::cleanPath(folder.absolutePath());
    }
    return QString();
}
