// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QPointer>
#include <QStringList>

#include <functional>
#include <vector>

class KvGuiMainWindowBase;
class ZtPluginInterface;

/**
 * The plug-ins of the program. What cannot be loaded or started is reported to the status log, and the
 * program goes on without it.
 *
 * Libraries stay loaded to the end of the program, whatever happens to their instances: other objects may
 * still run their code.
 */
class KvDeskPlugins
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskPlugins)
public:
    /** \a mainWindow takes the plug-ins' tools, and has to outlive this. */
    explicit KvDeskPlugins(KvGuiMainWindowBase *mainWindow);
    /** Deletes the instances, the one started last first. */
    ~KvDeskPlugins();

    /**
     * Where plug-ins are looked for: the folders of the environment variable STATREPORT_PLUGINS, \a chosen
     * ones, and those beside the program. Each folder once.
     */
    static QStringList folders(const QStringList &chosen);

    /** Loads all plug-ins of \a folders, then starts them by their order. Folders that do not exist are
     * skipped. */
    void load(const QStringList &folders);

    /** Number of plug-ins that were started. */
    int count() const { return static_cast<int>(m_started.size()); }

private:
    Q_DISABLE_COPY(KvDeskPlugins)

    struct Plugin
    {
        QPointer<QObject> instance;
        ZtPluginInterface *plugin = nullptr;
        QString file;
        int order = 0;
    };

    static QStringList libraries(const QStringList &folders);
    static void report(const QString &file, const QString &reason);
    void loadLibrary(const QString &file, std::vector<Plugin> *loaded);
    bool start(const Plugin &plugin);
    bool startGroup(const Plugin &plugin, const QString &groupName);
    /** What a plug-in throws is its own fault, and reported as such. False then. */
    static bool isSafe(const QString &file, const std::function<void()> &call);

    KvGuiMainWindowBase *m_mainWindow;
    std::vector<Plugin> m_loaded;
    std::vector<Plugin> m_started;
};
