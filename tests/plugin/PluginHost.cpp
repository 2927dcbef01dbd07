// SPDX-License-Identifier: MIT
/**
 * A host in short: loads a plug-in, opens its windows, and ends. Arguments: the plug-in's file, and what goes
 * in which order ("plugin", "window", "application", or "exit"); what is not named is left to the system.
 */
#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"
#include "gui/ZtPluginInterface.h"
#include "kernel/ZtAppSettings.h"

#include <QApplication>
#include <QPluginLoader>
#include <QPointer>
#include <QToolButton>

#include <cstdlib>

namespace {

bool openWindows(QObject *plugin, KvGuiMainWindowBase *window)
{
    auto *const interface = qobject_cast<ZtPluginInterface *>(plugin);
    if (!interface || !interface->initialize(interface->groupNames().value(0), window))
        return false;
    window->setCentralWidget(window->tools().value(0)->panel());
    window->show();
    for (const char *name : {"theEditorButton", "theStatisticsButton"})
        window->findChild<QToolButton *>(QLatin1String(name))->click();
    QCoreApplication::processEvents();
    const QWidgetList windows = QApplication::topLevelWidgets();
    for (QWidget *candidate : windows) {
        if (candidate->inherits("KvReportTemplatesEditor"))
            QMetaObject::invokeMethod(candidate, "slotHeaderButtonClicked", Q_ARG(bool, true));
    }
    QCoreApplication::processEvents();
    return windows.size() >= 3;
}

} // namespace

int main(int argc, char **argv)
{
    auto *application = new QApplication(argc, argv);
    ZtAppSettings::getInstance()->setStoragePath(QString());
    QPointer<KvGuiMainWindowBase> window = new KvGuiMainWindowBase;
    QPluginLoader loader(QString::fromLocal8Bit(argv[1]));
    QPointer<QObject> plugin = loader.instance();
    if (!openWindows(plugin, window))
        return EXIT_FAILURE;
    for (int i = 2; i < argc; ++i) {
        const QByteArray what(argv[i]);
        if (what == "plugin")
            delete plugin;
        else if (what == "window")
            delete window;
        else if (what == "application")
            delete application;
        else if (what == "exit")
            std::exit(EXIT_SUCCESS);
    }
    return EXIT_SUCCESS;
}
