// SPDX-License-Identifier: MIT
#include "KvDeskPlugins.h"

#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "gui/ZtPluginInterface.h"
#include "kernel/ZtLeftToRight.h"

#include <QDir>
#include <QLibrary>
#include <QPluginLoader>

#include <algorithm>
#include <exception>

namespace {

const char pathVariable[] = "STATREPORT_PLUGINS";

QString source()
{
    return QStringLiteral("KvDeskPlugins::load");
}

QString shownPath(const QString &file)
{
    return ZtLeftToRight::isolated(QDir::toNativeSeparators(file));
}

} // namespace

KvDeskPlugins::KvDeskPlugins(KvGuiMainWindowBase *mainWindow)
    : m_mainWindow(mainWindow)
{}

KvDeskPlugins::~KvDeskPlugins()
{
    for (auto it = m_loaded.rbegin(); it != m_loaded.rend(); ++it)
        delete it->instance;
}

QStringList KvDeskPlugins::folders(const QStringList &chosen)
{
    const QDir program(QCoreApplication::applicationDirPath());
    QStringList all = qEnvironmentVariable(pathVariable).split(QDir::listSeparator(), Qt::SkipEmptyParts);
    all += chosen;
    all += {program.filePath(QStringLiteral("../plugins")),
            program.filePath(QStringLiteral("../lib/statreport/plugins"))};
    for (QString &folder : all)
        folder = QDir::cleanPath(QDir(folder).absolutePath());
    all.removeDuplicates();
    return all;
}

QStringList KvDeskPlugins::libraries(const QStringList &folders)
{
    QStringList files;
    for (const QString &folder : folders) {
        const QFileInfoList entries = QDir(folder).entryInfoList(QDir::Files, QDir::Name);
        for (const QFileInfo &entry : entries) {
            if (QLibrary::isLibrary(entry.fileName()))
                files.append(entry.canonicalFilePath());
        }
    }
    // Links to the same file are one plug-in.
    files.removeDuplicates();
    return files;
}

void KvDeskPlugins::load(const QStringList &folders)
{
    std::vector<Plugin> loaded;
    for (const QString &file : libraries(folders))
        loadLibrary(file, &loaded);
    std::stable_sort(loaded.begin(), loaded.end(),
                     [](const Plugin &a, const Plugin &b) { return a.order < b.order; });
    for (const Plugin &plugin : loaded) {
        m_loaded.push_back(plugin);
        if (start(plugin))
            m_started.push_back(plugin);
    }
    if (loaded.empty())
        KvDeskStatus::log(ZtAppStatus::Information, tr("No plug-ins were found"), source());
}

bool KvDeskPlugins::isSafe(const QString &file, const std::function<void()> &call)
{
    try {
        call();
        return true;
    } catch (const std::exception &error) {
        report(file, tr("It failed: %1").arg(QString::fromLocal8Bit(error.what())));
    } catch (...) {
        report(file, tr("It failed for a reason of its own"));
    }
    return false;
}

void KvDeskPlugins::loadLibrary(const QString &file, std::vector<Plugin> *loaded)
{
    QPluginLoader loader(file);
    // A symbol that is missing is found now rather than in the middle of the work.
    loader.setLoadHints(QLibrary::ResolveAllSymbolsHint | QLibrary::PreventUnloadHint);
    QObject *instance = nullptr;
    if (!isSafe(file, [&]() { instance = loader.instance(); }))
        return;
    if (!instance) {
        report(file, loader.errorString());
        return;
    }
    auto *const plugin = qobject_cast<ZtPluginInterface *>(instance);
    if (!plugin) {
        report(file, tr("It is no plug-in for this program"));
        delete instance;
        return;
    }
    Plugin entry{instance, plugin, file, 0};
    if (isSafe(file, [&]() { entry.order = plugin->order(); }))
        loaded->push_back(entry);
}

bool KvDeskPlugins::startGroup(const Plugin &plugin, const QString &groupName)
{
    bool isStarted = false;
    if (!isSafe(plugin.file, [&]() { isStarted = plugin.plugin->initialize(groupName, m_mainWindow); }))
        return false;
    if (!isStarted)
        report(plugin.file, tr("Its tools \"%1\" could not be started").arg(groupName));
    return isStarted;
}

bool KvDeskPlugins::start(const Plugin &plugin)
{
    QStringList groupNames;
    if (!isSafe(plugin.file, [&]() { groupNames = plugin.plugin->groupNames(); }))
        return false;
    bool isStarted = false;
    for (const QString &groupName : qAsConst(groupNames)) {
        if (startGroup(plugin, groupName))
            isStarted = true;
    }
    if (isStarted)
        KvDeskStatus::log(
            ZtAppStatus::Information,
            tr("Plug-in loaded: %1").arg(ZtLeftToRight::isolated(QFileInfo(plugin.file).fileName())),
            source());
    return isStarted;
}

void KvDeskPlugins::report(const QString &file, const QString &reason)
{
    KvDeskStatus::log(ZtAppStatus::Warning, tr("Plug-in not loaded: %1: %2").arg(shownPath(file), reason),
                      source());
}
