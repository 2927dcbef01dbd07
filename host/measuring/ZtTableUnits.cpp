// SPDX-License-Identifier: MIT
#include "measuring/ZtTableUnits.h"

#include "kernel/ZtGsManipulator.h"

namespace {

int meaningOf(const QString &resultsName)
{
    static const QStringList lengths = {
        QStringLiteral("Perim."), QStringLiteral("Major"),   QStringLiteral("Minor"),
        QStringLiteral("X"),      QStringLiteral("Y"),       QStringLiteral("XM"),
        QStringLiteral("YM"),     QStringLiteral("BX"),      QStringLiteral("BY"),
        QStringLiteral("Width"),  QStringLiteral("Height"),  QStringLiteral("Feret"),
        QStringLiteral("Length"), QStringLiteral("MinFeret")};
    static const QStringList angles = {QStringLiteral("Angle"), QStringLiteral("FeretAngle")};
    if (lengths.contains(resultsName))
        return ZtGsManipulator::Length;
    if (angles.contains(resultsName))
        return ZtGsManipulator::Angle;
    if (resultsName == QLatin1String("Area"))
        return ZtGsManipulator::Area;
    return resultsName == QLatin1String("%Area") ? ZtGsManipulator::Percentage : ZtGsManipulator::NoKind;
}

} // namespace

ZtTableUnits::ZtTableUnits(const QStringList &assignments)
{
    for (const QString &assignment : assignments) {
        const int equals = assignment.lastIndexOf(QLatin1Char('='));
        if (equals < 0) {
            m_default = ZtUnit::parse(assignment);
            continue;
        }
        const QString name = assignment.left(equals).trimmed();
        m_assigned.insert(name.toLower(), ZtUnit::parse(assignment.mid(equals + 1)));
        m_unused.removeAll(name);
        m_unused.append(name);
    }
}

bool ZtTableUnits::findAssigned(const QString &valueName, ZtUnit *unit)
{
    if (m_assigned.isEmpty())
        return false;
    const auto found = m_assigned.constFind(valueName.toLower());
    if (found == m_assigned.constEnd())
        return false;
    *unit = *found;
    for (int i = m_unused.size() - 1; i >= 0; --i) {
        if (m_unused.at(i).compare(valueName, Qt::CaseInsensitive) == 0)
            m_unused.removeAt(i);
    }
    return true;
}

ZtUnit ZtTableUnits::unitOf(const QString &valueName, const QString &stated, const QString &heading)
{
    ZtUnit unit;
    if (findAssigned(valueName, &unit) || findAssigned(heading, &unit))
        return unit;
    return stated.isEmpty() ? m_default : ZtUnit::parse(stated);
}

ZtUnit ZtTableUnits::resultsUnitOf(const QString &valueName, const QString &stated, const QString &heading)
{
    ZtUnit unit;
    if (findAssigned(valueName, &unit) || findAssigned(heading, &unit))
        return unit;
    if (!stated.isEmpty())
        return ZtUnit::parse(stated);
    switch (meaningOf(valueName)) {
    case ZtGsManipulator::Length:
        return m_default;
    case ZtGsManipulator::Area:
        return m_default.squared();
    case ZtGsManipulator::Angle:
        return ZtUnit::parse(QStringLiteral("deg"));
    case ZtGsManipulator::Percentage:
        return ZtUnit::parse(QStringLiteral("%"));
    default:
        return ZtUnit();
    }
}

QStringList ZtTableUnits::unusedNames() const
{
    return m_unused;
}
