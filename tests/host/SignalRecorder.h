// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"

#include <QObject>
#include <QStringList>

/** Notes what the signal centre says about objects, and whether the kernel's data was up to date by then. */
class SignalRecorder : public QObject
{
    Q_OBJECT
public:
    SignalRecorder()
    {
        const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
        connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                               SLOT(slotCreated(int,int,const ZtKernelObjectData*)));
        connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                               SLOT(slotChanged(int,int,const ZtKernelObjectData*)));
        connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotRemoved(int,int)));
    }

    QStringList taken()
    {
        const QStringList result = m_seen;
        m_seen.clear();
        return result;
    }

private slots:
    void slotCreated(int type, int id, const ZtKernelObjectData *object)
    {
        note("created", type, id, object == ZtKernelData::getInstance()->object(type, id));
    }
    void slotChanged(int type, int id, const ZtKernelObjectData *object)
    {
        note("changed", type, id, object == ZtKernelData::getInstance()->object(type, id));
    }
    void slotRemoved(int type, int id)
    {
        note("removed", type, id, ZtKernelData::getInstance()->object(type, id) == nullptr);
    }

private:
    void note(const char *what, int type, int id, bool upToDate)
    {
        m_seen.append(QStringLiteral("%1 %2/%3%4")
                          .arg(QLatin1String(what))
                          .arg(type)
                          .arg(id)
                          .arg(upToDate ? QString() : QStringLiteral(" with other data")));
    }

    QStringList m_seen;
};
