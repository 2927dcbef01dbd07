// SPDX-License-Identifier: MIT
#include "measuring/ZtMeasuringManipulator.h"

#include "kernel/ZtKernelData.h"
#include "measuring/ZtMeasuredObjectData.h"

#include <algorithm>
#include <array>
#include <charconv>

ZtMeasuringManipulator::ZtMeasuringManipulator(int typeId, const QStringList &valueNames)
    : m_typeId(typeId)
{
    changeValueNames(valueNames);
}

void ZtMeasuringManipulator::changeValueNames(const QStringList &valueNames)
{
    setValueNames(valueNames);
    m_positions.clear();
    for (int i = valueNames.size() - 1; i >= 0; --i)
        m_positions.insert(valueNames.at(i), i);
}

bool ZtMeasuringManipulator::isValueShown(const QString &valueName, const QStringList &valueSet) const
{
    if (valueSet.isSharedWith(getValueNames()))
        return position(valueName) >= 0;
    return valueSet.contains(valueName);
}

QStringList ZtMeasuringManipulator::valueSet(int id) const
{
    if (!m_someHidden)
        return getValueNames();
    const ZtKernelObjectData *data = ZtKernelData::getInstance()->object(m_typeId, id);
    const auto *object = static_cast<const ZtMeasuredObjectData *>(data);
    if (!object || object->hiddenValues().isEmpty())
        return getValueNames();
    QStringList shown;
    const QStringList names = getValueNames();
    for (int i = 0; i < names.size(); ++i) {
        if (isValueShown(*object, i))
            shown.append(names.at(i));
    }
    return shown;
}

void ZtMeasuringManipulator::appendShownValues(const ZtKernelObjectData *object,
                                               std::vector<ZtMeasuredValue> *values) const
{
    if (!object)
        return;
    const auto &measured = *static_cast<const ZtMeasuredObjectData *>(object);
    const auto before = static_cast<std::ptrdiff_t>(values->size());
    appendValues(measured, values);
    if (measured.hiddenValues().isEmpty())
        return;
    const auto isHidden = [&](const ZtMeasuredValue &value) {
        return !isValueShown(measured, value.position);
    };
    values->erase(std::remove_if(values->begin() + before, values->end(), isHidden), values->end());
}

QString ZtMeasuringManipulator::ownName(int id) const
{
    return ownName(getObjectName(id), objectTypeName(id), id);
}

// Asked for every row of a table: makes no text of its own.
QString ZtMeasuringManipulator::ownName(const QString &name, const QString &typeName, int id)
{
    const int start = typeName.size() + 1;
    if (name.size() <= start || name.at(start - 1) != QLatin1Char(' ') || !name.startsWith(typeName))
        return name;
    std::array<char, 16> digits{};
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), id).ptr;
    const QLatin1String number(digits.data(), static_cast<int>(end - digits.data()));
    return QStringView(name).mid(start) == number ? QString() : name;
}

void ZtMeasuringManipulator::setValueShown(ZtMeasuredObjectData *object, int position, bool shown)
{
    object->m_hidden.removeAll(position);
    if (shown)
        return;
    object->m_hidden.append(position);
    m_someHidden = true;
}

bool ZtMeasuringManipulator::isValueShown(const ZtMeasuredObjectData &object, int position) const
{
    return !object.hiddenValues().contains(position);
}
