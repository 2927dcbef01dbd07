// SPDX-License-Identifier: MIT
#include "KvDeskObjectState.h"

#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtMeasuringManipulator.h"

namespace {

ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

ZtMeasuringManipulator *manipulatorOf(const KvDeskObjectId &object)
{
    return dynamic_cast<ZtMeasuringManipulator *>(kernel()->getGsManipulator(object.type));
}

std::unique_ptr<ZtKernelObjectData> dataOf(const KvDeskObjectState &state)
{
    if (state.row >= 0)
        return std::make_unique<ZtImportedObjectData>(state.row);
    return std::make_unique<ZtDrawnObjectData>(state.points, state.text);
}

} // namespace

KvDeskObjectState KvDeskObjectState::missing(const KvDeskObjectId &object)
{
    KvDeskObjectState state;
    state.object = object;
    return state;
}

KvDeskObjectState KvDeskObjectState::of(const KvDeskObjectId &object)
{
    KvDeskObjectState state = missing(object);
    const ZtKernelObjectData *const data = kernel()->object(object.type, object.id);
    const ZtMeasuringManipulator *const manipulator = manipulatorOf(object);
    const auto *const measured = dynamic_cast<const ZtMeasuredObjectData *>(data);
    if (!measured || !manipulator)
        return state;
    state.exists = true;
    state.name = manipulator->ownName(object.id);
    state.hiddenValues = measured->hiddenValues();
    if (const auto *const imported = dynamic_cast<const ZtImportedObjectData *>(data))
        state.row = imported->row();
    if (const auto *const drawn = dynamic_cast<const ZtDrawnObjectData *>(data)) {
        state.points = drawn->points();
        state.text = drawn->text();
    }
    return state;
}

bool KvDeskObjectState::operator==(const KvDeskObjectState &other) const
{
    return object == other.object && exists == other.exists && row == other.row && points == other.points &&
           text == other.text && name == other.name && hiddenValues == other.hiddenValues;
}

void KvDeskObjectState::restore() const
{
    if (!exists)
        kernel()->removeObject(object.type, object.id);
    else if (!manipulatorOf(object))
        return; // the table that brought the type is gone
    else if (kernel()->object(object.type, object.id))
        change();
    else
        create();
}

void KvDeskObjectState::create() const
{
    {
        // Name and hidden values are set before anybody hears of the object.
        const ZtKernelData::SignalBlocker blocker;
        kernel()->addObject(object.type, dataOf(*this), object.id);
        manipulatorOf(object)->setObjectName(object.id, name);
        hideValues();
    }
    emit ZtSignalCenter::getInstance()->signalObjectCreated(object.type, object.id,
                                                            kernel()->object(object.type, object.id));
}

void KvDeskObjectState::change() const
{
    if (auto *const drawn = dynamic_cast<ZtDrawnObjectData *>(kernel()->object(object.type, object.id))) {
        drawn->setPoints(points);
        drawn->setText(text);
    }
    manipulatorOf(object)->setObjectName(object.id, name);
    hideValues();
    kernel()->notifyObjectChanged(object.type, object.id);
}

void KvDeskObjectState::hideValues() const
{
    auto *const measured = dynamic_cast<ZtMeasuredObjectData *>(kernel()->object(object.type, object.id));
    ZtMeasuringManipulator *const manipulator = manipulatorOf(object);
    const QVector<int> hiddenNow = measured->hiddenValues();
    if (hiddenNow == hiddenValues)
        return;
    for (const int position : hiddenNow)
        manipulator->setValueShown(measured, position, true);
    for (const int position : hiddenValues)
        manipulator->setValueShown(measured, position, false);
}
