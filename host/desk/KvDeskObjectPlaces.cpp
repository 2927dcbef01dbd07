// SPDX-License-Identifier: MIT
#include "KvDeskObjectPlaces.h"

#include "KvDeskObjectShape.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"

namespace {

QRectF around(const QPointF &point, double distance)
{
    return QRectF(point, point).adjusted(-distance, -distance, distance, distance);
}

// A single point is as large as a pixel: a null rectangle stands for no place at all.
QRectF placeOf(const KvDeskObjectShape &shape)
{
    const QRectF bounds = shape.boundingRect();
    return bounds.isNull() ? bounds.adjusted(-0.5, -0.5, 0.5, 0.5) : bounds;
}

const ZtDrawnObjectData *drawnData(const KvDeskObjectId &object)
{
    return dynamic_cast<const ZtDrawnObjectData *>(
        ZtKernelData::getInstance()->object(object.type, object.id));
}

const ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

// All types of drawn objects of which there are objects, in order.
QVector<int> usedTypes()
{
    QVector<int> types;
    for (const ZtDrawnType &type : ZtDrawnType::all()) {
        if (kernel()->objects().contains(type.id))
            types.append(type.id);
    }
    return types;
}

} // namespace

KvDeskObjectPlaces::KvDeskObjectPlaces(QObject *parent)
    : QObject(parent)
{
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectChanged(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectChanged(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotObjectRemoved(int,int)));
    // Circles and arcs take up another place where pixels have another shape.
    connect(center, SIGNAL(signalLengthUnitChanged()), this, SLOT(slotReset()));
}

const KvDeskObjectIndex &KvDeskObjectPlaces::index() const
{
    if (m_isStale)
        rebuild();
    return m_index;
}

void KvDeskObjectPlaces::rebuild() const
{
    m_isStale = false;
    m_index.clear();
    m_counts.clear();
    for (const int type : usedTypes()) {
        const ZtObjectMap objects = kernel()->objects().value(type);
        m_counts.insert(type, objects.size());
        for (auto it = objects.constBegin(); it != objects.constEnd(); ++it) {
            const KvDeskObjectShape shape(type, it.value());
            if (!shape.isEmpty())
                m_index.set({type, it.key()}, placeOf(shape));
        }
    }
}

// One announcement may stand for all objects of a type, after many came or went silently.
bool KvDeskObjectPlaces::isInStep(int type) const
{
    const auto objects = kernel()->objects().constFind(type);
    return m_counts.value(type) == (objects == kernel()->objects().constEnd() ? 0 : objects->size());
}

void KvDeskObjectPlaces::slotReset()
{
    m_isStale = true;
    emit signalReset();
}

void KvDeskObjectPlaces::slotObjectChanged(int aType, int aId, const ZtKernelObjectData *aObject)
{
    if (m_isStale || !ZtDrawnType::find(aType))
        return;
    const KvDeskObjectId object{aType, aId};
    const KvDeskObjectShape shape(aType, aObject);
    const bool wasThere = m_index.contains(object);
    if (!isInStep(aType)) {
        ++m_counts[aType];
        if (!isInStep(aType)) {
            slotReset();
            return;
        }
    }
    const QRectF before = wasThere ? m_index.rect(object) : QRectF();
    const QRectF after = shape.isEmpty() ? QRectF() : placeOf(shape);
    if (shape.isEmpty())
        m_index.remove(object);
    else
        m_index.set(object, after);
    emit signalChanged(aType, aId, before, after);
}

void KvDeskObjectPlaces::slotObjectRemoved(int aType, int aId)
{
    if (m_isStale || !ZtDrawnType::find(aType))
        return;
    --m_counts[aType];
    if (!isInStep(aType)) {
        slotReset();
        return;
    }
    const KvDeskObjectId object{aType, aId};
    const QRectF before = m_index.rect(object);
    m_index.remove(object);
    emit signalChanged(aType, aId, before, QRectF());
}

KvDeskObjectId KvDeskObjectPlaces::objectAt(const QPointF &point, double tolerance) const
{
    const QVector<KvDeskObjectId> near = index().objectsIn(around(point, tolerance));
    for (int i = near.size() - 1; i >= 0; --i) {
        const KvDeskObjectId object = near.at(i);
        if (KvDeskObjectShape(object.type, drawnData(object)).isAt(point, tolerance))
            return object;
    }
    return {};
}

QVector<QPointF> KvDeskObjectPlaces::pointsNear(const QPointF &point, double distance,
                                                const KvDeskObjectId &except) const
{
    QVector<QPointF> points;
    const QRectF area = around(point, distance);
    for (const KvDeskObjectId &object : index().objectsIn(area)) {
        const ZtDrawnObjectData *const data = object == except ? nullptr : drawnData(object);
        if (!data)
            continue;
        for (const QPointF &other : data->points()) {
            if (area.contains(other))
                points.append(other);
        }
    }
    return points;
}

KvDeskObjectId KvDeskObjectPlaces::next(const KvDeskObjectId &object, bool isForward)
{
    const QVector<int> types = usedTypes();
    if (types.isEmpty())
        return {};
    const auto objects = kernel()->objects().constFind(object.type);
    if (!object.isNull() && objects != kernel()->objects().constEnd()) {
        if (isForward) {
            const auto after = objects->upperBound(object.id);
            if (after != objects->constEnd())
                return {object.type, after.key()};
        } else {
            const auto at = objects->lowerBound(object.id);
            if (at != objects->constBegin())
                return {object.type, std::prev(at).key()};
        }
    }
    int position = types.indexOf(object.type);
    if (position < 0)
        position = isForward ? -1 : 0;
    const int type = types.at((position + (isForward ? 1 : types.size() - 1)) % types.size());
    const ZtObjectMap &ofType = *kernel()->objects().constFind(type);
    return {type, isForward ? ofType.firstKey() : ofType.lastKey()};
}
