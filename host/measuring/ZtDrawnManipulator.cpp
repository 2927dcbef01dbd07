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

// In percent; 0 where nothing was counted.
double ZtDrawnManipulator::countShare(const ZtDrawnObjectData &counter) const
{
    const double total = countOfAll();
    return total > 0.0 ? counter.points().size() * 100.0 / total : 0.0;
}

// Kept until any object changes: whoever shows all counters asks for the share of each of them.
double ZtDrawnManipulator::countOfAll() const
{
    const ZtKernelData *const kernel = ZtKernelData::getInstance();
    if (m_isCountKnown && m_countRevision == kernel->revision())
        return m_countOfAll;
    m_isCountKnown = true;
    m_countRevision = kernel->revision();
    m_countOfAll = 0.0;
    const ZtObjectMap counters = kernel->objects().value(ZtDrawnType::Counter);
    for (const ZtKernelObjectData *other : counters)
        m_countOfAll += drawn(other).points().size();
    return m_countOfAll;
}

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
    const double factor = m_calibration->factor();
    switch (definition.kind) {
    case ZtGsManipulator::Length:
        return definition.measure(m_calibration->toPlane(object.points())) * factor;
    case ZtGsManipulator::Area:
        return definition.measure(m_calibration->toPlane(object.points())) * factor * factor;
    case ZtGsManipulator::Angle:
        return definition.measure(m_calibration->toPlane(object.points()));
    default:
        return definition.measure(object.points());
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

void ZtDrawnManipulator::appendValues(const ZtMeasuredObjectData &object,
                                      std::vector<ZtMeasuredValue> *values) const
{
    if (!m_type.acceptsPoints(drawn(&object).points()))
        return;
    for (std::size_t i = 0; i < m_type.values.size(); ++i) {
        const ZtDrawnValue &definition = m_type.values[i];
        values->push_back({static_cast<int>(i), effectiveKind(definition, *m_calibration),
                           inBaseUnits(definition, drawn(&object))});
    }
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
    const double length =
        ZtGeometry::pathLength(m_calibration->toPlane(object.points())) * m_calibration->factor();
    return m_calibration->isCalibrated() ? ZtMeasureFormat::drawnText(length, Length)
                                         : ZtMeasureFormat::pixelText(length, 1);
}

QString ZtDrawnManipulator::firstValueText(const ZtDrawnObjectData &object) const
{
    const QStringList names = getValueNames();
    for (int i = 0; i < names.size(); ++i) {
        if (isValueShown(object, i))
            return valueText(names.at(i), &object);
    }
    return QString();
}

QString ZtDrawnManipulator::labelText(int id, const ZtKernelObjectData *object) const
{
    if (!object || !m_type.acceptsPoints(drawn(object).points()))
        return QString();
    if (m_type.id == ZtDrawnType::TextNote)
        return drawn(object).text();
    if (m_type.id == ZtDrawnType::ScaleBar)
        return lengthText(drawn(object));
    const QString name = getObjectName(id);
    const QString value = firstValueText(drawn(object));
    return value.isEmpty() ? name : ZtMeasureFormat::named(name, value);
}

QPainterPath ZtDrawnManipulator::outline(const QPolygonF &points) const
{
    if (!m_type.outline)
        return QPainterPath();
    const QPainterPath inPlane = m_type.outline(m_calibration->toPlane(points));
    return m_calibration->isSquare() ? inPlane
                                     : QTransform::fromScale(1.0, 1.0 / m_calibration->aspect()).map(inPlane);
}

QPainterPath ZtDrawnManipulator::outlineOf(const ZtDrawnType &type, const QPolygonF &points)
{
    const auto *const manipulator =
        dynamic_cast<const ZtDrawnManipulator *>(ZtKernelData::getInstance()->getGsManipulator(type.id));
    if (manipulator)
        return manipulator->outline(points);
    return type.outline ? type.outline(points) : QPainterPath();
}

void ZtDrawnManipulator::drawShape(QPainter *painter, int id, const ZtKernelObjectData *object) const
{
    if (!object || !m_type.acceptsPoints(drawn(object).points()))
        return;
    const QPolygonF &points = drawn(object).points();
    const ZtDrawnObjectPainter objectPainter(painter);
    if (m_type.outline)
        objectPainter.drawOutline(outline(points));
    if (m_type.id == ZtDrawnType::Counter)
        objectPainter.drawMarkers(points, ZtDrawnObjectPainter::counterColor(id));
}

void ZtDrawnManipulator::draw(QPainter *painter, int id, const ZtKernelObjectData *object) const
{
    drawShape(painter, id, object);
    const QString text = labelText(id, object);
    if (!text.isEmpty() && !drawn(object).points().isEmpty())
        ZtDrawnObjectPainter(painter).drawLabel(drawn(object).points().first(), text);
}
