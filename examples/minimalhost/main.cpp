// SPDX-License-Identifier: MIT
/**
 * The least that an application does to have a report plug-in: an object type with measured objects, an
 * image, a main window that places tools, and the plug-in itself.
 *
 * minimalhost [--check] [folder with plug-ins]
 *
 * With --check no window is shown: the titles of the plug-ins' tools are printed, and the exit code tells
 * whether there was one.
 */
#include "ScratchImage.h"
#include "ScratchManipulator.h"
#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/ZtPluginInterface.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "kernel/ZtSignalCenter.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDir>
#include <QDockWidget>
#include <QPluginLoader>
#include <QToolBar>
#include <QToolButton>

#include <cstdio>

namespace {

/** Shows each tool's button in a tool bar and its panel, while the tool is active, at the left. */
class MainWindow : public KvGuiMainWindowBase
{
public:
    MainWindow()
        : m_toolBar(addToolBar(QStringLiteral("Tools")))
    {}

protected:
    void placeTool(KvToolBase *tool) override
    {
        auto *const dock = new QDockWidget(tool->title(), this);
        dock->setFeatures(QDockWidget::NoDockWidgetFeatures);
        dock->setWidget(tool->panel());
        addDockWidget(Qt::LeftDockWidgetArea, dock);
        m_toolBar->addWidget(tool->getToolButton());
        dock->setVisible(tool->isActivated());
        connect(tool, &KvToolBase::toolActivated, dock, &QDockWidget::setVisible);
    }
    void closeEvent(QCloseEvent *event) override
    {
        emit ZtSignalCenter::getInstance()->signalAppAboutToClose(); // plug-ins write their settings now
        event->accept();
    }

private:
    QToolBar *m_toolBar;
};

void addScratches()
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    constexpr int type = ScratchManipulator::typeId;
    kernel->registerType(type, std::make_unique<ScratchManipulator>(),
                         std::make_unique<ZtKernelObjectDataDescr>(type, QStringLiteral("scratch")));
    for (const double length : {120.0, 131.5, 117.25})
        kernel->addObject(type, std::make_unique<Scratch>(QLineF(50.0, length, 50.0 + length, length)));
}

void loadPlugins(const QDir &folder, KvGuiMainWindowBase *window)
{
    const QStringList files = folder.entryList(QDir::Files);
    for (const QString &file : files) {
        QPluginLoader loader(folder.filePath(file));
        auto *const plugin = qobject_cast<ZtPluginInterface *>(loader.instance());
        if (!plugin) {
            std::fprintf(stderr, "%s: %s\n", qPrintable(file), qPrintable(loader.errorString()));
            continue;
        }
        for (const QString &group : plugin->groupNames())
            plugin->initialize(group, window);
    }
}

int printTools(const QList<KvToolBase *> &tools)
{
    for (const KvToolBase *tool : tools)
        std::printf("%s\n", qPrintable(tool->title()));
    return tools.isEmpty() ? EXIT_FAILURE : EXIT_SUCCESS;
}

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi); // reports are laid out alike on every screen
    QApplication application(argc, argv);
    ZtAppSettings::setProgramInfo(QStringLiteral("Minimal host"), QStringLiteral("1.0"), QString());
    acss::QtAdvancedStylesheet::substituteFonts();
    acss::QtAdvancedStylesheet::getInstance()->applyTo(&application);

    QStringList arguments = application.arguments().mid(1);
    const bool isCheck = arguments.removeAll(QStringLiteral("--check")) > 0;

    addScratches();
    const ScratchImage image;
    MainWindow window;
    loadPlugins(QDir(arguments.value(0, QStringLiteral(PLUGIN_FOLDER))), &window);
    if (isCheck)
        return printTools(window.tools());

    for (KvToolBase *tool : window.tools())
        tool->setEnabled(true, true);
    window.resize(640, 400);
    window.show();
    return QApplication::exec();
}
