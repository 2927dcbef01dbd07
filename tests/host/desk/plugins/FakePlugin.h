// SPDX-License-Identifier: MIT
#pragma once

#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"
#include "gui/ZtPluginInterface.h"
#include "kernel/ZtSignalCenter.h"

#include <QApplication>
#include <QIcon>
#include <QObject>
#include <QTimer>
#include <QVariant>

#include <cstdio>

/**
 * Plug-in of the tests. What happens to it is written down in the application's dynamic property "pluginLog",
 * as the test has no other way into the library; with the environment variable FAKE_PLUGIN_CLOSES it is
 * printed, too, and the main window is closed soon after it is shown.
 */
class FakePlugin
    : public QObject
    , public ZtPluginInterface
{
    Q_OBJECT
    Q_INTERFACES(ZtPluginInterface)
public:
    FakePlugin(const QString &name, int order, bool starts)
        : m_name(name)
        , m_order(order)
        , m_starts(starts)
    {}
    ~FakePlugin() override
    {
        log(QStringLiteral("delete ") + m_name + (m_window ? windowState() : QString()));
    }

    QStringList groupNames() override { return {m_name + QStringLiteral(" tools")}; }
    int order() override { return m_order; }
    bool initialize(const QString &groupName, KvGuiMainWindowBase *mainWindow) override
    {
        log(QStringLiteral("initialize ") + groupName);
        if (!m_starts)
            return false;
        m_window = mainWindow;
        new KvToolBase(mainWindow, QIcon(), m_name, m_name, false);
        if (isClosing()) {
            connect(ZtSignalCenter::getInstance(), SIGNAL(signalAppAboutToClose()), this,
                                                          SLOT(slotAppAboutToClose()));
            QTimer::singleShot(200, mainWindow, SLOT(close()));
        }
        return true;
    }

private slots:
    void slotAppAboutToClose() { log(QStringLiteral("about to close") + windowState()); }

private:
    static bool isClosing() { return qEnvironmentVariableIsSet("FAKE_PLUGIN_CLOSES"); }
    QString windowState() const { return QStringLiteral(" window ") + m_window->objectName(); }
    static void log(const QString &line)
    {
        QStringList lines = qApp->property("pluginLog").toStringList();
        lines.append(line);
        qApp->setProperty("pluginLog", lines);
        if (isClosing())
            std::fprintf(stderr, "%s\n", qPrintable(line));
    }

    QString m_name;
    int m_order;
    bool m_starts;
    QPointer<KvGuiMainWindowBase> m_window;
};
