// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtGuiGlobal.h"

#include <QStringList>
#include <QtPlugin>

class KvGuiMainWindowBase;

/**
 * What the host asks of a plug-in. A plug-in's class derives from QObject and from this, and names this
 * interface in Q_INTERFACES.
 *
 * The order of the virtual operations is part of the binary contract with plug-ins. None is const, as a
 * plug-in may make up its answers when it is first asked.
 */
class ZT_GUI_EXPORT ZtPluginInterface
{
public:
    virtual ~ZtPluginInterface();

    /** The host's tool groups that the plug-in serves; untranslated names. */
    virtual QStringList groupNames() = 0;
    /**
     * Called once for each of groupNames() when the main window exists: the plug-in makes its tools
     * (KvToolBase) for it. False when the plug-in does not serve the group; it has made nothing then.
     */
    virtual bool initialize(const QString &groupName, KvGuiMainWindowBase *mainWindow) = 0;
    /** The plug-in's place among the host's plug-ins; lower ones are initialised first. */
    virtual int order() = 0;
};

Q_DECLARE_INTERFACE(ZtPluginInterface, "com.Tarvosen.plugin.ManipulatorPluginInterface/1.0")
