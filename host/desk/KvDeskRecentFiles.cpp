// SPDX-License-Identifier: MIT
#include "KvDeskRecentFiles.h"

#include "kernel/ZtAppSettings.h"

#include <QFileInfo>

namespace {

const char groupName[] = "Desk";
const char sessionsKey[] = "RecentSessions";

QString absolute(const QString &path)
{
    return QFileInfo(path).absoluteFilePath();
}

void store(const QStringList &paths)
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    ZtAppSettings::setValue(QLatin1String(sessionsKey), paths);
    ZtAppSettings::endGroup();
}

} // namespace

QStringList KvDeskRecentFiles::paths()
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    const QStringList paths = ZtAppSettings::value(QLatin1String(sessionsKey)).toStringList();
    ZtAppSettings::endGroup();
    return paths.mid(0, maximumCount);
}

void KvDeskRecentFiles::add(const QString &path)
{
    QStringList all = paths();
    all.removeAll(absolute(path));
    all.prepend(absolute(path));
    store(all.mid(0, maximumCount));
}

void KvDeskRecentFiles::remove(const QString &path)
{
    QStringList all = paths();
    all.removeAll(absolute(path));
    store(all);
}

void KvDeskRecentFiles::clear()
{
    store({});
}
