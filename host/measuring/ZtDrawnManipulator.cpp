// SPDX-License-Identifier: MIT
#include "measuring/ZtDrawnManipulator.h"

#include "kernel/ZtKernelData.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtGeometry.h"
#include "measuring/ZtMeasureFormat.h"

namespace {

const ZtDrawnObjectData &drawn(const ZtKernelObjectData *object)
{
    return *static_cast<const ZtDrawnObjectData *>(object);
}

// A counter's count in percent of all counters' counts; 0 where nothing was counted.
double countShare(const ZtDrawnObjectData &counter)
{
    double total = 0.0;
    const ZtObjectMap counters = ZtKernelData::getInstance()->objects().value(ZtDrawnType::Counter);
    for (const ZtKernelObjectData *other : counters)
        total += drawn(other).points().size();
    return total > 0.0 ? counter.points().size() * 100.0 / total : 0.0;
}

// Lengths and areas have no unit known to the statistics as long as they are in pixels.
int effectiveKind(const ZtDrawnValue &definition, const ZtCalibration &calibration)
{
    const bool isScaled =
        definition.kind == ZtGsManipulator::Length || definition.kind == ZtGsManipulator::Area;
    return isScaled && !calibration.isCalibrated() ? ZtGsManipulator::NoKind : definition.kind;
}

} // namespace

ZtDrawnManipulator::ZtDrawnManipulator(const ZtDrawnType &type,
                                       std::shared_ptr<const ZtCalibration> calibration)
    : ZtMeasuringManipulator(type.id, type.valueNames())
    , m_type(type)
    , m_calibration(std::move(calibration))
    , m_typeName(type.displayName())
{}

void ZtDrawnManipulator::retranslate()
{
    m_typeName = m_type.displayName();
    changeValueNames(m_type.valueNames());
}

int ZtDrawnManipulator::typeFlags(int reserved) const
{
    Q_UNUSED(reserved)
    return m_type.isMeasurement() ? MeasurementFlag : 0;
}

QString ZtDrawnManipulator::objectTypeName(int id) const
{
    Q_UNUSED(id)
    return m_typeName;
}

double ZtDrawnManipulator::inBaseUnits(const ZtDrawnValue &definition, const ZtDrawnObjectData &object) const
{
    if (!definition.measure)
        return countShare(object);
    const double measured = definition.measure(object.points());
    const double factor = m_calibration->factor();
    switch (definition.kind) {
    case ZtGsManipulator::Length:
        return measured * factor;
    case ZtGsManipulator::Area:
        return measured * factor * factor;
    default:
        return measured;
    }
}

bool ZtDrawnManipulator::measure(const QString &valueName, const ZtKernelObjectData *object,
                                 double *baseValue, const ZtDrawnValue **definition) const
{
    const int index = position(valueName);
    if (index < 0 || !object || !m_type.acceptsPoints(drawn(object).points()))
        return false;
    *definition = &m_type.values[static_cast<std::size_t>(index)];
    *baseValue = inBaseUnits(**definition, drawn(object));
    return true;
}

QVariant ZtDrawnManipulator::value(const QString &valueName, const ZtKernelObjectData *object,
                                   int &measureKind) const
{
    measureKind = NoKind;
    double baseValue = 0.0;
    const ZtDrawnValue *definition = nullptr;
    if (!measure(valueName, object, &baseValue, &definition))
        return QVariant();
    measureKind = effectiveKind(*definition, *m_calibration);
    return measureKind == Count ? QVariant(static_cast<int>(baseValue)) : QVariant(baseValue);
}

QString ZtDrawnManipulator::valueText(const QString &valueName, const ZtKernelObjectData *object) const
{
    double baseValue = 0.0;
    const ZtDrawnValue *definition = nullptr;
    if (!measure(valueName, object, &baseValue, &definition))
        return QString();
    if (effectiveKind(*definition, *m_calibration) == NoKind)
        return ZtMeasureFormat::pixelText(baseValue, definition->kind == Area ? 2 : 1);
    return ZtMeasureFormat::drawnText(baseValue, definition->kind);
}

QString ZtDrawnManipulator::lengthText(const ZtDrawnObjectData &object) const
{
    const double length = ZtGeometry::pathLength(object.points()) * m_calibration->factor();
    return m_calibration->isCalibrated() ? ZtMeasureFormat::drawnText(length, Length)
                                         : ZtMeasureFormat::pixelText(length, 1);
}

QString ZtDrawnManipulator::label(int id, const ZtDrawnObjectData &object) const
{
    if (m_type.id == ZtDrawnType::TextNote)
        return object.text();
    if (m_type.id == ZtDrawnType::ScaleBar)
        return lengthText(object);
    return getObjectName(id);
}

void ZtDrawnManipulator::draw(QPainter *painter, int id, const ZtKernelObjectData *object) const
{
    if (!object || !m_type.acceptsPoints(drawn(object).points()))
        return;
    const QPolygonF &points = drawn(object).points();
    const ZtDrawnObjectPainter objectPainter(painter);
    if (m_type.outline)
        objectPainter.drawOutline(m_type.outline(points));
    if (m_type.id == ZtDrawnType::Counter)
        objectPainter.drawMarkers(points);
    if (!points.isEmpty())
        objectPainter.drawLabel(points.first(), label(id, drawn(object)));
}
