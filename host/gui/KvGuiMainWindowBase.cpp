// SPDX-License-Identifier: MIT
#include "gui/KvGuiMainWindowBase.h"

#include "gui/KvToolBase.h"

KvGuiMainWindowBase::KvGuiMainWindowBase(QWidget *parent, Qt::WindowFlags flags)
    : QMainWindow(parent, flags)
{}

KvGuiMainWindowBase::~KvGuiMainWindowBase() = default;

void KvGuiMainWindowBase::addTool(KvToolBase *tool)
{
    if (tool == nullptr || m_tools.contains(tool))
        return;

    m_tools.append(tool);
    placeTool(tool);
}

QList<KvToolBase *> KvGuiMainWindowBase::tools() const
{
    QList<KvToolBase *> living;
    for (const QPointer<KvToolBase> &tool : m_tools) {
        if (tool)
            living.append(tool);
    }
    return living;
}

void KvGuiMainWindowBase::placeTool(KvToolBase *tool)
{
    Q_UNUSED(tool)
}
