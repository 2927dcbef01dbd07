// SPDX-License-Identifier: MIT
#include "KvDeskSelectionStatistics.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtMeasureFormat.h"
#include "measuring/ZtUnit.h"
#include "measuring/ZtUnitSettings.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr int preciseDigits = 9;

bool isAlike(const KvDeskSelectionStatistics::Group &a, const KvDeskSelectionStatistics::Group &b)
{
    return a.kind == b.kind && (a.kind != ZtGsManipulator::NoKind || a.unit == b.unit);
}

// The unit in which a value is shown.
ZtUnit unitOf(double value, const KvDeskSelectionStatistics::Group &group)
{
    const ZtUnit chosen = ZtUnitSettings::getInstance()->chosenUnit(group.kind);
    return chosen.isEmpty() ? ZtMeasureFormat::readableUnit(value, group.kind) : chosen;
}

QString unitTextOf(const KvDeskSelectionStatistics::Group &group)
{
    if (group.kind == ZtGsManipulator::NoKind)
        return group.unit;
    // The host writes the unit behind every number of such a kind.
    const QString zero = ZtMeasureFormat::drawnText(0.0, group.kind);
    return zero.mid(zero.indexOf(QLatin1Char(' ')) + 1);
}

QString inUnit(double value, const KvDeskSelectionStatistics::Group &group, int digits)
{
    const auto number = [digits](double shown) {
        return digits > 0 ? ZtMeasureFormat::significant(shown, digits) : ZtMeasureFormat::readable(shown);
    };
    // A mean of counts may lie between two of them, a count does not.
    if (group.kind == ZtGsManipulator::Count && value == std::floor(value))
        return ZtMeasureFormat::drawnText(value, group.kind);
    const ZtUnit unit = unitOf(value, group);
    return unit.isEmpty() ? ZtMeasureFormat::withUnit(number(value), unitTextOf(group))
                          : ZtMeasureFormat::withUnit(number(unit.fromBase(value)), unit.text());
}

} // namespace

void KvDeskSelectionStatistics::add(const Group &group)
{
    if (group.numbers.count() + group.numbers.leftOut() > 0)
        m_groups.append(group);
}

int KvDeskSelectionStatistics::count() const
{
    int count = 0;
    for (const Group &group : m_groups)
        count += group.numbers.count() + group.numbers.leftOut();
    return count;
}

bool KvDeskSelectionStatistics::isMixed() const
{
    return std::any_of(m_groups.begin(), m_groups.end(),
                       [this](const Group &group) { return !isAlike(group, m_groups.first()); });
}

bool KvDeskSelectionStatistics::isSummedUp(const Group &group) const
{
    const Group &first = m_groups.first();
    return isAlike(group, first) && (!isMixed() || group.valueName == first.valueName);
}

KvDeskRunningStatistics KvDeskSelectionStatistics::numbers() const
{
    KvDeskRunningStatistics numbers;
    for (const Group &group : m_groups) {
        if (isSummedUp(group))
            numbers.add(group.numbers);
    }
    return numbers;
}

QString KvDeskSelectionStatistics::format(double value) const
{
    return inUnit(value, m_groups.first(), ZtUnitSettings::getInstance()->significantDigits());
}

QString KvDeskSelectionStatistics::precise(double value) const
{
    return inUnit(value, m_groups.first(), preciseDigits);
}

QString KvDeskSelectionStatistics::text() const
{
    const KvDeskRunningStatistics all = numbers();
    if (m_groups.isEmpty() || all.count() == 0)
        return QString();
    const QString name = isMixed() ? m_groups.first().valueName + QStringLiteral(": ") : QString();
    if (all.count() == 1)
        return name + format(all.mean());
    //: number of values, their mean, standard deviation, smallest and largest one
    return name + tr("n = %1, mean %2, SD %3, min %4, max %5")
                      .arg(QString::number(all.count()), format(all.mean()), format(all.standardDeviation()),
                           format(all.minimum()), format(all.maximum()));
}

QString KvDeskSelectionStatistics::details() const
{
    const KvDeskRunningStatistics all = numbers();
    if (m_groups.isEmpty() || all.count() == 0)
        return QString();
    QStringList lines{tr("Selected values: %1").arg(count())};
    if (isMixed())
        lines.append(tr("\"%1\" among them: %2").arg(m_groups.first().valueName).arg(all.count()));
    lines.append(tr("Mean: %1").arg(ZtLeftToRight::isolated(precise(all.mean()))));
    if (all.count() > 1)
        lines.append(
            tr("Standard deviation: %1").arg(ZtLeftToRight::isolated(precise(all.standardDeviation()))));
    lines.append(tr("Smallest: %1").arg(ZtLeftToRight::isolated(precise(all.minimum()))));
    lines.append(tr("Largest: %1").arg(ZtLeftToRight::isolated(precise(all.maximum()))));
    return lines.join(QLatin1Char('\n'));
}
