// SPDX-License-Identifier: MIT
#include "KvDeskFirstTemplates.h"

#include "kernel/ZtAppSettings.h"

#include <QFileInfo>

namespace {

// As many as the plug-in remembers.
constexpr const char *names[] = {"summary", "protocol", "counting", "trend", "certificate"};

const char groupName[] = "StatReporting";
const char templatesKey[] = "ReportTemplatePaths";

} // namespace

QStringList KvDeskFirstTemplates::in(const QString &folder)
{
    QStringList paths;
    for (const char *const name : names) {
        const QFileInfo file(QStringLiteral("%1/%2.rtp").arg(folder, QLatin1String(name)));
        if (file.exists())
            paths.append(file.absoluteFilePath());
    }
    return paths;
}

void KvDeskFirstTemplates::offer(const QString &folder)
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    if (!ZtAppSettings::contains(QLatin1String(templatesKey)))
        ZtAppSettings::setValue(QLatin1String(templatesKey), in(folder));
    ZtAppSettings::endGroup();
}
