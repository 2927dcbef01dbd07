// SPDX-License-Identifier: MIT
#include "KvDeskExamples.h"

#include "KvDeskDataFolder.h"

#include <QDir>
#include <QFileInfo>

#include <algorithm>
#include <iterator>

namespace {

struct Example
{
    const char *name;
    const char *title;
};

constexpr Example examples[] = {
    {"coin", QT_TRANSLATE_NOOP("KvDeskExamples", "Coin: first length")},
    {"demo", QT_TRANSLATE_NOOP("KvDeskExamples", "Plate: dimensions")},
    {"cells", QT_TRANSLATE_NOOP("KvDeskExamples", "Cells: counting")},
    {"fibres", QT_TRANSLATE_NOOP("KvDeskExamples", "Fibres: statistics")},
};

// One after the last for a session that is none of them.
const Example *find(const QString &sessionPath)
{
    const QString name = QFileInfo(sessionPath).completeBaseName();
    return std::find_if(std::begin(examples), std::end(examples),
                        [&name](const Example &example) { return name == QLatin1String(example.name); });
}

} // namespace

QString KvDeskExamples::folder(const QString &programFolder)
{
    return KvDeskDataFolder::find(QStringLiteral("statreport/examples"), QStringLiteral("examples"),
                                  QStringLiteral("sessions"), programFolder);
}

QStringList KvDeskExamples::sessions(const QString &examplesFolder)
{
    if (examplesFolder.isEmpty())
        return {};
    const QDir folder(examplesFolder + QStringLiteral("/sessions"));
    QStringList paths;
    for (const QString &name : folder.entryList({QStringLiteral("*.json")}, QDir::Files, QDir::Name))
        paths.append(folder.filePath(name));
    std::stable_sort(paths.begin(), paths.end(),
                     [](const QString &a, const QString &b) { return find(a) < find(b); });
    return paths;
}

QString KvDeskExamples::title(const QString &sessionPath)
{
    const Example *const example = find(sessionPath);
    return example == std::end(examples) ? QFileInfo(sessionPath).completeBaseName() : tr(example->title);
}
