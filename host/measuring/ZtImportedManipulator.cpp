// SPDX-License-Identifier: MIT
#include "measuring/ZtImportedManipulator.h"

#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtMeasureFormat.h"

#include <cmath>
#include <limits>

namespace {

bool isWholeInt(double value)
{
    return std::abs(value) <= std::numeric_limits<int>::max() && value == std::floor(value);
}

} // namespace

ZtImportedManipulator::ZtImportedManipulator(int typeId, std::shared_ptr<const ZtImportedType> type)
    : ZtMeasuringManipulator(typeId, type->valueNames())
    , m_type(std::move(type))
{}

int ZtImportedManipulator::typeFlags(int reserved) const
{
    Q_UNUSED(reserved)
    return MeasurementFlag;
}

QString ZtImportedManipulator::objectTypeName(int id) const
{
    Q_UNUSED(id)
    return m_type->name();
}

const ZtImportedCell *ZtImportedManipulator::cell(const QString &valueName,
                                                  const ZtKernelObjectData *object) const
{
    const int index = position(valueName);
    if (index < 0 || !object)
        return nullptr;
    return m_type->cell(static_cast<const ZtImportedObjectData *>(object)->row(), index);
}

QVariant ZtImportedManipulator::value(const QString &valueName, const ZtKernelObjectData *object,
                                      int &measureKind) const
{
    const ZtImportedCell *found = cell(valueName, object);
    measureKind = found ? m_type->unit(*found).kind() : NoKind;
    if (!found)
        return QVariant();
    if (measureKind == Count && isWholeInt(found->value))
        return static_cast<int>(found->value);
    return found->value;
}

void ZtImportedManipulator::appendValues(const ZtMeasuredObjectData &object,
                                         std::vector<ZtMeasuredValue> *values) const
{
    const int row = static_cast<const ZtImportedObjectData &>(object).row();
    for (const ZtImportedCell &cell : m_type->row(row))
        values->push_back({cell.valueIndex, m_type->unit(cell).kind(), cell.value});
}

QString ZtImportedManipulator::valueText(const QString &valueName, const ZtKernelObjectData *object) const
{
    const ZtImportedCell *found = cell(valueName, object);
    return found ? ZtMeasureFormat::importedText(found->value, m_type->unit(*found), m_type->text(*found))
                 : QString();
}

QString ZtImportedManipulator::shortText(const QString &valueName, const ZtKernelObjectData *object) const
{
    const ZtImportedCell *found = cell(valueName, object);
    return found
               ? ZtMeasureFormat::importedShortText(found->value, m_type->unit(*found), m_type->text(*found))
               : QString();
}
