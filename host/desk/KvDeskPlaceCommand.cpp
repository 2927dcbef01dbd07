// SPDX-License-Identifier: MIT
#include "KvDeskPlaceCommand.h"

#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectData.h"

namespace {

template <typename Change>
void changePlaces(const KvDeskObjectId &counter, Change change)
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    auto *const data = dynamic_cast<ZtDrawnObjectData *>(kernel->object(counter.type, counter.id));
    if (!data)
        return;
    QPolygonF places = data->points();
    // The only owner again, so that the change copies nothing.
    data->setPoints(QPolygonF());
    change(places);
    data->setPoints(places);
    kernel->notifyObjectChanged(counter.type, counter.id);
}

} // namespace

KvDeskPlaceCommand::KvDeskPlaceCommand(const QString &text, Kind kind, KvDeskObjectId counter, int index,
                                       const QPointF &place)
    : QUndoCommand(text)
    , m_kind(kind)
    , m_counter(counter)
    , m_index(index)
    , m_place(place)
{}

void KvDeskPlaceCommand::undo()
{
    if (m_kind == Add)
        take();
    else
        insert();
}

void KvDeskPlaceCommand::redo()
{
    if (m_kind == Add)
        insert();
    else
        take();
}

void KvDeskPlaceCommand::insert()
{
    changePlaces(m_counter, [this](QPolygonF &places) {
        if (m_index <= places.size())
            places.insert(m_index, m_place);
    });
}

void KvDeskPlaceCommand::take()
{
    changePlaces(m_counter, [this](QPolygonF &places) {
        if (m_index < places.size())
            places.remove(m_index);
    });
}
