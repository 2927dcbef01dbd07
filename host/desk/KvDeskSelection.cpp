// SPDX-License-Identifier: MIT
#include "KvDeskSelection.h"

#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"

KvDeskSelection::KvDeskSelection(QObject *parent)
    : QObject(parent)
{
    connect(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int,int)), this,
                                                  SLOT(slotObjectRemoved(int,int)));
}

void KvDeskSelection::set(const QSet<KvDeskObjectId> &objects, KvDeskObjectId current)
{
    if (!objects.contains(current))
        current = objects.isEmpty() ? KvDeskObjectId() : *objects.begin();
    if (current == m_current && objects == m_objects)
        return;
    m_objects = objects;
    m_current = current;
    emit signalSelectionChanged();
}

void KvDeskSelection::select(KvDeskObjectId object)
{
    if (object.isNull())
        clear();
    else
        set({object}, object);
}

void KvDeskSelection::toggle(KvDeskObjectId object)
{
    if (object.isNull())
        return;
    QSet<KvDeskObjectId> objects = m_objects;
    if (objects.remove(object)) {
        set(objects, m_current);
        return;
    }
    objects.insert(object);
    set(objects, object);
}

void KvDeskSelection::clear()
{
    set({}, KvDeskObjectId());
}

void KvDeskSelection::slotObjectRemoved(int aType, int aId)
{
    if (m_objects.isEmpty())
        return;
    // One announcement may stand for all objects of a type.
    if (!ZtKernelData::getInstance()->objects().contains(aType)) {
        forgetType(aType);
        return;
    }
    if (contains({aType, aId}))
        toggle({aType, aId});
}

void KvDeskSelection::forgetType(int type)
{
    QSet<KvDeskObjectId> left;
    for (const KvDeskObjectId &object : qAsConst(m_objects)) {
        if (object.type != type)
            left.insert(object);
    }
    set(left, m_current);
}
