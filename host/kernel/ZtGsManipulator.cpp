// SPDX-License-Identifier: MIT
#include "kernel/ZtGsManipulator.h"

#include <algorithm>

namespace {

// Ids are small and dense; a stray huge one must not make the list of names huge.
constexpr int kMostRememberedNames = 1 << 20;

int digitCount(int number)
{
    int count = 1;
    for (int limit = 10; number >= limit && limit <= kMostRememberedNames; limit *= 10)
        ++count;
    return count;
}

// Whether a text that ends in a number is that of the type's name, a blank and the number.
bool isNumberedName(const QString &text, const QString &typeName, int number)
{
    return text.size() == typeName.size() + 1 + digitCount(number) &&
           std::equal(typeName.begin(), typeName.end(), text.begin());
}

} // namespace

ZtGsManipulator::ZtGsManipulator(const QStringList &valueNames)
    : m_valueNames(valueNames)
{}

ZtGsManipulator::~ZtGsManipulator() = default;

void ZtGsManipulator::draw(QPainter *painter, int id, const ZtKernelObjectData *object) const
{
    Q_UNUSED(painter)
    Q_UNUSED(id)
    Q_UNUSED(object)
}

QString ZtGsManipulator::getObjectName(int id) const
{
    if (!m_objectNames.isEmpty()) {
        const auto own = m_objectNames.constFind(id);
        if (own != m_objectNames.constEnd())
            return *own;
    }
    return numberedName(id);
}

QString ZtGsManipulator::numberedName(int id) const
{
    const QString typeName = objectTypeName(id);
    if (id < 0 || id >= kMostRememberedNames)
        return typeName + QLatin1Char(' ') + QString::number(id);
    // Remembered: reports ask for every object's name whenever a measurement changes.
    if (id >= m_numberedNames.size())
        m_numberedNames.resize(id + 1);
    QString &name = m_numberedNames[id];
    if (!isNumberedName(name, typeName, id))
        name = typeName + QLatin1Char(' ') + QString::number(id);
    return name;
}

void ZtGsManipulator::setObjectName(int id, const QString &name)
{
    if (name.isEmpty())
        m_objectNames.remove(id);
    else
        m_objectNames.insert(id, name);
}
