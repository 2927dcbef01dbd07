// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtGuiGlobal.h"

#include <QList>
#include <QMainWindow>
#include <QPointer>

class KvToolBase;

/** Base of the host's main window: knows the tools, and lets the host's own window place them. */
class ZT_GUI_EXPORT KvGuiMainWindowBase : public QMainWindow
{
    Q_OBJECT
public:
    /** A window without tools and central widget. */
    explicit KvGuiMainWindowBase(QWidget *parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    ~KvGuiMainWindowBase() override;

    /** Takes a tool in; tools do this themselves when they are made. Null and known tools are ignored. */
    void addTool(KvToolBase *tool);

    /** The living tools in the order in which they came. */
    QList<KvToolBase *> tools() const;

protected:
    /**
     * Places the button and the panel of a new tool; does nothing here. The tool's own widget may come later:
     * it appears inside the panel. Called out of the constructor of KvToolBase.
     */
    virtual void placeTool(KvToolBase *tool);

private:
    QList<QPointer<KvToolBase>> m_tools;
};
