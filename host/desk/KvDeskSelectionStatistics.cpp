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

// The unit in which all figures of a selection are shown, so that they can be compared: the one in which the
// mean reads best, or the spread where numbers of both signs have next to no mean.
ZtUnit unitOf(const KvDeskRunningStatistics &numbers, int kind)
{
    const ZtUnit chosen = ZtUnitSettings::getInstance()->chosenUnit(kind);
    if (!chosen.isEmpty())
        return chosen;
    const double spread = numbers.count() > 1 ? numbers.standardDeviation() : 0.0;
    return ZtMeasureFormat::readableUnit(qMax(std::abs(numbers.mean()), spread), kind);
}

QString unitTextOf(const KvDeskSelectionStatistics::Group &group)
{
    if (group.kind == ZtGsManipulator::NoKind)
        return group.unit;
    // The host writes the unit behind every number of such a kind.
    const QString zero = ZtMeasureFormat::drawnText(0.0, group.kind);
    return zero.mid(zero.indexOf(QLatin1Char(' ')) + 1);
}

QString inUnit(double value, const KvDeskSelectionStatistics::Group &group, const ZtUnit &unit, int digits)
{
    const auto number = [digits](double shown) {
        return digits > 0 ? ZtMeasureFormat::significant(shown, digits) : ZtMeasureFormat::shortened(shown);
    };
    // A mean of counts may lie between two of them, a count does not.
    if (group.kind == ZtGsManipulator::Count && value == std::floor(value))
        return ZtMeasureFormat::drawnText(value, group.kind);
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

QVector<KvDeskSelectionStatistics::Group> KvDeskSelectionStatistics::sums() const
{
    QVector<Group> sums;
    for (const Group &group : m_groups) {
        const auto isOneSum = [this, &group](const Group &sum) {
            return isAlike(sum, group) && (!isMixed() || sum.valueName == group.valueName);
        };
        const auto sum = std::find_if(sums.begin(), sums.end(), isOneSum);
        if (sum == sums.end())
            sums.append(group);
        else
            sum->numbers.add(group.numbers);
    }
    return sums;
}

KvDeskRunningStatistics KvDeskSelectionStatistics::numbers() const
{
    return m_groups.isEmpty() ? KvDeskRunningStatistics() : sums().first().numbers;
}

QString KvDeskSelectionStatistics::line(const Group &sum) const
{
    const KvDeskRunningStatistics &all = sum.numbers;
    if (all.count() == 0)
        return QString();
    const ZtUnit unit = unitOf(all, sum.kind);
    const auto format = [&sum, &unit](double value) {
        return ZtLeftToRight::isolated(
            inUnit(value, sum, unit, ZtUnitSettings::getInstance()->significantDigits()));
    };
    const QString name = isMixed() ? sum.valueName + QStringLiteral(": ") : QString();
    if (all.count() == 1)
        return name + format(all.mean());
    //: number of values, their mean, standard deviation, smallest and largest one
    return name + tr("n = %1, mean %2, SD %3, min %4, max %5")
                      .arg(QString::number(all.count()), format(all.mean()), format(all.standardDeviation()),
                           format(all.minimum()), format(all.maximum()));
}

QString KvDeskSelectionStatistics::countText() const
{
    return tr("Selected values: %1").arg(count());
}

QString KvDeskSelectionStatistics::text() const
{
    if (m_groups.isEmpty())
        return QString();
    const QString first = line(sums().first());
    // Otherwise the figures of the first name would seem to be those of everything.
    return isMixed() && !first.isEmpty() ? countText() + QStringLiteral("; ") + first : first;
}

QString KvDeskSelectionStatistics::details() const
{
    if (m_groups.isEmpty() || numbers().count() == 0)
        return QString();
    const QStringList figures = isMixed() ? lines() : preciseFigures();
    return (QStringList(countText()) + figures).join(QLatin1Char('\n'));
}

QStringList KvDeskSelectionStatistics::lines() const
{
    QStringList lines;
    for (const Group &sum : sums()) {
        const QString text = line(sum);
        if (!text.isEmpty())
            lines.append(text);
    }
    return lines;
}

QStringList KvDeskSelectionStatistics::preciseFigures() const
{
    const KvDeskRunningStatistics all = numbers();
    const ZtUnit unit = unitOf(all, m_groups.first().kind);
    const auto precise = [this, &unit](double value) {
        return ZtLeftToRight::isolated(inUnit(value, m_groups.first(), unit, preciseDigits));
    };
    QStringList lines{tr("Mean: %1").arg(precise(all.mean()))};
    if (all.count() > 1)
        lines.append(tr("Standard deviation: %1").arg(precise(all.standardDeviation())));
    lines.append(tr("Smallest: %1").arg(precise(all.minimum())));
    lines.append(tr("Largest: %1").arg(precise(all.maximum())));
    return lines;
}
