// SPDX-License-Identifier: MIT
#include "data/KvStatisticsEngine.h"

#include "data/KvReportKernelData.h"

#include <algorithm>
#include <climits>
#include <cmath>

namespace {

const KvValueGroup &emptyGroup()
{
    static const KvValueGroup group;
    return group;
}

// Records come object by object, so value names repeat in a short cycle: remembering the last groups in their
// order finds nearly every group with one comparison instead of a search in the map.
class GroupFinder
{
public:
    explicit GroupFinder(QMap<QString, KvValueGroup> *groups)
        : m_groups(groups)
    {}

    KvValueGroup &find(const QString &name)
    {
        if (m_next < m_recent.size() && m_recent.at(m_next).first == name)
            return take(m_next);
        for (int i = 0; i < m_recent.size(); ++i) {
            if (m_recent.at(i).first == name)
                return take(i);
        }
        // Map nodes stay where they are when others are inserted.
        KvValueGroup *group = &(*m_groups)[name];
        if (m_recent.size() == kRecentLimit)
            m_recent.clear();
        m_recent.append({name, group});
        m_next = 0;
        return *group;
    }

private:
    static constexpr int kRecentLimit = 16;

    KvValueGroup &take(int index)
    {
        m_next = index + 1 < m_recent.size() ? index + 1 : 0;
        return *m_recent.at(index).second;
    }

    QMap<QString, KvValueGroup> *m_groups;
    QVector<QPair<QString, KvValueGroup *>> m_recent;
    int m_next = 0;
};

int truncatedIndex(int index, int count)
{
    return std::min(index, count - 1);
}

// n / 4 + 1 serves every count but four, where it would yield the third value, the median: kept on purpose as
// an exception, so that 1, 2, 3, 4 has the lower quartile 2.
int lowerQuartileIndex(int count)
{
    return count == 4 ? 1 : truncatedIndex(count / 4 + 1, count);
}

// QVariant's own ordering, which keeps whole numbers whole and compares texts as texts. It is marked as
// deprecated for not being total; a range needs no total order, and there is no public replacement.
QT_WARNING_PUSH
QT_WARNING_DISABLE_DEPRECATED
bool isLess(const QVariant &a, const QVariant &b)
{
    return a < b;
}

bool isGreater(const QVariant &a, const QVariant &b)
{
    return a > b;
}
QT_WARNING_POP

// Number of digits before the decimal point, from the logarithm; very small for 0 and negative values.
int decade(double value)
{
    return static_cast<int>(std::floor(std::log10(value))) + 1;
}

} // namespace

KvStatisticsEngine &KvStatisticsEngine::instance()
{
    static KvStatisticsEngine engine;
    return engine;
}

void KvStatisticsEngine::setKernelData(KvReportKernelData *kernelData)
{
    if (m_kernelData)
        disconnect(m_kernelData, nullptr, this, nullptr);
    m_kernelData = kernelData;
    if (m_kernelData)
        connect(m_kernelData, SIGNAL(signalMeasuredValuesChanged()), this,
                                     SLOT(slotMeasurementsListUpdated()));
}

KvReportKernelData *KvStatisticsEngine::kernelData() const
{
    return m_kernelData;
}

const KvValueGroup &KvStatisticsEngine::values(const QString &valueName) const
{
    const auto it = m_byValueName.constFind(valueName);
    return it == m_byValueName.constEnd() ? emptyGroup() : it.value();
}

QStringList KvStatisticsEngine::valueNames(const QString &objectTypeName) const
{
    return m_byObjectType.value(objectTypeName).keys();
}

const KvValueGroup &KvStatisticsEngine::values(const QString &objectTypeName, const QString &valueName) const
{
    const auto type = m_byObjectType.constFind(objectTypeName);
    if (type == m_byObjectType.constEnd())
        return emptyGroup();
    const auto it = type.value().constFind(valueName);
    return it == type.value().constEnd() ? emptyGroup() : it.value();
}

void KvStatisticsEngine::slotMeasurementsListUpdated()
{
    emit signalMeasurementsListUpdating();
    m_byObjectType.clear();
    m_byValueName.clear();
    const QVector<KvMeasuredValue> records =
        m_kernelData ? m_kernelData->measuredValues() : QVector<KvMeasuredValue>();
    GroupFinder byName(&m_byValueName);
    GroupFinder byNameOfType(nullptr);
    const QString *currentType = nullptr;
    for (const KvMeasuredValue &record : records) {
        if (!currentType || *currentType != record.objectTypeName) {
            currentType = &record.objectTypeName;
            byNameOfType = GroupFinder(&m_byObjectType[record.objectTypeName]);
        }
        byNameOfType.find(record.valueName).append(record);
        byName.find(record.valueName).append(record);
    }
    emit signalMeasurementsListUpdated();
}

double KvStatisticsEngine::numericValue(const QVariant &value)
{
    // By type, not by convertibility: QVariant would turn the text "12.5" into 12.5.
    switch (value.userType()) {
    case QMetaType::Double:
    case QMetaType::Float:
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Long:
    case QMetaType::ULong:
    case QMetaType::Short:
    case QMetaType::UShort:
        return value.toDouble();
    default:
        return 0.0;
    }
}

double KvStatisticsEngine::average(const KvValueGroup &group)
{
    const double count = group.size();
    double sum = 0.0;
    for (const KvMeasuredValue &record : group)
        sum += numericValue(record.value) / count;
    return sum;
}

double KvStatisticsEngine::sigma(double mean, const KvValueGroup &group)
{
    const double count = group.size();
    double sum = 0.0;
    for (const KvMeasuredValue &record : group) {
        const double deviation = numericValue(record.value) - mean;
        sum += deviation * deviation / count;
    }
    return std::sqrt(sum);
}

bool KvStatisticsEngine::fiveNumbers(const KvValueGroup &group, double &min, double &q1, double &median,
                                     double &q3, double &max)
{
    if (group.isEmpty())
        return false;
    QVector<double> sorted;
    sorted.reserve(group.size());
    for (const KvMeasuredValue &record : group)
        sorted.append(numericValue(record.value));
    // NaN has no place in "<"; in front of everything the order stays a strict weak one.
    std::sort(sorted.begin(), sorted.end(),
              [](double a, double b) { return std::isnan(a) ? !std::isnan(b) : a < b; });

    const int count = sorted.size();
    min = sorted.first();
    q1 = sorted.at(lowerQuartileIndex(count));
    // For an even count the upper of the two middle values, not their mean: deliberate.
    median = sorted.at(truncatedIndex(count / 2, count));
    q3 = sorted.at(truncatedIndex(static_cast<int>(3LL * count / 4) + 1, count));
    max = sorted.last();
    return true;
}

QPair<QVariant, QVariant> KvStatisticsEngine::range(const KvValueGroup &group)
{
    if (group.isEmpty())
        return {};
    QVariant min = group.first().value;
    QVariant max = min;
    for (const KvMeasuredValue &record : group) {
        if (isLess(record.value, min))
            min = record.value;
        if (isGreater(record.value, max))
            max = record.value;
    }
    return {min, max};
}

QPair<double, double> KvStatisticsEngine::regression(const QVector<QPointF> &points)
{
    if (points.size() < 2)
        return {0.0, 0.0};
    double meanX = 0.0;
    double meanY = 0.0;
    for (const QPointF &point : points) {
        meanX += point.x();
        meanY += point.y();
    }
    meanX /= points.size();
    meanY /= points.size();

    double products = 0.0;
    double squares = 0.0;
    for (const QPointF &point : points) {
        products += (point.x() - meanX) * (point.y() - meanY);
        squares += (point.x() - meanX) * (point.x() - meanX);
    }
    const double slope = products / squares;
    return {slope, meanY - slope * meanX};
}

int KvStatisticsEngine::niceStep(double low, double high)
{
    // The logarithm of zero or less would start the search at the smallest integer.
    if (!(low > 0.0) || !std::isfinite(low) || !std::isfinite(high) || high < low)
        return 0;
    for (int k = decade(low); k <= decade(high); ++k) {
        // The integer part: below the first decade it is 0, so nothing below 1 is ever a step.
        const double base = k == 1 ? 0.1 : std::trunc(std::pow(10.0, k - 2));
        const double factors[] = {10.0, k == 1 ? 20.0 : 25.0, 50.0};
        for (const double factor : factors) {
            const double candidate = base * factor;
            if (candidate >= low && candidate <= high && candidate <= INT_MAX)
                return static_cast<int>(candidate);
        }
    }
    return 0;
}
