// SPDX-License-Identifier: MIT
#include "kernel/ZtKernelData.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "kernel/ZtSignalCenter.h"

#include <QCoreApplication>
#include <QVector>

#include <limits>
#include <utility>

namespace {

void deleteObjectsAtApplicationEnd()
{
    const ZtKernelData::SignalBlocker blocker;
    ZtKernelData::getInstance()->clearObjects();
}

int firstGap(const ZtObjectMap &objects)
{
    int id = 1;
    for (auto it = objects.lowerBound(1); it != objects.constEnd() && it.key() == id; ++it)
        ++id;
    return id;
}

int nextFreeId(const ZtObjectMap &objects)
{
    const int largest = objects.isEmpty() ? 0 : qMax(0, objects.lastKey());
    return largest == std::numeric_limits<int>::max() ? firstGap(objects) : largest + 1;
}

} // namespace

ZtKernelData::ZtKernelData()
{
    // Objects may hold pixmaps and fonts, which must not outlive the application object.
    qAddPostRoutine(deleteObjectsAtApplicationEnd);
}

ZtKernelData::~ZtKernelData()
{
    for (const ZtObjectMap &objects : std::as_const(m_objects))
        qDeleteAll(objects);
}

ZtKernelData *ZtKernelData::getInstance()
{
    // Made first, so that it dies last.
    ZtSignalCenter::getInstance();
    static ZtKernelData instance;
    return &instance;
}

ZtKernelObjectData *ZtKernelData::object(int type, int id) const
{
    const auto objects = m_objects.constFind(type);
    return objects == m_objects.constEnd() ? nullptr : objects->value(id, nullptr);
}

ZtGsManipulator *ZtKernelData::getGsManipulator(int type) const
{
    const auto found = m_manipulators.find(type);
    return found == m_manipulators.end() ? nullptr : found->second.get();
}

ZtKernelObjectDataDescr *ZtKernelData::getDataDescriptor(int type) const
{
    const auto found = m_descriptors.find(type);
    return found == m_descriptors.end() ? nullptr : found->second.get();
}

void ZtKernelData::registerType(int type, std::unique_ptr<ZtGsManipulator> manipulator,
                                std::unique_ptr<ZtKernelObjectDataDescr> descriptor)
{
    m_manipulators[type] = std::move(manipulator);
    m_descriptors[type] = std::move(descriptor);
}

std::unique_ptr<ZtGsManipulator> ZtKernelData::unregisterType(int type)
{
    ++m_revision;
    const ZtObjectMap objects = m_objects.take(type);
    qDeleteAll(objects);
    m_descriptors.erase(type);
    auto node = m_manipulators.extract(type);
    return node.empty() ? nullptr : std::move(node.mapped());
}

int ZtKernelData::addObject(int type, std::unique_ptr<ZtKernelObjectData> object, int id)
{
    if (!object)
        return 0;

    if (id == 0)
        id = nextFreeId(m_objects.value(type));
    else
        removeObject(type, id);

    ZtKernelObjectData *const added = object.release();
    ZtObjectMap &objects = m_objects[type];
    // Many objects mostly come in the order of their ids: then there is no place to look for.
    if (objects.isEmpty() || objects.lastKey() < id)
        objects.insert(objects.constEnd(), id, added);
    else
        objects.insert(id, added);
    ++m_revision;
    if (m_blockers == 0)
        emit ZtSignalCenter::getInstance()->signalObjectCreated(type, id, added);
    return id;
}

bool ZtKernelData::removeObject(int type, int id)
{
    const auto objects = m_objects.find(type);
    if (objects == m_objects.end() || !objects->contains(id))
        return false;

    // Kept alive until everybody heard of its end: receivers may still hold the pointer.
    const std::unique_ptr<ZtKernelObjectData> removed(objects->take(id));
    if (objects->isEmpty())
        m_objects.erase(objects);
    ++m_revision;
    if (ZtGsManipulator *const manipulator = getGsManipulator(type))
        manipulator->setObjectName(id, QString());
    if (m_blockers == 0)
        emit ZtSignalCenter::getInstance()->signalObjectRemoved(type, id);
    return true;
}

void ZtKernelData::notifyObjectChanged(int type, int id) const
{
    ++m_revision;
    const ZtKernelObjectData *const changed = object(type, id);
    if (changed != nullptr && m_blockers == 0)
        emit ZtSignalCenter::getInstance()->signalObjectChanged(type, id, changed);
}

void ZtKernelData::setObjects(int type, ZtObjectMap objects)
{
    ++m_revision;
    qDeleteAll(m_objects.take(type));
    if (!objects.isEmpty())
        m_objects.insert(type, std::move(objects));
}

ZtObjectMap ZtKernelData::takeObjects(int type)
{
    ++m_revision;
    return m_objects.take(type);
}

void ZtKernelData::clearObjects()
{
    // A snapshot, as receivers of a removal may add or remove objects themselves.
    QVector<std::pair<int, int>> all;
    for (auto type = m_objects.constBegin(); type != m_objects.constEnd(); ++type) {
        for (auto it = type->constBegin(); it != type->constEnd(); ++it)
            all.append({type.key(), it.key()});
    }
    for (const auto &[type, id] : std::as_const(all))
        removeObject(type, id);
}

ZtKernelData::SignalBlocker::SignalBlocker()
{
    ++getInstance()->m_blockers;
}

ZtKernelData::SignalBlocker::~SignalBlocker()
{
    --getInstance()->m_blockers;
}
