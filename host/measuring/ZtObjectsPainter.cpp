// SPDX-License-Identifier: MIT
#include "measuring/ZtObjectsPainter.h"

#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtLabelLayout.h"
#include "measuring/ZtScaleBar.h"

#include <QPainter>

namespace {

// Counters may have any number of places; a label keeps clear of the first ones.
constexpr int mostHandles = 64;

const ZtDrawnManipulator *manipulatorOf(int type)
{
    // Only the types of the table are known to have it.
    return ZtDrawnType::find(type)
               ? static_cast<const ZtDrawnManipulator *>(ZtKernelData::getInstance()->getGsManipulator(type))
               : nullptr;
}

bool isLabelItself(int type)
{
    return type == ZtDrawnType::TextNote || type == ZtDrawnType::ScaleBar;
}

ZtLabelRequest request(const ZtDrawnManipulator &manipulator, const QPolygonF &points,
                       const QTransform &toDevice)
{
    const ZtDrawnType &type = manipulator.type();
    ZtLabelRequest result;
    const QPolygonF onDevice = toDevice.map(points);
    result.object =
        type.outline ? toDevice.mapRect(manipulator.outline(points).boundingRect()) : onDevice.boundingRect();
    result.handles = onDevice.size() > mostHandles ? QPolygonF(onDevice.mid(0, mostHandles)) : onDevice;
    result.isAround =
        type.id == ZtDrawnType::Rectangle || type.id == ZtDrawnType::Circle || type.id == ZtDrawnType::Arc;
    if (type.outline && !result.isAround)
        result.outline = result.handles;
    return result;
}

} // namespace

void ZtObjectsPainter::drawShape(QPainter *painter, const Object &object)
{
    if (const ZtDrawnManipulator *const manipulator = manipulatorOf(object.first))
        manipulator->drawShape(painter, object.second,
                               ZtKernelData::getInstance()->object(object.first, object.second));
}

void ZtObjectsPainter::drawObjects(QPainter *painter, const QList<int> &types) const
{
    QVector<Object> objects;
    const QMap<int, ZtObjectMap> &all = ZtKernelData::getInstance()->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        if (!ZtDrawnType::find(type.key()) || !(types.isEmpty() || types.contains(type.key())))
            continue;
        for (auto object = type->constBegin(); object != type->constEnd(); ++object) {
            drawShape(painter, {type.key(), object.key()});
            objects.append({type.key(), object.key()});
        }
    }
    const QRectF page = ZtDrawnObjectPainter::page(*painter);
    drawLabels(painter, labels(objects, painter->worldTransform(), page));
    if (types.isEmpty())
        drawScaleBar(painter, painter->worldTransform(), page);
}

void ZtObjectsPainter::drawScaleBar(QPainter *painter, const QTransform &toDevice, const QRectF &page) const
{
    if (m_isScaleBarShown && m_calibration)
        ZtScaleBar::choose(*m_calibration, toDevice.m11(), page.width()).draw(painter, page);
}

QVector<ZtDrawnLabel> ZtObjectsPainter::labels(const QVector<Object> &objects, const QTransform &toDevice,
                                               const QRectF &page) const
{
    const bool isCrowded = objects.size() > maximumLabels;
    QVector<ZtLabelRequest> requests;
    QVector<ZtDrawnLabel> result;
    for (const Object &object : objects) {
        if (!isLabelItself(object.first) && (isCrowded || !m_areLabelsShown))
            continue;
        const ZtDrawnManipulator *const manipulator = manipulatorOf(object.first);
        const ZtKernelObjectData *const data =
            ZtKernelData::getInstance()->object(object.first, object.second);
        const QString text = manipulator ? manipulator->labelText(object.second, data) : QString();
        if (text.isEmpty())
            continue;
        requests.append(
            request(*manipulator, static_cast<const ZtDrawnObjectData *>(data)->points(), toDevice));
        requests.last().size = ZtDrawnObjectPainter::labelSize(text);
        result.append({QRectF(), text});
    }
    const QVector<QRectF> boxes = ZtLabelLayout::place(requests, page);
    for (int i = 0; i < boxes.size(); ++i)
        result[i].box = boxes.at(i);
    return result;
}

void ZtObjectsPainter::drawLabels(QPainter *painter, const QVector<ZtDrawnLabel> &labels)
{
    const ZtDrawnObjectPainter objectPainter(painter);
    for (const ZtDrawnLabel &label : labels) {
        if (!label.box.isNull())
            objectPainter.drawLabelBox(label.box, label.text);
    }
}
